#pragma once

// Internet addresses, of version 4 (RFC 791) and 6 (RFC 4291).

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <tuple>

namespace cimomd {

/// Addresses order by version, then by their bytes.
class IpAddress {
  public:
    enum class Version : std::uint8_t { V4 = 4, V6 = 6 };

    static constexpr std::size_t kV4Bytes = 4;
    static constexpr std::size_t kV6Bytes = 16;

    /// From dotted or colon notation, without a prefix length or a zone.
    static std::optional<IpAddress> parse(std::string_view text);
    /// From 4 or 16 bytes as they go over the network; nothing from any other number.
    static std::optional<IpAddress> fromBytes(std::string_view networkOrder);
    /// The netmask of that version; longer prefixes count as the longest possible one.
    static IpAddress mask(Version version, unsigned prefixLength);

    /// In the notation of RFC 5952.
    std::string text() const;

    Version version() const { return family; }
    unsigned bits() const { return 8 * static_cast<unsigned>(size()); }
    bool isLoopback() const;
    bool isLinkLocal() const;
    bool isMulticast() const;

    bool operator==(const IpAddress&) const = default;
    bool operator<(const IpAddress& other) const {
        return std::tie(family, bytes) < std::tie(other.family, other.bytes);
    }

  private:
    IpAddress() = default;

    std::size_t size() const { return family == Version::V4 ? kV4Bytes : kV6Bytes; }

    Version family = Version::V4;
    std::array<std::uint8_t, kV6Bytes> bytes{};
};

}  // namespace cimomd
