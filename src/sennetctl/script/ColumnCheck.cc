#include "script/ColumnCheck.h"

#include <cstdlib>

#include "SennetConverter/framework/CimConverter.h"
#include "SennetConverter/framework/PropertyLookup.h"
#include "cim/CimText.h"
#include "report/Text.h"

namespace sennetctl {

using namespace Pegasus;

namespace {

constexpr std::size_t kLongestText = 255;
constexpr std::size_t kLongestOther = 32;

bool hasQualifier(const Column& column, const char* name) {
    return column.declared && column.declared->findQualifier(CIMName(name)) != PEG_NOT_FOUND;
}

/// What the resource properties give; null for nothing.
const char* givenSize(const Column& column, const AnsweredClass& answered,
                      const Velm::Properties& texts) {
    const std::string key =
        textOf(answered.definition.getClassName()) + "." + textOf(column.name) + ".Size";
    return texts.getPropertyValue(key.c_str());
}

/// The size that the resource properties give, else the class; 0 for none.
std::size_t declaredSize(const Column& column, const AnsweredClass& answered,
                         const Velm::Properties& texts) {
    if (const char* size = givenSize(column, answered, texts)) {
        return std::strtoul(size, nullptr, 10);
    }
    if (!hasQualifier(column, "MaxLen")) {
        return 0;
    }
    const Uint32 position = column.declared->findQualifier(CIMName("MaxLen"));
    const std::string text =
        textOf(CIMProperty(*column.declared).getQualifier(position).getValue().toString());
    return std::strtoul(text.c_str(), nullptr, 10);
}

/// Whether the product reads the number that the server gave.
bool survives(const CIMValue& value) {
    if (value.getType() == CIMTYPE_UINT64) {
        Uint64 number = 0;
        value.get(number);
        return number <= 0x7FFFFFFF;
    }
    if (value.getType() == CIMTYPE_UINT32) {
        Uint32 number = 0;
        value.get(number);
        return number <= 0x7FFFFFFF;
    }
    if (value.getType() == CIMTYPE_SINT64) {
        Sint64 number = 0;
        value.get(number);
        return number >= -0x80000000LL && number <= 0x7FFFFFFF;
    }
    return true;
}

/// How many values are lost in which way.
struct Losses {
    std::size_t cut = 0;
    std::size_t wide = 0;
    std::size_t longerThanColumn = 0;
};

void countLosses(const CIMValue& value, bool hasNames, std::size_t size, Losses& losses) {
    if (value.isNull()) {
        return;
    }
    if (CimConverter::isInteger(value.getType())) {
        losses.wide += !value.isArray() && !hasNames && !survives(value) ? 1 : 0;
        return;
    }
    if (value.getType() == CIMTYPE_DATETIME) {
        return;
    }
    const std::size_t length = value.toString().size();
    const bool isText = value.isArray() || value.getType() == CIMTYPE_STRING;
    losses.cut += length > (isText ? kLongestText : kLongestOther) ? 1 : 0;
    losses.longerThanColumn += isText && !value.isArray() && size > 0 && length > size ? 1 : 0;
}

}  // namespace

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

std::vector<std::string> lossesIn(const Column& column, const AnsweredClass& answered,
                                  const Velm::Properties& texts) {
    CIMClass definition = answered.definition;
    const PropertyLookup lookup(definition, column.name);
    const std::size_t size = declaredSize(column, answered, texts);
    Losses losses;
    for (const CIMInstance& instance : answered.instances) {
        countLosses(lookup.in(&instance).value, hasQualifier(column, "Values"), size, losses);
    }
    const std::string name = textOf(column.name);
    std::vector<std::string> sentences;
    if (losses.cut > 0) {
        sentences.push_back(counted(losses.cut, "value") + " of " + name +
                            " cut, for texts end at "
                            "255 characters, and other values at 32");
    }
    if (losses.longerThanColumn > 0) {
        sentences.push_back(counted(losses.longerThanColumn, "value") + " of " + name +
                            " longer than the column of " + std::to_string(size));
    }
    if (losses.wide > 0) {
        sentences.push_back(counted(losses.wide, "value") + " of " + name +
                            " beyond 32 bits with sign: another number is written");
    }
    return sentences;
}

bool lacksSize(const Column& column, const AnsweredClass& answered, const Velm::Properties& texts) {
    if (!column.declared || column.declared->isArray() || givenSize(column, answered, texts)) {
        return false;
    }
    const CIMType type = column.declared->getType();
    const bool isText =
        type == CIMTYPE_STRING || (CimConverter::isInteger(type) && hasQualifier(column, "Values"));
    // What the class says about the length of a number's name is about the number.
    const std::size_t size = declaredSize(column, answered, texts);
    return isText && size == 0;
}

}  // namespace sennetctl
