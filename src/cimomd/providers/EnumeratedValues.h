#pragma once

// Numbers and bounds that the CIM schema gives a meaning, as far as several providers need them.

#include <cstddef>
#include <cstdint>

namespace cimomd {

// CIM_ManagedSystemElement.OperationalStatus
inline constexpr std::uint16_t kOperationalUnknown = 0;
inline constexpr std::uint16_t kOperationalOther = 1;
inline constexpr std::uint16_t kOperationalOk = 2;
inline constexpr std::uint16_t kOperationalDegraded = 3;
inline constexpr std::uint16_t kOperationalError = 6;
inline constexpr std::uint16_t kOperationalStarting = 8;
inline constexpr std::uint16_t kOperationalStopping = 9;
inline constexpr std::uint16_t kOperationalStopped = 10;
inline constexpr std::uint16_t kOperationalInService = 11;
inline constexpr std::uint16_t kOperationalNoContact = 12;
inline constexpr std::uint16_t kOperationalDormant = 15;
inline constexpr std::uint16_t kOperationalCompleted = 17;

// CIM_EnabledLogicalElement.EnabledState
inline constexpr std::uint16_t kEnabled = 2;
inline constexpr std::uint16_t kDisabled = 3;
inline constexpr std::uint16_t kShuttingDown = 4;
inline constexpr std::uint16_t kStateNotApplicable = 5;
inline constexpr std::uint16_t kEnabledButOffline = 6;
inline constexpr std::uint16_t kQuiesce = 9;
inline constexpr std::uint16_t kStarting = 10;

// CIM_ComputerSystem.Dedicated
inline constexpr std::uint16_t kNotDedicated = 0;

// The class of the computer: a key of everything that belongs to it.
inline constexpr const char* kComputerSystemClass = "Velmira_ComputerSystem";

// MaxLen of CIM_ManagedElement.Caption, of CIM_ManagedSystemElement.Name and of keys.
inline constexpr std::size_t kCaptionLength = 64;
inline constexpr std::size_t kNameLength = 1024;
inline constexpr std::size_t kSystemNameLength = 256;
inline constexpr std::size_t kDeviceIdLength = 64;

}  // namespace cimomd
