#include "protocol/Dispatcher.h"

#include <Pegasus/Common/CIMStatusCode.h>
#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include "protocol/ClassAnswer.h"
#include "text/CimText.h"
#include "text/Utf8.h"
#include "utf8/Utf8.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstClass;
using Pegasus::CIMName;
using Pegasus::CIMPropertyList;
using Pegasus::CimRequest;
using Pegasus::ObjectXmlOptions;
using Pegasus::Uint32;

[[noreturn]] void fail(Pegasus::CIMStatusCode code, const std::string& description) {
    throw Pegasus::CIMException(code, cimString(utf8::clean(description)));
}

CIMName requiredClassName(const CimRequest& request) {
    CIMName name = request.className("ClassName");
    if (name.isNull())
        fail(Pegasus::CIM_ERR_INVALID_PARAMETER,
             fmt::format("{} needs the parameter ClassName", request.method));
    return name;
}

bool isWanted(const CIMPropertyList& list, const CIMName& name) {
    if (list.isNull())
        return true;
    for (Uint32 i = 0; i < list.size(); ++i) {
        if (list[i].equal(name))
            return true;
    }
    return false;
}

/// The properties of `cimClass` that `list` names. What subclasses add is not among them.
CIMPropertyList restrictedTo(const CIMConstClass& cimClass, const CIMPropertyList& list) {
    Pegasus::Array<CIMName> names;
    for (Uint32 i = 0; i < cimClass.getPropertyCount(); ++i) {
        const CIMName& name = cimClass.getProperty(i).getName();
        if (isWanted(list, name))
            names.append(name);
    }
    return CIMPropertyList(names);
}

std::string quoted(const CIMName& className, const CimRequest& request) {
    return fmt::format("{} in {}", utf8Of(className.getString()),
                       utf8Of(request.nameSpace.getString()));
}

}  // namespace

std::unique_ptr<Answer> Dispatcher::dispatch(const CimRequest& request) const {
    const bool isGetClass = equalsIgnoringCase(request.method, "GetClass");
    if (!isGetClass && !equalsIgnoringCase(request.method, "EnumerateInstances"))
        fail(Pegasus::CIM_ERR_NOT_SUPPORTED,
             fmt::format("the operation {} is not supported", request.method));
    if (!repository.hasNamespace(request.nameSpace))
        fail(Pegasus::CIM_ERR_INVALID_NAMESPACE,
             fmt::format("there is no namespace {}", utf8Of(request.nameSpace.getString())));
    return isGetClass ? getClass(request) : enumerateInstances(request);
}

std::unique_ptr<Answer> Dispatcher::getClass(const CimRequest& request) const {
    request.requireOnly(
        {"ClassName", "LocalOnly", "IncludeQualifiers", "IncludeClassOrigin", "PropertyList"});
    const CIMName name = requiredClassName(request);
    ObjectXmlOptions options;
    options.localOnly = request.flag("LocalOnly", true);
    options.includeQualifiers = request.flag("IncludeQualifiers", true);
    options.includeClassOrigin = request.flag("IncludeClassOrigin", false);
    options.propertyList = request.propertyList("PropertyList");
    const CIMConstClass* cimClass = repository.findClass(request.nameSpace, name);
    if (cimClass == nullptr)
        fail(Pegasus::CIM_ERR_NOT_FOUND,
             fmt::format("there is no class {}", quoted(name, request)));
    return std::make_unique<ClassAnswer>(*cimClass, options);
}

std::unique_ptr<Answer> Dispatcher::enumerateInstances(const CimRequest& request) const {
    request.requireOnly({"ClassName", "LocalOnly", "DeepInheritance", "IncludeQualifiers",
                         "IncludeClassOrigin", "PropertyList"});
    const CIMName name = requiredClassName(request);
    ObjectXmlOptions options;
    options.localOnly = request.flag("LocalOnly", true);
    // Clients take qualifiers from the class; on every instance they would only swell the answer.
    static_cast<void>(request.flag("IncludeQualifiers", false));
    options.includeQualifiers = false;
    options.includeClassOrigin = request.flag("IncludeClassOrigin", false);
    options.propertyList = request.propertyList("PropertyList");
    const bool deep = request.flag("DeepInheritance", true);
    const CIMConstClass* cimClass = repository.findClass(request.nameSpace, name);
    if (cimClass == nullptr)
        fail(Pegasus::CIM_ERR_INVALID_CLASS,
             fmt::format("there is no class {}", quoted(name, request)));
    if (!deep)
        options.propertyList = restrictedTo(*cimClass, options.propertyList);
    return std::make_unique<InstancesAnswer>(request.nameSpace,
                                             providedClasses(request.nameSpace, name), options);
}

std::vector<ProvidedClass> Dispatcher::providedClasses(const Pegasus::CIMNamespaceName& nameSpace,
                                                       const CIMName& className) const {
    std::vector<ProvidedClass> out;
    for (const CIMName& name : repository.withDescendants(nameSpace, className)) {
        for (const auto& provider : providers) {
            if (name.equal(CIMName(provider->className())))
                out.push_back({provider.get(), *repository.findClass(nameSpace, name)});
        }
    }
    return out;
}

}  // namespace cimomd
