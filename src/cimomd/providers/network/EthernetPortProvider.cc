#include "providers/network/EthernetPortProvider.h"

#include "providers/InstanceBuilder.h"
#include "providers/network/NetworkPort.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;

constexpr Uint16 kLinkTechnologyEthernet = 2;

// CIM_EthernetPort.PortType
constexpr Uint16 kPortTypeOther = 1;

/// The standard has numbers for speeds on twisted pair; for fibre it tells wave lengths apart,
/// which no driver names.
Fact<Uint16> portTypeOf(const Fact<PortConnector>& connector, const Fact<std::uint64_t>& speed) {
    if (!connector)
        return connector.reason();
    if (connector != PortConnector::TwistedPair)
        return kPortTypeOther;
    return speed.then([](std::uint64_t mbps) -> Uint16 {
        switch (mbps) {
            case 10:
                return 50;
            case 100:
                return 52;
            case 1000:
                return 53;
            case 2500:
                return 54;
            case 10000:
                return 55;
            default:
                return kPortTypeOther;
        }
    });
}

const char* textOf(PortConnector connector) {
    switch (connector) {
        case PortConnector::TwistedPair:
            return "Twisted Pair";
        case PortConnector::Aui:
            return "AUI";
        case PortConnector::Mii:
            return "MII";
        case PortConnector::Fibre:
            return "Fibre";
        case PortConnector::Bnc:
            return "BNC";
        case PortConnector::DirectAttach:
            return "Direct Attach Copper";
    }
    return "";
}

Fact<std::string> otherPortTypeOf(const Fact<Uint16>& type, const Fact<PortConnector>& connector) {
    if (type != kPortTypeOther)
        return Absence::Absent;
    return connector.then([](PortConnector known) { return std::string(textOf(known)); });
}

}  // namespace

ProvidedInstance EthernetPortProvider::publish(const std::string& hostName,
                                               const NetworkInterface& interface,
                                               const LinkSettings& link) {
    const Fact<Uint16> type = portTypeOf(link.connector, interface.speedMbps);
    InstanceBuilder builder(kClassName);
    describePort(builder, hostName, interface, link);
    builder.value<Uint16>("LinkTechnology", kLinkTechnologyEthernet)
        .value<Uint16>("PortType", type)
        .text("OtherPortType", otherPortTypeOf(type, link.connector));
    return builder.take();
}

}  // namespace cimomd
