#pragma once

// What ports and endpoints of all kinds tell about the network interface behind them.

#include <Pegasus/Common/CIMValue.h>

#include <functional>

#include "providers/InstanceBuilder.h"
#include "providers/InstanceStream.h"
#include "system/SystemPaths.h"
#include "system/network/LinkSettings.h"
#include "system/network/NetworkInterface.h"

namespace cimomd {

/// CIM writes hardware addresses as hexadecimal digits only, in upper case. Filtered when all
/// digits are 0, as of interfaces that need no address.
Fact<std::string> addressDigits(const Fact<std::string>& address);

/// CIM_ManagedSystemElement.OperationalStatus. An interface whose driver tells no state counts as
/// working when it has a link.
Pegasus::Uint16 operationalStatusOf(const NetworkInterface& interface);

/// CIM_EnabledLogicalElement.EnabledState.
Fact<Pegasus::Uint16> enabledStateOf(const NetworkInterface& interface);

/// The instances of those interfaces that `isWanted` takes; none when the kernel shows none.
std::unique_ptr<InstanceStream> streamInterfaces(
    const SystemPaths& paths, const SystemCalls& calls,
    const std::function<bool(const NetworkInterface&)>& isWanted,
    const std::function<ProvidedInstance(const std::string& hostName, const NetworkInterface&)>&
        publish);

/// The properties of CIM_NetworkPort that do not depend on the kind of the port, and those that our
/// own subclasses have in common.
void describePort(InstanceBuilder& builder, const std::string& hostName,
                  const NetworkInterface& interface, const LinkSettings& link);

}  // namespace cimomd
