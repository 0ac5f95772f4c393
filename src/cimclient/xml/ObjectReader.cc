#include "xml/ObjectReader.h"

#include <Pegasus/Common/Exception.h>

#include <charconv>
#include <string>
#include <system_error>
#include <utility>
#include <vector>

#include "xml/XmlCharacters.h"

namespace Pegasus {

CIMInstance ObjectReader::readNamedInstance() {
    reader.requireChildNamed("INSTANCENAME");
    CIMObjectPath path = paths.readInstanceName();
    reader.requireChildNamed("INSTANCE");
    CIMInstance instance = readInstance();
    instance.setPath(std::move(path));
    reader.readEnd();
    return instance;
}

CIMInstance ObjectReader::readInstance() {
    context.className = &context.requiredName(reader, "CLASSNAME");
    assembly.start(*context.className, context.embeddingLevel == 0);
    while (readKnownProperty() || readMember()) {
    }
    context.className = nullptr;
    return assembly.finish();
}

// Reads a property that looks like one of an earlier instance but for its value; false when none
// comes next.
bool ObjectReader::readKnownProperty() {
    constexpr std::size_t kLookAhead = 4;
    for (std::size_t ahead = 0; ahead < kLookAhead; ++ahead) {
        const KnownProperties::Property* known = assembly.expected(ahead);
        if (known == nullptr) {
            return false;
        }
        const PropertyDeclaration& property = assembly.declaration(*known);
        context.propertyName = &property.name;
        const bool hasValue = known->withValue && reader.readLike(*known->withValue);
        const bool isNull =
            !hasValue && known->withoutValue && reader.readLike(*known->withoutValue);
        if (hasValue) {
            values.packTexts(property.type, property.isArray, assembly.packer());
        }
        context.propertyName = nullptr;
        if (!hasValue && !isNull) {
            continue;
        }
        if (isNull) {
            assembly.packer().beginNull();
        }
        assembly.tookExpected(ahead);
        return true;
    }
    return false;
}

// Reads the next member of the instance; false at its end.
bool ObjectReader::readMember() {
    const std::uint64_t begin = reader.position();
    if (!reader.nextChild()) {
        return false;
    }
    if (isAtProperty()) {
        const CIMProperty property = readAnyProperty();
        addOnce("property", property,
                [&] { assembly.addProperty(property, reader.readSince(begin)); });
    } else if (reader.is("QUALIFIER")) {
        const CIMQualifier qualifier = readQualifier();
        addOnce("qualifier", qualifier, [&] { assembly.addQualifier(qualifier); });
    } else {
        reader.failUnexpected("QUALIFIER, PROPERTY, PROPERTY.ARRAY or PROPERTY.REFERENCE");
    }
    return true;
}

CIMClass ObjectReader::readClass() {
    context.className = &context.requiredName(reader, "NAME");
    CIMClass cimClass(*context.className, context.optionalName(reader, "SUPERCLASS"));
    while (reader.nextChild()) {
        if (isAtProperty()) {
            const CIMProperty property = readAnyProperty();
            addOnce("property", property, [&] { cimClass.addProperty(property); });
        } else if (reader.is("QUALIFIER")) {
            const CIMQualifier qualifier = readQualifier();
            addOnce("qualifier", qualifier, [&] { cimClass.addQualifier(qualifier); });
        } else if (reader.is("METHOD")) {
            skipMethod();
        } else {
            reader.failUnexpected(
                "QUALIFIER, PROPERTY, PROPERTY.ARRAY, PROPERTY.REFERENCE or METHOD");
        }
    }
    context.className = nullptr;
    return cimClass;
}

bool ObjectReader::isAtProperty() const {
    return reader.name().starts_with("PROPERTY") &&
           (reader.is("PROPERTY") || reader.is("PROPERTY.ARRAY") ||
            reader.is("PROPERTY.REFERENCE") || reader.is("PROPERTY.REFARRAY"));
}

CIMProperty ObjectReader::readAnyProperty() {
    if (reader.is("PROPERTY")) {
        return readProperty();
    }
    if (reader.is("PROPERTY.ARRAY")) {
        return readPropertyArray();
    }
    return reader.is("PROPERTY.REFERENCE") ? readPropertyReference() : readPropertyReferenceArray();
}

template <typename Item, typename Add>
void ObjectReader::addOnce(const char* kind, const Item& item, Add add) const {
    try {
        add();
    } catch (const AlreadyExistsException&) {
        const CString utf8 = item.getName().getString().getCString();
        reader.fail(std::string(kind) + " " + quotedForMessage(static_cast<const char*>(utf8)) +
                    " is given twice");
    }
}

CIMProperty ObjectReader::readProperty() {
    context.propertyName = &context.requiredName(reader, "NAME");
    return readPropertyBody(CIMValue(values.readType(), false), "VALUE");
}

CIMProperty ObjectReader::readPropertyArray() {
    context.propertyName = &context.requiredName(reader, "NAME");
    return readPropertyBody(CIMValue(values.readType(), true, readArraySize()), "VALUE.ARRAY");
}

CIMProperty ObjectReader::readPropertyReference() {
    context.propertyName = &context.requiredName(reader, "NAME");
    return readPropertyBody(CIMValue(CIMTYPE_REFERENCE, false), "VALUE.REFERENCE");
}

CIMProperty ObjectReader::readPropertyReferenceArray() {
    context.propertyName = &context.requiredName(reader, "NAME");
    return readPropertyBody(CIMValue(CIMTYPE_REFERENCE, true, readArraySize()), "VALUE.REFARRAY");
}

// The rest of any kind of property. `value` is the null of its type, and stays so without an
// element that gives one.
CIMProperty ObjectReader::readPropertyBody(CIMValue value, std::string_view valueElement) {
    const Uint32 arraySize = value.isArray() ? readArraySize() : 0;
    const CIMName referenceClass = context.optionalName(reader, "REFERENCECLASS");
    const CIMName classOrigin = context.optionalName(reader, "CLASSORIGIN");
    const Boolean propagated = reader.booleanAttribute("PROPAGATED", false);
    std::vector<CIMQualifier> qualifiers;
    while (reader.nextChild()) {
        if (reader.is(valueElement) && value.isNull()) {
            value = value.isArray() ? values.readArray(value.getType())
                                    : values.readScalar(value.getType());
        } else if (reader.is("QUALIFIER")) {
            qualifiers.push_back(readQualifier());
        } else {
            reader.failUnexpected("QUALIFIER or one " + std::string(valueElement));
        }
    }
    CIMProperty property(*context.propertyName, std::move(value), arraySize, referenceClass,
                         classOrigin, propagated);
    for (const CIMQualifier& qualifier : qualifiers) {
        addOnce("qualifier", qualifier, [&] { property.addQualifier(qualifier); });
    }
    context.propertyName = nullptr;
    return property;
}

Uint32 ObjectReader::readArraySize() const {
    const std::string_view text = reader.attribute("ARRAYSIZE").value_or("0");
    const char* end = text.data() + text.size();
    Uint32 size = 0;
    const std::from_chars_result result = std::from_chars(text.data(), end, size);
    if (result.ec != std::errc() || result.ptr != end) {
        reader.fail("attribute ARRAYSIZE is " + quotedForMessage(text) + "; expected a number");
    }
    return size;
}

CIMQualifier ObjectReader::readQualifier() {
    const CIMName name = context.requiredName(reader, "NAME");
    const CIMType type = values.readType();
    CIMFlavor flavor;
    flavor.set(CIMFlavor::OVERRIDABLE, reader.booleanAttribute("OVERRIDABLE", true));
    flavor.set(CIMFlavor::TOSUBCLASS, reader.booleanAttribute("TOSUBCLASS", true));
    flavor.set(CIMFlavor::TOINSTANCE, reader.booleanAttribute("TOINSTANCE", false));
    flavor.set(CIMFlavor::TRANSLATABLE, reader.booleanAttribute("TRANSLATABLE", false));
    const Boolean propagated = reader.booleanAttribute("PROPAGATED", false);
    CIMValue value(type, false);
    while (reader.nextChild()) {
        if (reader.is("VALUE") && value.isNull()) {
            value = values.readScalar(type);
        } else if (reader.is("VALUE.ARRAY") && value.isNull()) {
            value = values.readArray(type);
        } else {
            reader.failUnexpected("one VALUE or VALUE.ARRAY");
        }
    }
    return CIMQualifier(name, value, flavor, propagated);
}

void ObjectReader::skipMethod() {
    context.requiredName(reader, "NAME");
    if (reader.attribute("TYPE")) {
        values.readType();
    }
    while (reader.nextChild()) {
        if (reader.is("QUALIFIER")) {
            readQualifier();
        } else {
            skipParameter();
        }
    }
}

void ObjectReader::skipParameter() {
    const bool isTyped = reader.is("PARAMETER") || reader.is("PARAMETER.ARRAY");
    if (!isTyped && !reader.is("PARAMETER.REFERENCE") && !reader.is("PARAMETER.REFARRAY")) {
        reader.failUnexpected("QUALIFIER or a kind of PARAMETER");
    }
    context.requiredName(reader, "NAME");
    if (isTyped) {
        values.readType();
    }
    while (reader.nextChild()) {
        if (!reader.is("QUALIFIER")) {
            reader.failUnexpected("QUALIFIER");
        }
        readQualifier();
    }
}

}  // namespace Pegasus
