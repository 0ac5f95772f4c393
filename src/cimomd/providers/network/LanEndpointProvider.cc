#include "providers/network/LanEndpointProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/network/NetworkPort.h"
#include "system/Narrowing.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;

// CIM_ProtocolEndpoint.ProtocolIFType: the interface types of IANA's ifType registry.
constexpr Uint16 kIfTypeOther = 1;
constexpr Uint16 kIfTypeEthernet = 6;
constexpr Uint16 kIfTypeVirtual = 53;
constexpr Uint16 kIfTypeWireless = 71;
constexpr Uint16 kIfTypeVlan = 135;
constexpr Uint16 kIfTypeAggregate = 161;
constexpr Uint16 kIfTypeInfiniBand = 199;
constexpr Uint16 kIfTypeBridge = 209;

// ARPHRD numbers of /sys/class/net/NAME/type.
constexpr std::uint64_t kLinkEthernet = 1;
constexpr std::uint64_t kLinkInfiniBand = 32;

constexpr std::size_t kMacDigits = 12;

Fact<Uint16> interfaceTypeOf(const NetworkInterface& interface) {
    if (!interface.linkType)
        return interface.linkType.reason();
    if (interface.linkType == kLinkInfiniBand)
        return kIfTypeInfiniBand;
    if (interface.linkType != kLinkEthernet)
        return kIfTypeOther;
    if (interface.isWireless || interface.kind == "wlan")
        return kIfTypeWireless;
    if (interface.kind == "vlan")
        return kIfTypeVlan;
    if (interface.kind == "bond")
        return kIfTypeAggregate;
    if (interface.kind == "bridge")
        return kIfTypeBridge;
    return interface.hasDevice ? kIfTypeEthernet : kIfTypeVirtual;
}

Fact<std::string> macAddress(const NetworkInterface& interface) {
    return addressDigits(interface.address).then([](const std::string& digits) {
        return digits.size() == kMacDigits ? std::optional(digits) : std::nullopt;
    });
}

Fact<Uint32> dataBits(const Fact<std::uint64_t>& mtuBytes) {
    return mtuBytes.then([](std::uint64_t bytes) {
        const auto narrow = narrowedToCount(bytes);
        return narrow ? narrowedToCount(std::uint64_t{*narrow} * 8) : std::nullopt;
    });
}

}  // namespace

std::unique_ptr<InstanceStream> LanEndpointProvider::enumerate() const {
    const auto isWanted = [](const NetworkInterface& interface) {
        return addressDigits(interface.address).has_value();
    };
    return streamInterfaces(paths, calls, isWanted, &LanEndpointProvider::publish);
}

ProvidedInstance LanEndpointProvider::publish(const std::string& hostName,
                                              const NetworkInterface& interface) {
    InstanceBuilder builder(kClassName);
    builder.label(interface.name)
        .values<Uint16>("OperationalStatus", {operationalStatusOf(interface)})
        .value<Uint16>("EnabledState", enabledStateOf(interface))
        .serviceKeys(hostName, interface.name)
        .value<Uint16>("ProtocolIFType", interfaceTypeOf(interface))
        .text("MACAddress", macAddress(interface))
        .value<Uint32>("MaxDataSize", dataBits(interface.mtuBytes))
        .value<Uint32>("MTU", interface.mtuBytes.then(narrowedToCount<std::uint64_t>));
    return builder.take();
}

}  // namespace cimomd
