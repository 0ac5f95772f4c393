#pragma once

// The octets of a fuzzer, taken as the choices that a test has to make.

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string>
#include <string_view>

/// When the octets are used up every choice is 0 or empty.
class FuzzBytes {
  public:
    FuzzBytes(const std::uint8_t* data, std::size_t size)
        : rest(reinterpret_cast<const char*>(data), size) {}

    bool empty() const { return rest.empty(); }

    /// A number with all its bits from the octets.
    template <typename Number>
    Number number() {
        Number value{};
        const std::string_view taken = take(sizeof value);
        std::memcpy(&value, taken.data(), taken.size());
        return value;
    }

    /// A number below `bound`, which is 1 to 256.
    unsigned below(unsigned bound) { return number<std::uint8_t>() % bound; }

    /// At most `maxSize` octets, which is at most 255.
    std::string_view text(unsigned maxSize) { return take(below(maxSize + 1)); }

  private:
    std::string_view take(std::size_t size) {
        const std::string_view taken = rest.substr(0, size);
        rest.remove_prefix(taken.size());
        return taken;
    }

    std::string_view rest;
};
