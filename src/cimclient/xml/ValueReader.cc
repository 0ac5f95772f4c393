#include "xml/ValueReader.h"

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/CIMTypeTraits.h>

#include <array>
#include <string>
#include <type_traits>
#include <utility>

#include "model/CimTypeDispatch.h"
#include "xml/MemorySource.h"
#include "xml/ObjectReader.h"
#include "xml/PathReader.h"
#include "xml/ScalarParser.h"
#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

// An object embedded in an object embedded in ...: each level is escaped once more, so real ones
// are shallow.
constexpr unsigned kMaxEmbedding = 8;

}  // namespace

std::optional<CIMType> parseTypeName(std::string_view name) {
    using Entry = std::pair<std::string_view, CIMType>;
    // The most frequent ones first.
    constexpr std::array<Entry, 14> kTypes{{{"string", CIMTYPE_STRING},
                                            {"uint16", CIMTYPE_UINT16},
                                            {"uint32", CIMTYPE_UINT32},
                                            {"boolean", CIMTYPE_BOOLEAN},
                                            {"uint64", CIMTYPE_UINT64},
                                            {"datetime", CIMTYPE_DATETIME},
                                            {"uint8", CIMTYPE_UINT8},
                                            {"sint8", CIMTYPE_SINT8},
                                            {"sint16", CIMTYPE_SINT16},
                                            {"sint32", CIMTYPE_SINT32},
                                            {"sint64", CIMTYPE_SINT64},
                                            {"real32", CIMTYPE_REAL32},
                                            {"real64", CIMTYPE_REAL64},
                                            {"char16", CIMTYPE_CHAR16}}};
    for (const Entry& entry : kTypes) {
        if (entry.first == name) {
            return entry.second;
        }
    }
    return std::nullopt;
}

CIMType ValueReader::readType() const {
    const std::string_view name = reader.requiredAttribute("TYPE");
    const std::optional<CIMType> type = parseTypeName(name);
    if (!type) {
        reader.fail("attribute TYPE is " + quotedForMessage(name) + "; expected a CIM type");
    }
    std::optional<std::string_view> embedded = reader.attribute("EmbeddedObject");
    if (!embedded) {
        embedded = reader.attribute("EMBEDDEDOBJECT");
    }
    if (!embedded) {
        return *type;
    }
    const bool isInstance = equalsIgnoringCase(*embedded, "instance");
    if (*type != CIMTYPE_STRING || (!isInstance && !equalsIgnoringCase(*embedded, "object"))) {
        reader.fail("attribute EmbeddedObject is " + quotedForMessage(*embedded) + " with type " +
                    quotedForMessage(name) + "; expected instance or object with type string");
    }
    return isInstance ? CIMTYPE_INSTANCE : CIMTYPE_OBJECT;
}

CIMValue ValueReader::readScalar(CIMType type) {
    return dispatchCimType(type,
                           [this]<typename T>(CimTypeTag<T>) { return CIMValue(readItem<T>()); });
}

CIMValue ValueReader::readArray(CIMType type) {
    const std::string_view item = type == CIMTYPE_REFERENCE ? "VALUE.REFERENCE" : "VALUE";
    return dispatchCimType(type,
                           [this, item]<typename T>(CimTypeTag<T>) { return readItems<T>(item); });
}

template <typename T>
CIMValue ValueReader::readItems(std::string_view itemElement) {
    Array<T> items;
    while (reader.nextChild()) {
        if (reader.is(itemElement)) {
            items.append(readItem<T>());
        } else if (reader.is("VALUE.NULL")) {
            reader.readEnd();
            items.append(T());
        } else {
            reader.failUnexpected(std::string(itemElement) + " or VALUE.NULL");
        }
    }
    return CIMValue(std::move(items));
}

template <typename T>
T ValueReader::readItem() {
    if constexpr (std::is_same_v<T, CIMObjectPath>) {
        return PathReader(reader, context).readReference();
    } else if constexpr (std::is_same_v<T, CIMObject>) {
        return readEmbedded();
    } else if constexpr (std::is_same_v<T, CIMInstance>) {
        const CIMObject object = readEmbedded();
        if (!object.isInstance()) {
            reader.fail("the embedded object is a class; expected INSTANCE");
        }
        return CIMInstance(object);
    } else {
        return parse<T>(reader.readText());
    }
}

template <typename T>
T ValueReader::parse(const ElementText& text) const {
    T item{};
    if (!parseScalar(text, item)) {
        reader.fail("value " + quotedForMessage(text.raw) + " is no " +
                    cimTypeToString(kCimTypeOf<T>));
    }
    return item;
}

void ValueReader::packTexts(CIMType type, Boolean isArray, PropertyPacker& packer) {
    const std::size_t count = reader.textCount();
    if (isArray) {
        packer.beginArray(static_cast<Uint32>(count));
    } else {
        packer.beginScalar();
    }
    dispatchCimType(type, [&]<typename T>(CimTypeTag<T>) {
        for (std::size_t i = 0; i < count; ++i) {
            packText<T>(reader.takeText(), packer);
        }
    });
}

template <typename T>
void ValueReader::packText(const ElementText& text, PropertyPacker& packer) const {
    if constexpr (std::is_same_v<T, String>) {
        packer.putText(text.trimmed);
    } else if constexpr (PackableScalar<T>) {
        packer.put(parse<T>(text));
    }
}

CIMObject ValueReader::readEmbedded() {
    const ElementText text = reader.readText();
    if (context.embeddingLevel == kMaxEmbedding) {
        reader.fail("objects are embedded in each other deeper than " +
                    std::to_string(kMaxEmbedding) + " levels");
    }
    DecodeContext inner(context.names, context.embeddingLevel + 1);
    try {
        return readEmbeddedDocument(text.trimmed, inner);
    } catch (const XmlError& error) {
        reader.fail("the embedded object is faulty (" + error.message + inner.place() + ")");
    }
}

CIMObject ValueReader::readEmbeddedDocument(std::string_view xml, DecodeContext& inner) const {
    MemorySource source(xml);
    ElementReader document(source);
    ObjectReader objects(document, inner);
    document.readRoot();
    CIMObject object;
    if (document.is("INSTANCE")) {
        object = CIMObject(objects.readInstance());
    } else if (document.is("CLASS")) {
        object = CIMObject(objects.readClass());
    } else {
        document.failUnexpected("INSTANCE or CLASS");
    }
    document.readDocumentEnd();
    return object;
}

}  // namespace Pegasus
