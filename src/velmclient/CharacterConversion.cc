#include "velmclient/CharacterConversion.h"

#include <iconv.h>
#include <langinfo.h>
#include <locale.h>

#include <cerrno>
#include <cstddef>
#include <cstdint>

namespace Velm {

namespace {

constexpr const char* kUtf8 = "UTF-8";
constexpr const char* kAscii = "ANSI_X3.4-1968";

// An open converter to UTF-8.
class Converter {
  public:
    explicit Converter(const std::string& charset) : handle(::iconv_open(kUtf8, charset.c_str())) {}

    ~Converter() {
        if (isOpen()) {
            ::iconv_close(handle);
        }
    }

    Converter(const Converter&) = delete;
    Converter& operator=(const Converter&) = delete;

    bool isOpen() const { return reinterpret_cast<std::intptr_t>(handle) != -1; }

    // Appends what can be converted from the front of the text and takes it away from there.
    void convert(std::string_view& text, std::string& out) const {
        while (step(text, out)) {
        }
        // Some character sets hold a letter back, in case a combining mark follows.
        char buffer[kBufferSize];
        char* next = buffer;
        std::size_t room = sizeof buffer;
        ::iconv(handle, nullptr, nullptr, &next, &room);
        out.append(buffer, next);
    }

  private:
    static constexpr std::size_t kBufferSize = 1024;

    // Converts at most a buffer full; returns whether there is more to convert.
    bool step(std::string_view& text, std::string& out) const {
        char buffer[kBufferSize];
        // iconv takes a pointer to non-const text but does not write there.
        char* in = const_cast<char*>(text.data());
        std::size_t inLeft = text.size();
        char* next = buffer;
        std::size_t room = sizeof buffer;
        const std::size_t result = ::iconv(handle, &in, &inLeft, &next, &room);
        const bool full = result == static_cast<std::size_t>(-1) && errno == E2BIG;
        out.append(buffer, next);
        text.remove_prefix(text.size() - inLeft);
        return full;
    }

    iconv_t handle;
};

}  // namespace

std::string localeCharset() {
    const locale_t locale = ::newlocale(LC_CTYPE_MASK, "", nullptr);
    if (locale == nullptr) {
        return kAscii;
    }
    std::string charset = ::nl_langinfo_l(CODESET, locale);
    ::freelocale(locale);
    return charset;
}

std::string toUtf8(std::string_view text, const std::string& charset) {
    const Converter converter(charset);
    if (charset == kUtf8 || !converter.isOpen()) {
        return std::string(text);
    }
    std::string out;
    out.reserve(text.size());
    converter.convert(text, out);
    while (!text.empty()) {
        out += text.front();
        text.remove_prefix(1);
        converter.convert(text, out);
    }
    return out;
}

}  // namespace Velm
