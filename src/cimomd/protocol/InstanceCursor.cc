#include "protocol/InstanceCursor.h"

#include <Pegasus/Common/CIMStatusCode.h>
#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include <utility>

#include "protocol/KeyProperties.h"
#include "protocol/RequestChecks.h"
#include "text/CimText.h"

namespace cimomd {

using Pegasus::CIMConstProperty;
using Pegasus::CIMInstance;
using Pegasus::CIMName;
using Pegasus::CIMProperty;
using Pegasus::Uint32;

InstanceCursor::InstanceCursor(Model servedModel, Pegasus::CIMNamespaceName instanceNamespace,
                               std::vector<CIMName> classNames)
    : model(std::move(servedModel)),
      nameSpace(std::move(instanceNamespace)),
      classes(std::move(classNames)) {}

bool InstanceCursor::next(CIMInstance& instance) {
    while (cimClass.isUninitialized() || !nextOfClass(instance)) {
        if (!openNextClass())
            return false;
    }
    return true;
}

bool InstanceCursor::openNextClass() {
    stream.reset();
    if (position == classes.size())
        return false;
    const CIMName& name = classes[position++];
    cimClass = *model.classes->findClass(nameSpace, name);
    declared = &model.classes->instancesOf(nameSpace, name);
    declaredPosition = 0;
    if (const Provider* provider = model.providers->find(nameSpace, name))
        openProvider(*provider);
    return true;
}

void InstanceCursor::openProvider(const Provider& provider) {
    keys = keyPropertiesOf(cimClass);
    try {
        stream = provider.enumerate();
    } catch (const std::exception& error) {
        fail(error.what());
    } catch (const Pegasus::Exception& error) {
        fail(utf8Of(error.getMessage()));
    }
}

bool InstanceCursor::nextOfClass(CIMInstance& instance) {
    if (declaredPosition < declared->size()) {
        const Pegasus::CIMConstInstance& found = (*declared)[declaredPosition++];
        instance = found.clone();
        setOrigins(instance);
        instance.setPath(found.getPath());
        return true;
    }
    if (stream == nullptr || !nextProvided(instance))
        return false;
    setOrigins(instance);
    instance.setPath(pathOf(instance));
    return true;
}

bool InstanceCursor::nextProvided(CIMInstance& instance) {
    try {
        ProvidedInstance provided;
        if (!stream->next(provided))
            return false;
        instance = provided.instance;
        return true;
    } catch (const std::exception& error) {
        fail(error.what());
    } catch (const Pegasus::Exception& error) {
        fail(utf8Of(error.getMessage()));
    }
}

void InstanceCursor::setOrigins(CIMInstance& instance) const {
    for (Uint32 i = 0; i < instance.getPropertyCount(); ++i) {
        CIMProperty property = instance.getProperty(i);
        const Uint32 index = cimClass.findProperty(property.getName());
        if (index == Pegasus::PEG_NOT_FOUND)
            fail(fmt::format("the class has no property {}",
                             utf8Of(property.getName().getString())));
        const CIMConstProperty inClass = cimClass.getProperty(index);
        property.setClassOrigin(inClass.getClassOrigin());
        property.setPropagated(inClass.getPropagated());
    }
}

Pegasus::CIMObjectPath InstanceCursor::pathOf(const CIMInstance& instance) const {
    Pegasus::Array<Pegasus::CIMKeyBinding> bindings;
    for (const CIMName& key : keys) {
        const Uint32 index = instance.findProperty(key);
        if (index == Pegasus::PEG_NOT_FOUND || instance.getProperty(index).getValue().isNull())
            fail(fmt::format("an instance lacks the key {}", utf8Of(key.getString())));
        bindings.append(Pegasus::CIMKeyBinding(key, instance.getProperty(index).getValue()));
    }
    return Pegasus::CIMObjectPath(Pegasus::String(), nameSpace, instance.getClassName(), bindings);
}

void InstanceCursor::fail(const std::string& reason) const {
    failOperation(Pegasus::CIM_ERR_FAILED,
                  fmt::format("{}: {}", utf8Of(cimClass.getClassName().getString()), reason));
}

}  // namespace cimomd
