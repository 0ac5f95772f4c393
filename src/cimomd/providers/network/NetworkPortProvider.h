#pragma once

// What providers of network ports have in common: they read /sys/class/net and ask the drivers for
// the address burnt in and the connector.

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"
#include "system/network/NetworkInterface.h"

namespace cimomd {

class NetworkPortProvider : public Provider {
  public:
    std::unique_ptr<InstanceStream> enumerate() const override;

  protected:
    using Choice = bool (NetworkInterface::*)() const;
    using Publish = ProvidedInstance (*)(const std::string& hostName,
                                         const NetworkInterface& interface,
                                         const LinkSettings& link);

    /// The ports are the interfaces of which `isPort` is true. `systemCalls` must outlive the
    /// provider and its streams.
    NetworkPortProvider(SystemPaths systemPaths, const SystemCalls& systemCalls, Choice isPort,
                        Publish publishPort)
        : paths(std::move(systemPaths)),
          calls(systemCalls),
          choice(isPort),
          publisher(publishPort) {}

  private:
    SystemPaths paths;
    const SystemCalls& calls;
    Choice choice;
    Publish publisher;
};

}  // namespace cimomd
