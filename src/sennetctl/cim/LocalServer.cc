#include "cim/LocalServer.h"

#include <algorithm>

#include "cim/CimText.h"
#include "report/WholeFile.h"

namespace sennetctl {

using namespace Pegasus;

/// Calls the operation; what keeps the server from answering is CannotRun.
template <typename Operation>
auto LocalServer::asked(Operation operation) {
    try {
        return operation();
    } catch (const CIMException&) {
        throw;
    } catch (const ConnectionTimeoutException&) {
        throw CannotRun("the CIM server is connected, but does not answer within " +
                        std::to_string(timeoutMilliseconds / 1000) + " s");
    } catch (const Exception& failure) {
        throw CannotRun("the CIM server: " + reasonOf(failure));
    }
}

LocalServer::LocalServer(Uint32 theTimeoutMilliseconds) {
    setTimeout(theTimeoutMilliseconds);
    try {
        client.connectLocal();
    } catch (const Exception& failure) {
        throw CannotRun(reasonOf(failure) + " (sennetctl server tells each place that is tried)");
    }
}

void LocalServer::setTimeout(Uint32 milliseconds) {
    timeoutMilliseconds = milliseconds;
    client.setTimeout(milliseconds);
}

void LocalServer::requireAnswer() {
    try {
        getClass("root/cimv2", "CIM_ManagedElement");
    } catch (const CIMException&) {
        // A refusal is an answer.
    }
}

CIMClass LocalServer::getClass(const std::string& nameSpace, const std::string& className) {
    const CIMNamespaceName place = namespaceFrom(nameSpace);
    const CIMName name = nameFrom(className);
    return asked([&] { return client.getClass(place, name, false, true, true); });
}

std::vector<CIMInstance> LocalServer::instances(const std::string& nameSpace,
                                                const std::string& className) {
    const CIMNamespaceName place = namespaceFrom(nameSpace);
    const CIMName name = nameFrom(className);
    const Array<CIMInstance> found =
        asked([&] { return client.enumerateInstances(place, name, true, false); });
    return {found.getData(), found.getData() + found.size()};
}

std::vector<std::string> LocalServer::classNames(const std::string& nameSpace) {
    const CIMNamespaceName place = namespaceFrom(nameSpace);
    const Array<CIMName> found =
        asked([&] { return client.enumerateClassNames(place, CIMName(), true); });
    std::vector<std::string> names;
    for (Uint32 i = 0; i < found.size(); ++i) {
        names.push_back(textOf(found[i]));
    }
    std::sort(names.begin(), names.end());
    return names;
}

CIMName nameFrom(const std::string& text) {
    try {
        return CIMName(String(text.c_str()));
    } catch (const Exception&) {
        throw CannotRun("'" + text + "' is no CIM name");
    }
}

CIMNamespaceName namespaceFrom(const std::string& text) {
    try {
        return CIMNamespaceName(String(text.c_str()));
    } catch (const Exception&) {
        throw CannotRun("'" + text + "' is no name of a namespace");
    }
}

}  // namespace sennetctl
