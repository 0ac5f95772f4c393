// Reads packed values.
#pragma once

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/Char16.h>
#include <Pegasus/Common/String.h>

#include <concepts>
#include <cstring>
#include <string_view>
#include <type_traits>

namespace Pegasus {

/// What a packed property can hold: everything but references and embedded objects.
template <class T>
concept PackableScalar = std::is_arithmetic_v<T> || std::same_as<T, Char16> ||
    std::same_as<T, String> || std::same_as<T, CIMDateTime>;

/// Takes one after the other what a PropertyPacker put.
class Unpacker {
  public:
    explicit Unpacker(const char* from) : at(from) {}

    /// A number, boolean or char16; of an array first the number of its elements, a Uint32.
    template <class T>
    T take() {
        T item;
        std::memcpy(&item, at, sizeof item);
        at += sizeof item;
        return item;
    }

    /// A string or datetime in UTF-8; the latter may be empty, which stands for CIMDateTime().
    std::string_view takeText() {
        const auto size = take<Uint32>();
        const std::string_view text(at, size);
        at += size;
        return text;
    }

    template <PackableScalar T>
    T takeScalar() {
        if constexpr (std::same_as<T, String>)
            return stringOf(takeText());
        else if constexpr (std::same_as<T, CIMDateTime>)
            return takeDateTime();
        else
            return take<T>();
    }

    template <PackableScalar T>
    Array<T> takeArray() {
        const auto count = take<Uint32>();
        Array<T> elements;
        elements.reserveCapacity(count);
        for (Uint32 i = 0; i < count; ++i)
            elements.append(takeScalar<T>());
        return elements;
    }

  private:
    static String stringOf(std::string_view utf8) {
        return String(utf8.data(), static_cast<Uint32>(utf8.size()));
    }

    CIMDateTime takeDateTime() {
        const std::string_view text = takeText();
        return text.empty() ? CIMDateTime() : CIMDateTime(stringOf(text));
    }

    const char* at;
};

}  // namespace Pegasus
