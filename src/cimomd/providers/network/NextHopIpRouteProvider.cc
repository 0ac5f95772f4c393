#include "providers/network/NextHopIpRouteProvider.h"

#include <fmt/format.h>

#include <algorithm>
#include <tuple>

#include "files/TextFile.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/Narrowing.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint8;

// Enough for a hundred thousand routes; routers of the internet's core are no inventory's business.
constexpr std::size_t kMaxTableBytes = std::size_t{16} << 20;

// CIM_NextHopIPRoute.AddressType
constexpr Uint16 kAddressTypeIpv4 = 1;
constexpr Uint16 kAddressTypeIpv6 = 2;

// CIM_NextHopRoute.TypeOfRoute
constexpr Uint16 kActualRoute = 4;

struct NumberedRoute {
    Route route;
    std::size_t number = 1;
};

auto orderOf(const Route& route) {
    return std::tie(route.destination, route.prefixLength, route.metric, route.interfaceName,
                    route.gateway);
}

std::vector<NumberedRoute> inOrder(std::vector<Route> routes) {
    std::sort(routes.begin(), routes.end(),
              [](const Route& a, const Route& b) { return orderOf(a) < orderOf(b); });
    std::vector<NumberedRoute> out;
    for (Route& route : routes) {
        const bool isAgain = !out.empty() && out.back().route == route;
        const std::size_t number = isAgain ? out.back().number + 1 : 1;
        out.push_back({std::move(route), number});
    }
    return out;
}

std::string titleOf(const Route& route) {
    return fmt::format("{}/{}", route.destination.text(), route.prefixLength);
}

std::string instanceIdOf(const Route& route, std::size_t number) {
    std::string id = "Velmira:" + titleOf(route);
    if (route.gateway)
        id += " via " + route.gateway->text();
    if (route.interfaceName)
        id += " dev " + *route.interfaceName;
    id += fmt::format(" metric {}", route.metric);
    return number == 1 ? id : id + fmt::format(" #{}", number);
}

/// A kernel may lack one of the protocols; a table that is there must be read.
std::optional<Absence> hindranceOf(const Fact<std::vector<Route>>& ipv4,
                                   const Fact<std::vector<Route>>& ipv6) {
    for (const auto* routes : {&ipv4, &ipv6}) {
        if (!*routes && routes->reason() != Absence::Absent)
            return routes->reason();
    }
    return std::nullopt;
}

}  // namespace

std::unique_ptr<InstanceStream> NextHopIpRouteProvider::enumerate() const {
    const auto ipv4 = readText(paths.ipv4Routes(), kMaxTableBytes).then(parseIpv4Routes);
    const auto ipv6 = readText(paths.ipv6Routes(), kMaxTableBytes).then(parseIpv6Routes);
    const std::optional<Absence> incompleteness = hindranceOf(ipv4, ipv6);
    if (!ipv4 && !ipv6)
        return std::make_unique<EmptyStream>(incompleteness.value_or(Absence::Absent));
    std::vector<Route> routes = ipv4.value_or({});
    const std::vector<Route> more = ipv6.value_or({});
    routes.insert(routes.end(), more.begin(), more.end());
    return std::make_unique<RecordStream<NumberedRoute>>(
        inOrder(std::move(routes)),
        [](const NumberedRoute& entry) { return publish(entry.route, entry.number); },
        incompleteness);
}

ProvidedInstance NextHopIpRouteProvider::publish(const Route& route, std::size_t number) {
    const bool isV4 = route.destination.version() == IpAddress::Version::V4;
    const std::string mask =
        IpAddress::mask(route.destination.version(), route.prefixLength).text();
    InstanceBuilder builder(kClassName);
    builder.key("InstanceID", instanceIdOf(route, number))
        .label(titleOf(route))
        .text("DestinationAddress", route.destination.text())
        .text("DestinationMask", isV4 ? Fact<std::string>(mask) : Absence::Absent)
        .value<Uint8>("PrefixLength", route.prefixLength)
        .value<Uint16>("AddressType", isV4 ? kAddressTypeIpv4 : kAddressTypeIpv6)
        .value<Uint16>("RouteMetric",
                       Fact(std::optional(route.metric)).then(narrowedTo<Uint16, std::uint32_t>))
        .text("MetricText", std::to_string(route.metric))
        .value<Uint16>("TypeOfRoute", kActualRoute)
        .text("GatewayAddress", Fact(route.gateway).then(std::mem_fn(&IpAddress::text)))
        .text("InterfaceName", route.interfaceName);
    return builder.take();
}

}  // namespace cimomd
