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
        add(owner, readProperty(), "property");
    } else if (reader.is("PROPERTY.ARRAY")) {
        add(owner, readPropertyArray(), "property");
    } else if (reader.is("PROPERTY.REFERENCE")) {
        add(owner, readPropertyReference(), "property");
    } else if (reader.is("QUALIFIER")) {
        add(owner, readQualifier(), "qualifier");
    } else {
        return false;
    }
    return true;
}

template <typename Owner, typename Member>
void ObjectReader::add(Owner& owner, Member member, const char* kind) const {
    try {
        if constexpr (std::is_same_v<Member, CIMProperty>) {
            owner.addProperty(std::move(member));
        } else {
            owner.addQualifier(std::move(member));
        }
    } catch (const AlreadyExistsException&) {
        reader.fail(
            std::string(kind) + " " +
            quotedForMessage(static_cast<const char*>(member.getName().getString().getCString())) +
            " is given twice");
    }
}

CIMProperty ObjectReader::readProperty() {
    context.propertyName = context.requiredName(reader, "NAME");
    const CIMType type = values.readType();
    if (type == CIMTYPE_REFERENCE) {
        reader.fail("a PROPERTY is of type reference; expected PROPERTY.REFERENCE");
    }
    return readPropertyBody(CIMValue(type, false), "VALUE");
}

CIMProperty ObjectReader::readPropertyArray() {
    context.propertyName = context.requiredName(reader, "NAME");
    const CIMType type = values.readType();
    const Uint32 arraySize = readArraySize();
    return readPropertyBody(CIMValue(type, true, arraySize),
                            type == CIMTYPE_REFERENCE ? "VALUE.REFARRAY" : "VALUE.ARRAY",
                            arraySize);
}

CIMProperty ObjectReader::readPropertyReference() {
    context.propertyName = context.requiredName(reader, "NAME");
    const CIMName referenceClass = context.optionalName(reader, "REFERENCECLASS");
    return readPropertyBody(CIMValue(CIMTYPE_REFERENCE, false), "VALUE.REFERENCE", 0,
                            referenceClass);
}

// The rest of any kind of property. `value` is the null of its type, and stays so without an
// element that gives one.
CIMProperty ObjectReader::readPropertyBody(CIMValue value, std::string_view valueElement,
                                           Uint32 arraySize, const CIMName& referenceClass) {
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
        add(property, qualifier, "qualifier");
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
    if (type == CIMTYPE_REFERENCE) {
        reader.fail("a qualifier is of type reference; expected another type");
    }
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
