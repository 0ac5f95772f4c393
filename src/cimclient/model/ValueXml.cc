// The value elements of DSP0201.

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObject.h>

#include <array>
#include <charconv>
#include <cmath>
#include <concepts>
#include <limits>
#include <type_traits>
#include <variant>

#include "CimTypeDispatch.h"
#include "ObjectXml.h"
#include "PropertyXml.h"
#include "XmlText.h"

namespace Pegasus {

namespace {

void appendText(std::string& xml, Boolean value) {
    xml += value ? "TRUE" : "FALSE";
}

void appendText(std::string& xml, const String& value) {
    appendEscaped(xml, value);
}

void appendText(std::string& xml, Char16 value) {
    appendEscaped(xml, String(&value, 1));
}

void appendText(std::string& xml, std::string_view value) {
    appendEscaped(xml, value);
}

void appendText(std::string& xml, const CIMDateTime& value) {
    appendEscaped(xml, value.toString());
}

// An embedded object is its own element, escaped once more.
void appendText(std::string& xml, const CIMObject& value) {
    std::string element;
    appendObject(element, value);
    appendEscaped(xml, element);
}

void appendText(std::string& xml, const CIMInstance& value) {
    if (!value.isUninitialized()) {
        appendText(xml, CIMObject(value));
    }
}

template <typename T>
std::enable_if_t<std::is_integral_v<T>> appendText(std::string& xml, T value) {
    std::array<char, 24> text{};
    xml.append(text.data(), std::to_chars(text.data(), text.data() + text.size(), value).ptr);
}

// One digit before the point and so many behind it that the reader gets every bit back.
template <typename T>
std::enable_if_t<std::is_floating_point_v<T>> appendText(std::string& xml, T value) {
    if (std::isnan(value)) {
        xml += "NaN";
    } else if (std::isinf(value)) {
        xml += value < 0 ? "-INF" : "INF";
    } else {
        std::array<char, 32> text{};
        const std::to_chars_result result =
            std::to_chars(text.data(), text.data() + text.size(), value,
                          std::chars_format::scientific, std::numeric_limits<T>::max_digits10 - 1);
        xml.append(text.data(), result.ptr);
    }
}

/// An array element around what `appendElements` appends.
template <class AppendElements>
void appendArray(std::string& xml, std::string_view element, AppendElements appendElements) {
    xml.append("<").append(element).append(">");
    appendElements();
    xml.append("</").append(element).append(">");
}

struct ValueElement {
    std::string& xml;

    void operator()(std::monostate) const {}

    template <typename T>
    void operator()(const T& value) const {
        xml += "<VALUE>";
        appendText(xml, value);
        xml += "</VALUE>";
    }

    void operator()(const CIMObjectPath& value) const { appendReference(xml, value); }

    template <typename T>
    void operator()(const Array<T>& values) const {
        const bool isReference = std::is_same_v<T, CIMObjectPath>;
        appendArray(xml, isReference ? "VALUE.REFARRAY" : "VALUE.ARRAY", [&] {
            for (const T& value : values) {
                (*this)(value);
            }
        });
    }
};

/// Texts straight from the packed ones.
template <PackableScalar T>
void appendScalar(std::string& xml, Unpacker& unpacker) {
    if constexpr (std::same_as<T, String>) {
        ValueElement{xml}(unpacker.takeText());
    } else {
        ValueElement{xml}(unpacker.takeScalar<T>());
    }
}

template <PackableScalar T>
void appendArray(std::string& xml, Unpacker& unpacker) {
    appendArray(xml, "VALUE.ARRAY", [&] {
        for (auto left = unpacker.take<Uint32>(); left > 0; --left) {
            appendScalar<T>(xml, unpacker);
        }
    });
}

}  // namespace

void appendValue(std::string& xml, const CIMValue& value) {
    value.visit(ValueElement{xml});
}

void appendValue(std::string& xml, const PropertyDeclaration& property,
                 std::optional<Unpacker> packed) {
    if (!packed) {
        return;
    }
    dispatchCimType(property.type, [&]<class T>(CimTypeTag<T>) {
        if constexpr (PackableScalar<T>) {
            property.isArray ? appendArray<T>(xml, *packed) : appendScalar<T>(xml, *packed);
        }
    });
}

}  // namespace Pegasus
