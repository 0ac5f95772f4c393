#include "providers/network/WiFiPortProvider.h"

#include "providers/InstanceBuilder.h"
#include "providers/network/NetworkPort.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;

constexpr Uint16 kLinkTechnologyWirelessLan = 11;

}  // namespace

ProvidedInstance WiFiPortProvider::publish(const std::string& hostName,
                                           const NetworkInterface& interface,
                                           const LinkSettings& link) {
    InstanceBuilder builder(kClassName);
    describePort(builder, hostName, interface, link);
    // Which of the 802.11 standards is in use is not told where this looks.
    builder.value<Uint16>("LinkTechnology", kLinkTechnologyWirelessLan)
        .value<Uint16>("PortType", Absence::Absent)
        .text("OtherPortType", Absence::Absent);
    return builder.take();
}

}  // namespace cimomd
