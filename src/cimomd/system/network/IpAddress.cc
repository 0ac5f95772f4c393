#include "system/network/IpAddress.h"

#include <arpa/inet.h>

#include <algorithm>

namespace cimomd {

std::optional<IpAddress> IpAddress::parse(std::string_view text) {
    const std::string copy(text);
    IpAddress out;
    if (::inet_pton(AF_INET, copy.c_str(), out.bytes.data()) == 1)
        return out;
    out.family = Version::V6;
    if (::inet_pton(AF_INET6, copy.c_str(), out.bytes.data()) == 1)
        return out;
    return std::nullopt;
}

std::optional<IpAddress> IpAddress::fromBytes(std::string_view networkOrder) {
    if (networkOrder.size() != kV4Bytes && networkOrder.size() != kV6Bytes)
        return std::nullopt;
    IpAddress out;
    out.family = networkOrder.size() == kV4Bytes ? Version::V4 : Version::V6;
    std::copy(networkOrder.begin(), networkOrder.end(), out.bytes.begin());
    return out;
}

IpAddress IpAddress::mask(Version version, unsigned prefixLength) {
    IpAddress out;
    out.family = version;
    const unsigned length = std::min(prefixLength, out.bits());
    for (unsigned bit = 0; bit < length; ++bit)
        out.bytes[bit / 8] = static_cast<std::uint8_t>(out.bytes[bit / 8] | (0x80U >> (bit % 8)));
    return out;
}

std::string IpAddress::text() const {
    std::array<char, INET6_ADDRSTRLEN> buffer{};
    const int code = family == Version::V4 ? AF_INET : AF_INET6;
    const char* written = ::inet_ntop(code, bytes.data(), buffer.data(), buffer.size());
    return written == nullptr ? "" : written;
}

bool IpAddress::isLoopback() const {
    if (family == Version::V4)
        return bytes[0] == 127;
    return bytes.back() == 1 &&
           std::all_of(bytes.begin(), bytes.end() - 1, [](std::uint8_t byte) { return byte == 0; });
}

bool IpAddress::isLinkLocal() const {
    if (family == Version::V4)
        return bytes[0] == 169 && bytes[1] == 254;
    return bytes[0] == 0xFE && (bytes[1] & 0xC0U) == 0x80;
}

bool IpAddress::isMulticast() const {
    return family == Version::V4 ? (bytes[0] & 0xF0U) == 0xE0 : bytes[0] == 0xFF;
}

}  // namespace cimomd
