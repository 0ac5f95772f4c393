#pragma once

// The routes of both versions of the internet protocol. Reads /proc/net/route and
// /proc/net/ipv6_route.

#include "providers/Provider.h"
#include "system/SystemPaths.h"
#include "system/network/RouteTable.h"

namespace cimomd {

class NextHopIpRouteProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_NextHopIPRoute";

    explicit NextHopIpRouteProvider(SystemPaths systemPaths) : paths(std::move(systemPaths)) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// `number` tells routes apart that are equal as far as the tables show them; it counts from 1.
    static ProvidedInstance publish(const Route& route, std::size_t number);

  private:
    SystemPaths paths;
};

}  // namespace cimomd
