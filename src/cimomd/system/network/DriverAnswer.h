#pragma once

// Ethtool's questions to the driver of a network interface, whose answers a driver that hangs may
// never give.

#include <array>
#include <cstddef>
#include <cstdint>

#include "system/network/LinkSettings.h"

namespace cimomd {

/// What the driver answered, in a form that needs no memory of its own.
struct DriverAnswer {
    static constexpr std::size_t kMaxAddressBytes = 32;

    /// The errno value of the question for the permanent address, 0 for none; then the address.
    int addressError = 0;
    std::array<char, kMaxAddressBytes> address{};
    std::uint32_t addressBytes = 0;
    /// The same for the connector: a PORT_ number of linux/ethtool.h.
    int portError = 0;
    std::uint32_t port = 0;
};

/// Asks the driver of an interface of the machine this runs on. May block for ever. Safe between
/// fork and exec of a process with threads.
void askDriver(const char* interfaceName, DriverAnswer& answer);

/// What the driver does not know is Absent.
LinkSettings linkSettingsOf(const DriverAnswer& answer);

}  // namespace cimomd
