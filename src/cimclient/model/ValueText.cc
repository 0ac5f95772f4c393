#include "ValueText.h"

#include <array>
#include <charconv>
#include <string>
#include <string_view>

#include "ObjectXml.h"

namespace Pegasus {

namespace {

/// Room for any integer and any real of 17 digits.
using NumberText = std::array<char, 32>;

void appendUtf8(String& out, std::string_view text) {
    out.append(String(text.data(), static_cast<Uint32>(text.size())));
}

template <class Integer>
void appendInteger(String& out, Integer value) {
    NumberText text;
    const char* const end = std::to_chars(text.begin(), text.end(), value).ptr;
    appendUtf8(out, {text.data(), end});
}

}  // namespace

void appendValueText(String& out, Boolean value) {
    out.append(value ? "TRUE" : "FALSE");
}

void appendValueText(String& out, Uint64 value) {
    appendInteger(out, value);
}

void appendValueText(String& out, Sint64 value) {
    appendInteger(out, value);
}

void appendValueText(String& out, Real64 value) {
    NumberText text;
    const auto [end, error] =
        std::to_chars(text.begin(), text.end(), value, std::chars_format::scientific, 16);
    static_cast<void>(error);
    appendUtf8(out, {text.data(), end});
}

void appendValueText(String& out, Char16 value) {
    if (value >= 1 && value <= 127) {
        out.append(value);
        return;
    }
    static constexpr char kDigits[] = "0123456789ABCDEF";
    out.append('\\').append('x');
    for (int shift = 12; shift >= 0; shift -= 4)
        out.append(static_cast<Uint16>(kDigits[value >> shift & 0xF]));
}

void appendValueText(String& out, const String& value) {
    out.append(value);
}

void appendValueText(String& out, const CIMDateTime& value) {
    out.append(value.toString());
}

void appendValueText(String& out, const CIMObjectPath& value) {
    out.append(value.toString());
}

void appendValueText(String& out, const CIMObject& value) {
    std::string xml;
    appendObject(xml, value);
    appendUtf8(out, xml);
}

void appendValueText(String& out, const CIMInstance& value) {
    if (!value.isUninitialized())
        appendValueText(out, CIMObject(value));
}

}  // namespace Pegasus
