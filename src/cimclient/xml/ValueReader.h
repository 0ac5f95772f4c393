// Reads the elements of DSP0201 that hold values.

#pragma once

#include <Pegasus/Common/CIMObject.h>
#include <Pegasus/Common/CIMType.h>
#include <Pegasus/Common/CIMValue.h>

#include <optional>
#include <string_view>

#include "model/PackedProperties.h"
#include "xml/DecodeContext.h"
#include "xml/ElementReader.h"

namespace Pegasus {

/// Failures are XmlError.
class ValueReader {
  public:
    /// Both must outlive the value reader.
    ValueReader(ElementReader& reader, DecodeContext& context) : reader(reader), context(context) {}

    /// The type that attribute TYPE of the element just entered names; fails when it is missing or
    /// names none. With an attribute EmbeddedObject it is the type of the embedded object.
    CIMType readType() const;

    /// Reads VALUE, or VALUE.REFERENCE for references, which the reader has just entered.
    CIMValue readScalar(CIMType type);

    /// Reads VALUE.ARRAY, or VALUE.REFARRAY for references, which the reader has just entered.
    /// VALUE.NULL becomes 0, false, an empty text or an empty path.
    CIMValue readArray(CIMType type);

    /// Packs the texts that the reader holds after ElementReader::readLike(). `type` is neither
    /// reference nor embedded object; a scalar has one text.
    void packTexts(CIMType type, Boolean isArray, PropertyPacker& packer);

  private:
    template <typename T>
    T readItem();
    template <typename T>
    CIMValue readItems(std::string_view itemElement);
    template <typename T>
    T parse(const ElementText& text) const;
    template <typename T>
    void packText(const ElementText& text, PropertyPacker& packer) const;
    CIMObject readEmbedded();
    CIMObject readEmbeddedDocument(std::string_view xml, DecodeContext& inner) const;

    ElementReader& reader;
    DecodeContext& context;
};

/// The type of a name like "uint16"; nothing for any other text, "reference" included, for elements
/// with a TYPE hold none. Case matters.
std::optional<CIMType> parseTypeName(std::string_view name);

}  // namespace Pegasus
