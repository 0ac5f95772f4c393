#include "mof/MofEncoding.h"

#include <string_view>

#include "utf8/Utf8.h"

namespace cimomd {
namespace {

constexpr std::string_view kBigEndianMark = "\xFE\xFF";
constexpr std::string_view kLittleEndianMark = "\xFF\xFE";

/// The 16-bit units of a text, without the mark before them.
class Utf16Units {
  public:
    Utf16Units(std::string_view marked, bool isBigEndian)
        : bytes(marked), highByte(isBigEndian ? 0 : 1) {}

    bool atEnd() const { return offset + 1 >= bytes.size(); }
    char32_t current() const {
        return byteAt(offset + highByte) << 8U | byteAt(offset + 1 - highByte);
    }
    void advance() { offset += 2; }

  private:
    char32_t byteAt(std::size_t place) const { return static_cast<unsigned char>(bytes[place]); }

    std::string_view bytes;
    std::size_t highByte;
    std::size_t offset = 2;
};

std::string decoded(Utf16Units units) {
    std::string out;
    while (!units.atEnd()) {
        char32_t code = units.current();
        units.advance();
        if (utf8::isHighSurrogate(code) && !units.atEnd() &&
            utf8::isLowSurrogate(units.current())) {
            code = utf8::joinSurrogates(code, units.current());
            units.advance();
        }
        utf8::append(out, code);
    }
    return out;
}

}  // namespace

std::string utf8TextOf(std::string bytes) {
    const std::string_view mark = std::string_view(bytes).substr(0, 2);
    if (mark != kBigEndianMark && mark != kLittleEndianMark)
        return bytes;
    return decoded(Utf16Units(bytes, mark == kBigEndianMark));
}

}  // namespace cimomd
