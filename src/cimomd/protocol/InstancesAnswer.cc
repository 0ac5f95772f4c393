#include "protocol/InstancesAnswer.h"

#include <Pegasus/Common/CIMStatusCode.h>
#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include <utility>

#include "text/CimText.h"
#include "utf8/Utf8.h"

namespace cimomd {
namespace {

using Pegasus::CIMConstClass;
using Pegasus::CIMConstProperty;
using Pegasus::CIMInstance;
using Pegasus::CIMName;
using Pegasus::CIMProperty;
using Pegasus::Uint32;

bool isKey(const CIMConstProperty& property) {
    const Uint32 index = property.findQualifier("Key");
    Pegasus::Boolean key = false;
    if (index != Pegasus::PEG_NOT_FOUND)
        property.getQualifier(index).getValue().get(key);
    return key;
}

std::vector<CIMName> keysOf(const CIMConstClass& cimClass) {
    std::vector<CIMName> keys;
    for (Uint32 i = 0; i < cimClass.getPropertyCount(); ++i) {
        if (isKey(cimClass.getProperty(i)))
            keys.push_back(cimClass.getProperty(i).getName());
    }
    return keys;
}

[[noreturn]] void fail(const ProvidedClass& source, const std::string& reason) {
    throw Pegasus::CIMException(
        Pegasus::CIM_ERR_FAILED,
        cimString(utf8::clean(fmt::format("{}: {}", source.provider->className(), reason))));
}

}  // namespace

InstancesAnswer::InstancesAnswer(Pegasus::CIMNamespaceName instanceNamespace,
                                 std::vector<ProvidedClass> providedClasses,
                                 Pegasus::ObjectXmlOptions xmlOptions)
    : nameSpace(std::move(instanceNamespace)),
      sources(std::move(providedClasses)),
      options(std::move(xmlOptions)) {}

bool InstancesAnswer::next(std::string& xml) {
    CIMInstance instance;
    while (stream == nullptr || !nextInstance(instance)) {
        if (!openNextProvider())
            return false;
    }
    complete(instance);
    Pegasus::appendNamedInstance(xml, instance, options);
    return true;
}

bool InstancesAnswer::openNextProvider() {
    stream.reset();
    if (position == sources.size())
        return false;
    ++position;
    keys = keysOf(current().cimClass);
    try {
        stream = current().provider->enumerate();
    } catch (const std::exception& error) {
        fail(current(), error.what());
    } catch (const Pegasus::Exception& error) {
        fail(current(), utf8Of(error.getMessage()));
    }
    return true;
}

bool InstancesAnswer::nextInstance(CIMInstance& instance) {
    try {
        ProvidedInstance provided;
        if (!stream->next(provided))
            return false;
        instance = std::move(provided.instance);
        return true;
    } catch (const std::exception& error) {
        fail(current(), error.what());
    } catch (const Pegasus::Exception& error) {
        fail(current(), utf8Of(error.getMessage()));
    }
}

void InstancesAnswer::complete(CIMInstance& instance) const {
    const CIMConstClass& cimClass = current().cimClass;
    for (Uint32 i = 0; i < instance.getPropertyCount(); ++i) {
        CIMProperty property = instance.getProperty(i);
        const Uint32 index = cimClass.findProperty(property.getName());
        if (index == Pegasus::PEG_NOT_FOUND)
            fail(current(), fmt::format("the class has no property {}",
                                        utf8Of(property.getName().getString())));
        const CIMConstProperty declared = cimClass.getProperty(index);
        property.setClassOrigin(declared.getClassOrigin());
        property.setPropagated(declared.getPropagated());
    }
    instance.setPath(pathOf(instance));
}

Pegasus::CIMObjectPath InstancesAnswer::pathOf(const CIMInstance& instance) const {
    Pegasus::Array<Pegasus::CIMKeyBinding> bindings;
    for (const CIMName& key : keys) {
        const Uint32 index = instance.findProperty(key);
        if (index == Pegasus::PEG_NOT_FOUND || instance.getProperty(index).getValue().isNull())
            fail(current(), fmt::format("an instance lacks the key {}", utf8Of(key.getString())));
        bindings.append(Pegasus::CIMKeyBinding(key, instance.getProperty(index).getValue()));
    }
    return Pegasus::CIMObjectPath(Pegasus::String(), nameSpace, instance.getClassName(), bindings);
}

}  // namespace cimomd
