#include "xml/ObjectReader.h"

#include <Pegasus/Common/Exception.h>

#include <charconv>
#include <string>
#include <system_error>
#include <utility>

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
    context.className = context.requiredName(reader, "CLASSNAME");
    CIMInstance instance(context.className);
    while (reader.nextChild()) {
        if (!readMember(instance)) {
            reader.failUnexpected("QUALIFIER, PROPERTY, PROPERTY.ARRAY or PROPERTY.REFERENCE");
        }
    }
    context.className.clear();
    return instance;
}

CIMClass ObjectReader::readClass() {
    context.className = context.requiredName(reader, "NAME");
    CIMClass cimClass(context.className, context.optionalName(reader, "SUPERCLASS"));
    while (reader.nextChild()) {
        if (reader.is("METHOD")) {
            skipMethod();
        } else if (!readMember(cimClass)) {
            reader.failUnexpected(
                "QUALIFIER, PROPERTY, PROPERTY.ARRAY, PROPERTY.REFERENCE or METHOD");
        }
    }
    context.className.clear();
    return cimClass;
}

// Reads what a class and an instance have in common; false when the element is none of it.
template <typename Owner>
bool ObjectReader::readMember(Owner& owner) {
    if (reader.is("PROPERTY")) {
        add(owner, readProperty());
    } else if (reader.is("PROPERTY.ARRAY")) {
        add(owner, readPropertyArray());
    } else if (reader.is("PROPERTY.REFERENCE")) {
        add(owner, readPropertyReference());
    } else if (reader.is("PROPERTY.REFARRAY")) {
        add(owner, readPropertyReferenceArray());
    } else if (reader.is("QUALIFIER")) {
        add(owner, readQualifier());
    } else {
        return false;
    }
    return true;
}

template <typename Owner>
void ObjectReader::add(Owner& owner, const CIMProperty& property) const {
    try {
        owner.addProperty(property);
    } catch (const AlreadyExistsException&) {
        failTwice("property", property.getName());
    }
}

template <typename Owner>
void ObjectReader::add(Owner& owner, const CIMQualifier& qualifier) const {
    try {
        owner.addQualifier(qualifier);
    } catch (const AlreadyExistsException&) {
        failTwice("qualifier", qualifier.getName());
    }
}

void ObjectReader::failTwice(const char* kind, const CIMName& name) const {
    const CString utf8 = name.getString().getCString();
    reader.fail(std::string(kind) + " " + quotedForMessage(static_cast<const char*>(utf8)) +
                " is given twice");
}

CIMProperty ObjectReader::readProperty() {
    context.propertyName = context.requiredName(reader, "NAME");
    return readPropertyBody(CIMValue(values.readType(), false), "VALUE");
}

CIMProperty ObjectReader::readPropertyArray() {
    context.propertyName = context.requiredName(reader, "NAME");
    return readPropertyBody(CIMValue(values.readType(), true, readArraySize()), "VALUE.ARRAY");
}

CIMProperty ObjectReader::readPropertyReference() {
    context.propertyName = context.requiredName(reader, "NAME");
    return readPropertyBody(CIMValue(CIMTYPE_REFERENCE, false), "VALUE.REFERENCE");
}

CIMProperty ObjectReader::readPropertyReferenceArray() {
    context.propertyName = context.requiredName(reader, "NAME");
    return readPropertyBody(CIMValue(CIMTYPE_REFERENCE, true, readArraySize()), "VALUE.REFARRAY");
}

// The rest of any kind of property. `value` is the null of its type, and stays so without an
// element that gives one.
CIMProperty ObjectReader::readPropertyBody(CIMValue value, std::string_view valueElement) {
    const Uint32 arraySize = value.isArray() ? readArraySize() : 0;
    const CIMName referenceClass = context.optionalName(reader, "REFERENCECLASS");
    const CIMName classOrigin = context.optionalName(reader, "CLASSORIGIN");
    const Boolean propagated = reader.booleanAttribute("PROPAGATED", false);
    Array<CIMQualifier> qualifiers;
    while (reader.nextChild()) {
        if (reader.is(valueElement) && value.isNull()) {
            value = value.isArray() ? values.readArray(value.getType())
                                    : values.readScalar(value.getType());
        } else if (reader.is("QUALIFIER")) {
            qualifiers.append(readQualifier());
        } else {
            reader.failUnexpected("QUALIFIER or one " + std::string(valueElement));
        }
    }
    CIMProperty property(context.propertyName, std::move(value), arraySize, referenceClass,
                         classOrigin, propagated);
    for (const CIMQualifier& qualifier : qualifiers) {
        add(property, qualifier);
    }
    context.propertyName.clear();
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
