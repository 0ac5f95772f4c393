#include "providers/network/NetworkPort.h"

#include <algorithm>

#include "providers/EnumeratedValues.h"
#include "providers/RecordStream.h"
#include "system/Narrowing.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

constexpr Uint64 kBitsPerMbit = 1000000;
constexpr std::uint64_t kInterfaceUp = 1;

/// The driver knows best; sysfs tells whether the address in use is that one.
Fact<std::string> permanentAddress(const NetworkInterface& interface, const LinkSettings& link) {
    Fact<std::string> known = addressDigits(link.permanentAddress);
    if (known || interface.addressIsPermanent != true)
        return known;
    return addressDigits(interface.address);
}

Fact<std::vector<std::string>> addressesInUse(const NetworkInterface& interface) {
    return addressDigits(interface.address).then([](const std::string& digits) {
        return std::vector{digits};
    });
}

}  // namespace

Fact<std::string> addressDigits(const Fact<std::string>& address) {
    return address.then([](const std::string& written) -> std::optional<std::string> {
        std::string digits;
        for (const char c : written) {
            if (c != ':')
                digits += c >= 'a' && c <= 'f' ? static_cast<char>(c - 'a' + 'A') : c;
        }
        if (digits.find_first_not_of('0') == std::string::npos)
            return std::nullopt;
        return digits;
    });
}

Uint16 operationalStatusOf(const NetworkInterface& interface) {
    const Fact<std::string>& state = interface.operationalState;
    if (state == "up")
        return kOperationalOk;
    if (state == "down" || state == "lowerlayerdown" || state == "notpresent")
        return kOperationalStopped;
    if (state == "dormant")
        return kOperationalDormant;
    if (state == "testing")
        return kOperationalInService;
    if (!interface.hasCarrier)
        return kOperationalUnknown;
    return *interface.hasCarrier ? kOperationalOk : kOperationalStopped;
}

Fact<Uint16> enabledStateOf(const NetworkInterface& interface) {
    return interface.flags.then([&interface](std::uint64_t flags) {
        if ((flags & kInterfaceUp) == 0)
            return kDisabled;
        const bool isWorking = operationalStatusOf(interface) != kOperationalStopped;
        return isWorking ? kEnabled : kEnabledButOffline;
    });
}

std::unique_ptr<InstanceStream> streamInterfaces(
    const SystemPaths& paths, const SystemCalls& calls,
    const std::function<bool(const NetworkInterface&)>& isWanted,
    const std::function<ProvidedInstance(const std::string&, const NetworkInterface&)>& publish) {
    const auto interfaces = readNetworkInterfaces(paths.networkInterfaces(), calls);
    if (!interfaces)
        return std::make_unique<EmptyStream>(interfaces.reason());
    std::vector<NetworkInterface> wanted;
    std::copy_if(interfaces->begin(), interfaces->end(), std::back_inserter(wanted), isWanted);
    return std::make_unique<RecordStream<NetworkInterface>>(
        std::move(wanted),
        [publish, hostName = readHostName(paths)](const NetworkInterface& interface) {
            return publish(hostName, interface);
        });
}

void describePort(InstanceBuilder& builder, const std::string& hostName,
                  const NetworkInterface& interface, const LinkSettings& link) {
    const auto bitsPerSecond = [](std::uint64_t mbps) { return Uint64{mbps} * kBitsPerMbit; };
    builder.label(interface.name)
        .text("Name", interface.name)
        .values<Uint16>("OperationalStatus", {operationalStatusOf(interface)})
        .enumerated("EnabledState", enabledStateOf(interface))
        .deviceKeys(hostName, interface.name)
        .value<Uint64>("Speed", interface.speedMbps.then(bitsPerSecond))
        .text("PermanentAddress", permanentAddress(interface, link))
        .texts("NetworkAddresses", addressesInUse(interface))
        .value<Pegasus::Boolean>("FullDuplex", interface.fullDuplex)
        .value<Uint64>("ActiveMaximumTransmissionUnit", interface.mtuBytes)
        .value<Uint32>("SpeedMbps", interface.speedMbps.then(narrowedToCount<std::uint64_t>))
        .text("DriverName", interface.driver)
        .text("BusAddress", interface.busAddress);
}

}  // namespace cimomd
