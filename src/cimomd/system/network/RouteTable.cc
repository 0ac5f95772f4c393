#include "system/network/RouteTable.h"

#include <linux/ipv6_route.h>
#include <linux/route.h>

#include <array>
#include <cstring>
#include <limits>

#include "files/TextFields.h"
#include "system/Narrowing.h"

namespace cimomd {
namespace {

/// Digits without the usual "0x".
std::optional<std::uint32_t> hexNumber(std::string_view digits) {
    const auto wide = parseHexadecimal("0x" + std::string(digits));
    return wide ? narrowedTo<std::uint32_t>(*wide) : std::nullopt;
}

std::optional<IpAddress> ipv4Address(std::string_view digits) {
    constexpr std::size_t kDigits = 2 * IpAddress::kV4Bytes;
    const auto number = digits.size() == kDigits ? hexNumber(digits) : std::nullopt;
    if (!number)
        return std::nullopt;
    std::array<char, IpAddress::kV4Bytes> bytes{};
    std::memcpy(bytes.data(), &*number, bytes.size());
    return IpAddress::fromBytes({bytes.data(), bytes.size()});
}

std::optional<IpAddress> ipv6Address(std::string_view digits) {
    if (digits.size() != 2 * IpAddress::kV6Bytes)
        return std::nullopt;
    std::string bytes;
    for (std::size_t i = 0; i < digits.size(); i += 2) {
        const auto byte = hexNumber(digits.substr(i, 2));
        if (!byte)
            return std::nullopt;
        bytes += static_cast<char>(*byte);
    }
    return IpAddress::fromBytes(bytes);
}

std::optional<std::uint8_t> prefixLengthOf(const IpAddress& mask) {
    for (unsigned length = 0; length <= mask.bits(); ++length) {
        if (IpAddress::mask(mask.version(), length) == mask)
            return static_cast<std::uint8_t>(length);
    }
    return std::nullopt;
}

std::optional<IpAddress> gatewayOf(const std::optional<IpAddress>& written, std::uint32_t flags) {
    return (flags & RTF_GATEWAY) != 0 ? written : std::nullopt;
}

/// An IPv4 route that drops packets silently has no flag of its own, only this name.
constexpr std::string_view kNoInterface = "*";

std::optional<std::string> interfaceOf(std::string_view name, std::uint32_t flags) {
    if ((flags & RTF_REJECT) != 0 || name == kNoInterface)
        return std::nullopt;
    return std::string(name);
}

std::optional<Route> ipv4Route(std::string_view line) {
    constexpr std::size_t kLeastFields = 8;
    const std::vector<std::string_view> fields = fieldsOf(line);
    if (fields.size() < kLeastFields)
        return std::nullopt;
    const auto destination = ipv4Address(fields[1]);
    const auto gateway = ipv4Address(fields[2]);
    const auto flags = hexNumber(fields[3]);
    const auto wideMetric = parseUnsigned(fields[6]);
    const auto metric = wideMetric ? narrowedTo<std::uint32_t>(*wideMetric) : std::nullopt;
    const auto mask = ipv4Address(fields[7]);
    const auto prefixLength = mask ? prefixLengthOf(*mask) : std::nullopt;
    if (!destination || !gateway || !flags || !metric || !prefixLength || (*flags & RTF_UP) == 0)
        return std::nullopt;
    return Route{*destination, *prefixLength, gatewayOf(gateway, *flags),
                 interfaceOf(fields[0], *flags), *metric};
}

bool isKernelsOwn(const Route& route, std::uint32_t flags) {
    if ((flags & (RTF_LOCAL | RTF_ANYCAST | RTF_CACHE)) != 0 || route.destination.isMulticast())
        return true;
    return (flags & RTF_REJECT) != 0 && route.metric == std::numeric_limits<std::uint32_t>::max();
}

std::optional<Route> ipv6Route(std::string_view line) {
    constexpr std::size_t kLeastFields = 10;
    const std::vector<std::string_view> fields = fieldsOf(line);
    if (fields.size() < kLeastFields)
        return std::nullopt;
    const auto destination = ipv6Address(fields[0]);
    const auto prefixLength = hexNumber(fields[1]);
    const auto gateway = ipv6Address(fields[4]);
    const auto metric = hexNumber(fields[5]);
    const auto flags = hexNumber(fields[8]);
    if (!destination || !prefixLength || *prefixLength > destination->bits() || !gateway ||
        !metric || !flags)
        return std::nullopt;
    Route route{*destination, static_cast<std::uint8_t>(*prefixLength), gatewayOf(gateway, *flags),
                interfaceOf(fields[9], *flags), *metric};
    // Routes that refuse packets are never marked as being up.
    if ((*flags & (RTF_UP | RTF_REJECT)) == 0 || isKernelsOwn(route, *flags))
        return std::nullopt;
    return route;
}

std::vector<Route> routesOf(std::string_view text,
                            std::optional<Route> (*parse)(std::string_view)) {
    std::vector<Route> out;
    for (const std::string_view line : linesOf(text)) {
        if (auto route = parse(line))
            out.push_back(std::move(*route));
    }
    return out;
}

}  // namespace

std::vector<Route> parseIpv4Routes(std::string_view text) {
    return routesOf(text, ipv4Route);
}

std::vector<Route> parseIpv6Routes(std::string_view text) {
    return routesOf(text, ipv6Route);
}

}  // namespace cimomd
