#include "script/ColumnCheck.h"

#include <algorithm>
#include <cstdlib>

#include "SennetConverter/framework/CimConverter.h"
#include "SennetConverter/framework/PropertyLookup.h"
#include "cim/CimText.h"

namespace sennetctl {

using namespace Pegasus;

namespace {

/// What the resource properties give; null for nothing.
const char* sizeText(const Column& column, const AnsweredClass& answered,
                     const Velm::Properties& texts) {
    const std::string key =
        textOf(answered.definition.getClassName()) + "." + textOf(column.name) + ".Size";
    return texts.getPropertyValue(key.c_str());
}

}  // namespace

bool hasQualifier(const Column& column, const char* name) {
    return column.declared && column.declared->findQualifier(CIMName(name)) != PEG_NOT_FOUND;
}

std::optional<Column> columnOf(const AnsweredClass& answered, const std::string& property) {
    Column column{CIMName(String(property.c_str())), std::nullopt};
    const Uint32 position = answered.definition.findProperty(column.name);
    if (position != PEG_NOT_FOUND) {
        column.declared = CIMClass(answered.definition).getProperty(position);
        return column;
    }
    for (const CIMInstance& instance : answered.instances) {
        if (instance.findProperty(column.name) != PEG_NOT_FOUND) {
            return column;
        }
    }
    return std::nullopt;
}

bool isEmpty(const Column& column, const AnsweredClass& answered) {
    CIMClass definition = answered.definition;
    const PropertyLookup lookup(definition, column.name);
    for (const CIMInstance& instance : answered.instances) {
        if (!lookup.in(&instance).value.isNull()) {
            return false;
        }
    }
    return true;
}

std::size_t givenSize(const Column& column, const AnsweredClass& answered,
                      const Velm::Properties& texts) {
    const char* size = sizeText(column, answered, texts);
    return size == nullptr ? 0
                           : static_cast<std::size_t>(std::max(std::strtol(size, nullptr, 10), 0L));
}

std::size_t declaredSize(const Column& column, const AnsweredClass& answered,
                         const Velm::Properties& texts) {
    if (sizeText(column, answered, texts) != nullptr) {
        return givenSize(column, answered, texts);
    }
    // For a number the class means the number, not its name.
    if (!hasQualifier(column, "MaxLen") || CimConverter::isInteger(column.declared->getType())) {
        return 0;
    }
    const Uint32 position = column.declared->findQualifier(CIMName("MaxLen"));
    const std::string text =
        textOf(CIMProperty(*column.declared).getQualifier(position).getValue().toString());
    return std::strtoul(text.c_str(), nullptr, 10);
}

bool lacksSize(const Column& column, const AnsweredClass& answered, const Velm::Properties& texts) {
    if (!column.declared || column.declared->isArray() || sizeText(column, answered, texts)) {
        return false;
    }
    const CIMType type = column.declared->getType();
    const bool isText =
        type == CIMTYPE_STRING || (CimConverter::isInteger(type) && hasQualifier(column, "Values"));
    return isText && declaredSize(column, answered, texts) == 0;
}

}  // namespace sennetctl
