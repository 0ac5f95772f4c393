#include "providers/network/EthernetPortProvider.h"

#include <algorithm>
#include <limits>

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

constexpr Uint64 kBitsPerMbit = 1000000;
constexpr std::uint64_t kInterfaceUp = 1;
constexpr Uint16 kLinkTechnologyEthernet = 2;

/// CIM writes hardware addresses as hexadecimal digits only, in upper case.
std::optional<std::string> digitsOf(const std::optional<std::string>& address) {
    if (!address)
        return std::nullopt;
    std::string digits;
    for (const char c : *address) {
        if (c != ':')
            digits += c >= 'a' && c <= 'f' ? static_cast<char>(c - 'a' + 'A') : c;
    }
    return digits;
}

Uint16 operationalStatusOf(const std::optional<std::string>& state) {
    if (state == "up")
        return kOperationalOk;
    if (state == "down" || state == "lowerlayerdown" || state == "notpresent")
        return kOperationalStopped;
    if (state == "dormant")
        return kOperationalDormant;
    if (state == "testing")
        return kOperationalInService;
    return kOperationalUnknown;
}

std::optional<Uint16> enabledStateOf(const NetworkInterface& interface) {
    if (!interface.flags)
        return std::nullopt;
    if ((*interface.flags & kInterfaceUp) == 0)
        return kDisabled;
    const bool isWorking = operationalStatusOf(interface.operationalState) != kOperationalStopped;
    return isWorking ? kEnabled : kEnabledButOffline;
}

std::optional<Uint64> bitsPerSecond(const std::optional<std::uint64_t>& speedMbps) {
    if (!speedMbps || *speedMbps > std::numeric_limits<Uint64>::max() / kBitsPerMbit)
        return std::nullopt;
    return *speedMbps * kBitsPerMbit;
}

std::optional<Uint32> narrowed(const std::optional<std::uint64_t>& value) {
    if (!value || *value > std::numeric_limits<Uint32>::max())
        return std::nullopt;
    return static_cast<Uint32>(*value);
}

std::vector<NetworkInterface> ethernetPorts(std::vector<NetworkInterface> interfaces) {
    interfaces.erase(std::remove_if(interfaces.begin(), interfaces.end(),
                                    [](const auto& entry) { return !entry.isEthernetPort(); }),
                     interfaces.end());
    return interfaces;
}

}  // namespace

std::unique_ptr<InstanceStream> EthernetPortProvider::enumerate() const {
    auto interfaces = readNetworkInterfaces(paths.networkInterfaces());
    if (!interfaces)
        throw ProviderError("the network interfaces in /sys/class/net cannot be read");
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<NetworkInterface>>(
        ethernetPorts(std::move(*interfaces)),
        [hostName](const NetworkInterface& interface) { return publish(hostName, interface); });
}

ProvidedInstance EthernetPortProvider::publish(const std::string& hostName,
                                               const NetworkInterface& interface) {
    const std::optional<std::string> address = digitsOf(interface.address);
    InstanceBuilder builder(kClassName);
    builder.label(interface.name)
        .text("Name", interface.name)
        .values<Uint16>("OperationalStatus", {operationalStatusOf(interface.operationalState)})
        .value<Uint16>("EnabledState", enabledStateOf(interface))
        .deviceKeys(hostName, interface.name)
        .value<Uint64>("Speed", bitsPerSecond(interface.speedMbps))
        .text("PermanentAddress", interface.addressIsPermanent == true ? address : std::nullopt)
        .texts("NetworkAddresses", address ? std::vector{*address} : std::vector<std::string>())
        .value<Uint16>("LinkTechnology", kLinkTechnologyEthernet)
        .value<Pegasus::Boolean>("FullDuplex", interface.fullDuplex)
        .value<Uint64>("ActiveMaximumTransmissionUnit", interface.mtuBytes)
        .value<Uint32>("SpeedMbps", narrowed(interface.speedMbps));
    return builder.take();
}

}  // namespace cimomd
