#include "protocol/InstanceKeys.h"

#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include <algorithm>

#include "protocol/KeyProperties.h"
#include "protocol/RequestChecks.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMKeyBinding;
using Pegasus::CIMName;

CIMKeyBinding::Type kindOf(Pegasus::CIMType type) {
    switch (type) {
        case Pegasus::CIMTYPE_BOOLEAN:
            return CIMKeyBinding::BOOLEAN;
        case Pegasus::CIMTYPE_CHAR16:
        case Pegasus::CIMTYPE_STRING:
        case Pegasus::CIMTYPE_DATETIME:
            return CIMKeyBinding::STRING;
        case Pegasus::CIMTYPE_REFERENCE:
            return CIMKeyBinding::REFERENCE;
        default:
            return CIMKeyBinding::NUMERIC;
    }
}

const char* textOf(CIMKeyBinding::Type kind) {
    switch (kind) {
        case CIMKeyBinding::BOOLEAN:
            return "a boolean";
        case CIMKeyBinding::NUMERIC:
            return "a number";
        case CIMKeyBinding::REFERENCE:
            return "a reference";
        case CIMKeyBinding::STRING:
            break;
    }
    return "a string";
}

[[noreturn]] void fail(const std::string& what) {
    failOperation(Pegasus::CIM_ERR_INVALID_PARAMETER, "parameter InstanceName " + what);
}

void requireAll(const std::vector<CIMName>& required, const std::vector<CIMKeyBinding>& given) {
    for (const CIMName& name : required) {
        const auto isIt = [&name](const CIMKeyBinding& key) { return key.getName().equal(name); };
        if (std::none_of(given.begin(), given.end(), isIt))
            fail("lacks the key " + utf8Of(name.getString()));
    }
}

void requireKnown(const Pegasus::CIMConstClass& cimClass, const std::vector<CIMName>& known,
                  const CIMKeyBinding& key) {
    const CIMName& name = key.getName();
    const auto isIt = [&name](const CIMName& candidate) { return candidate.equal(name); };
    if (std::none_of(known.begin(), known.end(), isIt))
        fail(
            fmt::format("has the key {}, which the class does not have", utf8Of(name.getString())));
    const CIMKeyBinding::Type kind =
        kindOf(cimClass.getProperty(cimClass.findProperty(name)).getType());
    if (kind != key.getType())
        fail(fmt::format("has the key {} as {}; expected {}", utf8Of(name.getString()),
                         textOf(key.getType()), textOf(kind)));
}

}  // namespace

InstanceKeys::InstanceKeys(const Pegasus::CIMConstClass& cimClass,
                           const Pegasus::CIMObjectPath& name,
                           const Pegasus::CIMNamespaceName& pathNamespace)
    : nameSpace(pathNamespace) {
    const std::vector<CIMName> required = keyPropertiesOf(cimClass);
    for (CIMKeyBinding key : name.getKeyBindings()) {
        if (key.getName().isNull() && required.size() == 1)
            key.setName(required.front());
        if (key.getName().isNull())
            fail("has a key without a name");
        requireKnown(cimClass, required, key);
        keys.push_back(absolute(key));
    }
    requireAll(required, keys);
}

bool InstanceKeys::match(const Pegasus::CIMObjectPath& path) const {
    const Pegasus::Array<CIMKeyBinding>& others = path.getKeyBindings();
    if (others.size() != keys.size())
        return false;
    return std::all_of(others.begin(), others.end(), [this](const CIMKeyBinding& other) {
        const CIMKeyBinding whole = absolute(other);
        return std::any_of(keys.begin(), keys.end(),
                           [&whole](const CIMKeyBinding& key) { return key.equal(whole); });
    });
}

/// References name hosts and namespaces or leave them out; all of them lie on this machine.
CIMKeyBinding InstanceKeys::absolute(const CIMKeyBinding& key) const {
    if (key.getType() != CIMKeyBinding::REFERENCE)
        return key;
    try {
        Pegasus::CIMObjectPath path(key.getValue());
        path.setHost(Pegasus::String());
        if (path.getNameSpace().isNull())
            path.setNameSpace(nameSpace);
        return CIMKeyBinding(key.getName(), path.toString(), CIMKeyBinding::REFERENCE);
    } catch (const Pegasus::Exception&) {
        return key;
    }
}

}  // namespace cimomd
