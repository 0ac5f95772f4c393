#include "protocol/InstanceCursor.h"

#include <Pegasus/Common/CIMStatusCode.h>
#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include <utility>

#include "protocol/KeyProperties.h"
#include "protocol/RequestChecks.h"
#include "text/CimText.h"

namespace cimomd {

using Pegasus::CIMConstInstance;
using Pegasus::CIMInstance;
using Pegasus::CIMName;
using Pegasus::Uint32;

InstanceCursor::InstanceCursor(Model servedModel, Pegasus::CIMNamespaceName instanceNamespace,
                               std::vector<CIMName> classNames)
    : model(std::move(servedModel)),
      nameSpace(std::move(instanceNamespace)),
      classes(std::move(classNames)) {}

bool InstanceCursor::next(CIMConstInstance& instance) {
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
    origins.emplace(cimClass);
    try {
        stream = provider.enumerate();
    } catch (const std::exception& error) {
        fail(error.what());
    } catch (const Pegasus::Exception& error) {
        fail(utf8Of(error.getMessage()));
    }
}

bool InstanceCursor::nextOfClass(CIMConstInstance& instance) {
    if (declaredPosition < declared->size()) {
        instance = (*declared)[declaredPosition++];
        return true;
    }
    CIMInstance provided;
    if (stream == nullptr || !nextProvided(provided))
        return false;
    provided.setPath(pathOf(provided));
    instance = provided;
    return true;
}

bool InstanceCursor::nextProvided(CIMInstance& instance) {
    try {
        ProvidedInstance provided;
        if (!stream->next(provided))
            return false;
        instance = provided.instance;
        origins->set(instance);
        return true;
    } catch (const std::exception& error) {
        fail(error.what());
    } catch (const Pegasus::Exception& error) {
        fail(utf8Of(error.getMessage()));
    }
}

Pegasus::CIMObjectPath InstanceCursor::pathOf(const CIMConstInstance& instance) const {
    Pegasus::Array<Pegasus::CIMKeyBinding> bindings;
    for (const CIMName& key : keys) {
        const Uint32 index = instance.findProperty(key);
        const Pegasus::CIMValue value = index == Pegasus::PEG_NOT_FOUND
                                            ? Pegasus::CIMValue()
                                            : instance.getProperty(index).getValue();
        if (value.isNull())
            fail(fmt::format("an instance lacks the key {}", utf8Of(key.getString())));
        bindings.append(Pegasus::CIMKeyBinding(key, value));
    }
    return Pegasus::CIMObjectPath(Pegasus::String(), nameSpace, instance.getClassName(), bindings);
}

void InstanceCursor::fail(const std::string& reason) const {
    failOperation(Pegasus::CIM_ERR_FAILED,
                  fmt::format("{}: {}", utf8Of(cimClass.getClassName().getString()), reason));
}

}  // namespace cimomd
