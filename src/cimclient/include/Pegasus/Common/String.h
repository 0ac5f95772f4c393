// The string of the CIM client library: a sequence of 16-bit characters (UTF-16).
//
// Copies share one body until one of them is changed. Distinct String objects may be used from
// distinct threads also when they share a body; one object may not.
#pragma once

#include <Pegasus/Common/CString.h>
#include <Pegasus/Common/Char16.h>
#include <Pegasus/Common/Config.h>
#include <Pegasus/Common/StringBody.h>

#include <algorithm>
#include <iosfwd>
#include <string>
#include <utility>

namespace Pegasus {

/// Lengths and positions are counted in 16-bit characters. A string too long for a Uint32 length
/// raises std::bad_alloc.
class String {
  public:
    static const String EMPTY;

    String() noexcept = default;
    String(const String& other) noexcept : body(other.body) {
        if (body)
            body->retain();
    }
    String(String&& other) noexcept : body(std::exchange(other.body, nullptr)) {}
    /// The first `n` characters of `other`, or all of them when it has fewer.
    String(const String& other, Uint32 n);
    /// Up to the first NUL. Raises Exception for a null pointer.
    String(const Char16* text);
    String(const Char16* text, Uint32 n);
    /// UTF-8 up to the first NUL. Raises Exception for a null pointer and for bytes that are not
    /// UTF-8 as RFC 3629 has it: no overlong forms, no surrogates, nothing above U+10FFFF.
    String(const char* utf8);
    /// `n` bytes of UTF-8, NULs included. Raises Exception for bytes that are not UTF-8.
    String(const char* utf8, Uint32 n);
    ~String() {
        if (body)
            body->release();
    }

    String& operator=(const String& other) noexcept { return *this = String(other); }
    String& operator=(String&& other) noexcept {
        std::swap(body, other.body);
        return *this;
    }

    String& assign(const String& other);
    String& assign(const Char16* text, Uint32 n);
    String& assign(const char* utf8);
    String& assign(const char* utf8, Uint32 n);

    void clear() noexcept { *this = String(); }
    /// Makes room for `capacity` characters, so that appending up to there allocates no more.
    void reserveCapacity(Uint32 capacity);

    Uint32 size() const noexcept { return body ? body->size() : 0; }
    /// NUL-terminated; valid until this string is changed, assigned or destroyed.
    const Char16* getChar16Data() const noexcept { return body ? body->text() : &kNul; }
    /// UTF-8; a surrogate without its partner becomes U+FFFD.
    CString getCString() const;

    /// The character at `index`; the NUL after the last for `index == size()`, which is not to be
    /// written to. Raises IndexOutOfBoundsException beyond. The reference lives until the string
    /// is next changed or copied.
    Char16& operator[](Uint32 index);
    Char16 operator[](Uint32 index) const;

    String& append(const Char16& character) { return append(&character, 1); }
    String& append(const Char16* text, Uint32 n) {
        if (!hasRoomFor(n))
            return appendAfterMakingRoom(text, n);
        std::copy_n(text, n, body->text() + body->size());
        body->setSize(body->size() + n);
        return *this;
    }
    String& append(const String& other);

    /// Takes `n` characters away, or all from `index` on. Raises IndexOutOfBoundsException when
    /// there are not so many; the string is unchanged then.
    void remove(Uint32 index, Uint32 n = PEG_NOT_FOUND);
    /// At most `n` characters from `index` on; empty when `index` is at or beyond the end.
    String subString(Uint32 index, Uint32 n = PEG_NOT_FOUND) const;

    /// The position of the first (last) occurrence, or PEG_NOT_FOUND. An empty string is found at
    /// position 0.
    Uint32 find(Char16 character) const;
    Uint32 find(Uint32 from, Char16 character) const;
    Uint32 find(const String& part) const;
    Uint32 reverseFind(Char16 character) const;

    /// Letters outside ASCII stay as they are, here and in the comparisons that ignore case.
    void toLower();
    void toUpper();

    /// Negative, 0 or positive: the difference of the codes of the first characters that differ.
    /// When one string begins with the other, the shorter one is the smaller.
    static int compare(const String& a, const String& b);
    /// The same of at most the first `n` characters.
    static int compare(const String& a, const String& b, Uint32 n);
    static int compareNoCase(const String& a, const String& b);
    static int compareNoCase(const String& a, const String& b, Uint32 n);
    static Boolean equal(const String& a, const String& b);
    static Boolean equalNoCase(const String& a, const String& b);

  private:
    Boolean hasRoomFor(Uint32 n) const noexcept {
        return body && n <= body->capacity() - body->size() && !body->isShared();
    }
    String& appendAfterMakingRoom(const Char16* text, Uint32 n);
    void makeRoom(Uint32 capacity);
    void setUtf8(const char* bytes, Uint32 n);

    static const Char16 kNul;
    StringBody* body = nullptr;
};

inline Boolean operator==(const String& a, const String& b) {
    return String::equal(a, b);
}
inline Boolean operator<(const String& a, const String& b) {
    return String::compare(a, b) < 0;
}
String operator+(const String& a, const String& b);
/// Writes the string as UTF-8.
std::ostream& operator<<(std::ostream& out, const String& text);

}  // namespace Pegasus
