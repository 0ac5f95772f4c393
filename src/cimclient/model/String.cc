#include <Pegasus/Common/Exception.h>
#include <Pegasus/Common/String.h>

#include <algorithm>
#include <cstring>
#include <functional>
#include <limits>
#include <new>
#include <ostream>
#include <string>

#include "AsciiCase.h"
#include "Utf16.h"

namespace Pegasus {

namespace {

constexpr Uint32 kLargestSize = std::numeric_limits<Uint32>::max() - 1;

Uint32 checkedLength(std::size_t length) {
    if (length > kLargestSize)
        throw std::bad_alloc();
    return static_cast<Uint32>(length);
}

template <class Character>
Uint32 lengthUpToNul(const Character* text) {
    if (!text)
        throw Exception("A String cannot be made of a null pointer");
    const Character* end = text;
    while (*end != 0)
        ++end;
    return checkedLength(static_cast<std::size_t>(end - text));
}

int unfolded(Uint16 code) {
    return code;
}

int folded(Uint16 code) {
    return toAsciiLower(code);
}

template <class Fold>
int compareText(const String& a, const String& b, Uint32 n, Fold fold) {
    const Uint32 sizeOfA = std::min(a.size(), n);
    const Uint32 sizeOfB = std::min(b.size(), n);
    const Char16* const textOfA = a.getChar16Data();
    const Char16* const textOfB = b.getChar16Data();
    for (Uint32 i = 0; i < std::min(sizeOfA, sizeOfB); ++i) {
        if (const int difference = fold(textOfA[i]) - fold(textOfB[i]))
            return difference;
    }
    return (sizeOfA > sizeOfB) - (sizeOfA < sizeOfB);
}

Uint32 positionOf(const Char16* found, const String& in) {
    const Char16* const begin = in.getChar16Data();
    return found == begin + in.size() ? PEG_NOT_FOUND : static_cast<Uint32>(found - begin);
}

}  // namespace

constinit const String String::EMPTY;
constinit const Char16 String::kNul;

String::String(const String& other, Uint32 n) : String(other.subString(0, n)) {}

String::String(const Char16* text) : String(text, lengthUpToNul(text)) {}

String::String(const Char16* text, Uint32 n) {
    append(text, n);
}

String::String(const char* utf8) : String(utf8, lengthUpToNul(utf8)) {}

String::String(const char* utf8, Uint32 n) {
    setUtf8(utf8, n);
}

void String::setUtf8(const char* bytes, Uint32 n) {
    if (n == 0)
        return;
    if (isAscii(bytes, n)) {
        makeRoom(n);
        std::transform(bytes, bytes + n, body->text(),
                       [](char byte) { return Char16(static_cast<Uint8>(byte)); });
        body->setSize(n);
        return;
    }
    const auto length = static_cast<Uint32>(utf16Length(bytes, n));
    makeRoom(length);
    const std::size_t read = decodeUtf8(bytes, n, body->text());
    if (read != n) {
        clear();
        throw Exception(("Bytes that are not UTF-8 at offset " + std::to_string(read) + " of " +
                         std::to_string(n))
                            .c_str());
    }
    body->setSize(length);
}

String& String::assign(const String& other) {
    return *this = other;
}

String& String::assign(const Char16* text, Uint32 n) {
    return *this = String(text, n);
}

String& String::assign(const char* utf8) {
    return *this = String(utf8);
}

String& String::assign(const char* utf8, Uint32 n) {
    return *this = String(utf8, n);
}

void String::makeRoom(Uint32 capacity) {
    if (body && !body->isShared() && body->capacity() >= capacity)
        return;
    String fresh;
    fresh.body = StringBody::create(capacity);
    const Uint32 kept = std::min(size(), capacity);
    std::copy_n(getChar16Data(), kept, fresh.body->text());
    fresh.body->setSize(kept);
    std::swap(body, fresh.body);
}

void String::reserveCapacity(Uint32 capacity) {
    makeRoom(std::max(checkedLength(capacity), size()));
}

CString String::getCString() const {
    return CString(encodeUtf8(getChar16Data(), size()));
}

Char16& String::operator[](Uint32 index) {
    if (index > size())
        throw IndexOutOfBoundsException(index, size());
    makeRoom(size());
    return body->text()[index];
}

Char16 String::operator[](Uint32 index) const {
    if (index > size())
        throw IndexOutOfBoundsException(index, size());
    return getChar16Data()[index];
}

String& String::appendAfterMakingRoom(const Char16* text, Uint32 n) {
    if (n == 0)
        return *this;
    const Uint32 oldSize = size();
    if (n > kLargestSize - oldSize)
        throw std::bad_alloc();
    const Uint32 newSize = oldSize + n;
    const Char16* const begin = getChar16Data();
    const Boolean own = !std::less<>()(text, begin) && std::less<>()(text, begin + oldSize);
    const auto offset = own ? text - begin : 0;
    const Uint32 room = body ? body->capacity() : 0;
    // Half as much again keeps a row of appends linear; a string that is made at once is exact.
    makeRoom(newSize <= room || oldSize == 0
                 ? std::max(newSize, room)
                 : std::max(newSize, room + std::min(room / 2, kLargestSize - room)));
    std::copy_n(own ? body->text() + offset : text, n, body->text() + oldSize);
    body->setSize(newSize);
    return *this;
}

String& String::append(const String& other) {
    if (!body)
        return *this = other;
    return append(other.getChar16Data(), other.size());
}

void String::remove(Uint32 index, Uint32 n) {
    if (index > size())
        throw IndexOutOfBoundsException(index, size());
    const Uint32 rest = size() - index;
    const Uint32 gone = n == PEG_NOT_FOUND ? rest : n;
    if (gone > rest)
        throw IndexOutOfBoundsException(index + rest, size());
    if (gone == 0)
        return;
    makeRoom(size());
    Char16* const text = body->text();
    std::copy(text + index + gone, text + size(), text + index);
    body->setSize(size() - gone);
}

String String::subString(Uint32 index, Uint32 n) const {
    if (index >= size())
        return String();
    if (index == 0 && n >= size())
        return *this;
    return String(getChar16Data() + index, std::min(n, size() - index));
}

Uint32 String::find(Char16 character) const {
    return find(0, character);
}

Uint32 String::find(Uint32 from, Char16 character) const {
    if (from >= size())
        return PEG_NOT_FOUND;
    const Char16* const begin = getChar16Data();
    return positionOf(std::find(begin + from, begin + size(), character), *this);
}

Uint32 String::find(const String& part) const {
    if (part.size() == 0)
        return 0;
    const Char16* const begin = getChar16Data();
    const Char16* const wanted = part.getChar16Data();
    return positionOf(std::search(begin, begin + size(), wanted, wanted + part.size()), *this);
}

Uint32 String::reverseFind(Char16 character) const {
    const Char16* const text = getChar16Data();
    for (Uint32 i = size(); i-- > 0;) {
        if (text[i] == character)
            return i;
    }
    return PEG_NOT_FOUND;
}

void String::toLower() {
    if (size() == 0)
        return;
    makeRoom(size());
    std::transform(body->text(), body->text() + size(), body->text(), toAsciiLower);
}

void String::toUpper() {
    if (size() == 0)
        return;
    makeRoom(size());
    std::transform(body->text(), body->text() + size(), body->text(), toAsciiUpper);
}

int String::compare(const String& a, const String& b) {
    return compare(a, b, PEG_NOT_FOUND);
}

int String::compare(const String& a, const String& b, Uint32 n) {
    return compareText(a, b, n, unfolded);
}

int String::compareNoCase(const String& a, const String& b) {
    return compareNoCase(a, b, PEG_NOT_FOUND);
}

int String::compareNoCase(const String& a, const String& b, Uint32 n) {
    return compareText(a, b, n, folded);
}

Boolean String::equal(const String& a, const String& b) {
    return a.body == b.body ||
           (a.size() == b.size() &&
            std::memcmp(a.getChar16Data(), b.getChar16Data(), a.size() * sizeof(Char16)) == 0);
}

Boolean String::equalNoCase(const String& a, const String& b) {
    // Names are mostly spelled alike.
    return equal(a, b) || (a.size() == b.size() && compareNoCase(a, b) == 0);
}

String operator+(const String& a, const String& b) {
    String sum;
    sum.reserveCapacity(
        static_cast<Uint32>(std::min<Uint64>(kLargestSize, Uint64{a.size()} + b.size())));
    return sum.append(a).append(b);
}

std::ostream& operator<<(std::ostream& out, const String& text) {
    return out << encodeUtf8(text.getChar16Data(), text.size());
}

}  // namespace Pegasus
