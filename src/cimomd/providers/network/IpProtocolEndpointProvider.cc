#include "providers/network/IpProtocolEndpointProvider.h"

#include <fmt/format.h>
#include <linux/if_addr.h>

#include <algorithm>

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/computer/SystemIdentity.h"
#include "text/NaturalOrder.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint8;

// CIM_IPProtocolEndpoint.ProtocolIFType
constexpr Uint16 kIfTypeIpv4 = 4096;
constexpr Uint16 kIfTypeIpv6 = 4097;

// CIM_IPProtocolEndpoint.AddressOrigin
constexpr Uint16 kOriginNotApplicable = 2;
constexpr Uint16 kOriginStatic = 3;
constexpr Uint16 kOriginDhcp = 4;
constexpr Uint16 kOriginIpv4LinkLocal = 6;
constexpr Uint16 kOriginDhcpv6 = 7;
constexpr Uint16 kOriginStateless = 9;
constexpr Uint16 kOriginLinkLocal = 10;

/// What the kernel set by itself, when it says so: kernels before 5.18 do not, nor do they know who
/// among the programs set an address.
std::optional<Uint16> originFromKernel(const InterfaceAddress& address) {
    switch (address.origin) {
        case IFAPROT_KERNEL_LO:
            return kOriginNotApplicable;
        case IFAPROT_KERNEL_RA:
            return kOriginStateless;
        case IFAPROT_KERNEL_LL:
            return kOriginLinkLocal;
        default:
            return std::nullopt;
    }
}

/// A server that lends an address says until when; a DHCPv6 server lends single addresses, a router
/// announces the prefix of a network.
Uint16 originOf(const InterfaceAddress& address) {
    const bool isV4 = address.local.version() == IpAddress::Version::V4;
    if (const auto known = originFromKernel(address))
        return *known;
    if (address.local.isLoopback())
        return kOriginNotApplicable;
    if (address.local.isLinkLocal())
        return isV4 ? kOriginIpv4LinkLocal : kOriginLinkLocal;
    if (!address.validSeconds)
        return kOriginStatic;
    if (isV4)
        return kOriginDhcp;
    return address.prefixLength == address.local.bits() ? kOriginDhcpv6 : kOriginStateless;
}

Uint16 statusOf(const InterfaceAddress& address) {
    if ((address.flags & IFA_F_DADFAILED) != 0)
        return kOperationalError;
    return (address.flags & IFA_F_TENTATIVE) != 0 ? kOperationalStarting : kOperationalOk;
}

std::string withPrefix(const InterfaceAddress& address) {
    const std::string local = address.local.text();
    if (address.peer)
        return fmt::format("{} peer {}/{}", local, address.peer->text(), address.prefixLength);
    return fmt::format("{}/{}", local, address.prefixLength);
}

bool before(const InterfaceAddress& a, const InterfaceAddress& b) {
    if (a.interfaceName != b.interfaceName)
        return naturallyBefore(a.interfaceName, b.interfaceName);
    return std::tie(a.local, a.peer, a.prefixLength) < std::tie(b.local, b.peer, b.prefixLength);
}

}  // namespace

std::unique_ptr<InstanceStream> IpProtocolEndpointProvider::enumerate() const {
    const auto known = calls.interfaceAddresses();
    if (!known)
        return std::make_unique<EmptyStream>(known.reason());
    std::vector<InterfaceAddress> addresses = *known;
    std::sort(addresses.begin(), addresses.end(), before);
    return std::make_unique<RecordStream<InterfaceAddress>>(
        std::move(addresses), [hostName = readHostName(paths)](const InterfaceAddress& address) {
            return publish(hostName, address);
        });
}

ProvidedInstance IpProtocolEndpointProvider::publish(const std::string& hostName,
                                                     const InterfaceAddress& address) {
    const bool isV4 = address.local.version() == IpAddress::Version::V4;
    const Fact<std::string> text(address.local.text());
    const std::string mask = IpAddress::mask(address.local.version(), address.prefixLength).text();
    const std::string title = withPrefix(address);
    InstanceBuilder builder(kClassName);
    builder.label(title)
        .values<Uint16>("OperationalStatus", {statusOf(address)})
        .value<Uint16>("EnabledState", kStateNotApplicable)
        .serviceKeys(hostName, fmt::format("{} {}", address.interfaceName, title))
        .value<Uint16>("ProtocolIFType", isV4 ? kIfTypeIpv4 : kIfTypeIpv6)
        .text("IPv4Address", isV4 ? text : Absence::Absent)
        .text("SubnetMask", isV4 ? Fact<std::string>(mask) : Absence::Absent)
        .text("IPv6Address", isV4 ? Absence::Absent : text)
        .value<Uint8>("PrefixLength", isV4 ? Fact<Uint8>() : Fact<Uint8>(address.prefixLength))
        .value<Uint16>("AddressOrigin", originOf(address))
        .text("InterfaceName", address.interfaceName)
        .text("AddressWithPrefix", title);
    return builder.take();
}

}  // namespace cimomd
