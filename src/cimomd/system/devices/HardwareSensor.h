#pragma once

// /sys/class/hwmon: what the monitoring chips of board, processor and drives measure.

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "system/Fact.h"
#include "system/SystemCalls.h"

namespace cimomd {

struct HardwareSensor {
    /// Kinds in the order in which the sensors of a chip are listed.
    enum class Kind : std::uint8_t { Temperature, Fan, Voltage, Current, Power, Humidity };

    Kind kind = Kind::Temperature;
    /// Chip, the device it is in and the channel, such as coretemp@coretemp.0/temp1. The number
    /// that the kernel gave the chip is not in it, since that changes from start to start.
    std::string id;
    std::string chip;
    /// Such as temp1.
    std::string channel;
    Fact<std::string> label;
    // In thousandths of degrees Celsius, of volts, of amperes or of percent, in millionths of
    // watts, in rotations per minute.
    Fact<std::int64_t> reading;
    Fact<std::int64_t> min;
    Fact<std::int64_t> max;
    Fact<std::int64_t> lowerCritical;
    Fact<std::int64_t> upperCritical;
    Fact<std::int64_t> emergency;
    /// Whether the chip takes the sensor for broken.
    Fact<bool> fault;
    Fact<bool> alarm;
    /// The speed a fan should have, in rotations per minute.
    Fact<std::uint64_t> targetRpm;
    /// Whether the chip sets the speed of the fan.
    bool hasSpeedControl = false;
};

/// What "temp1_input" and the like name; nothing for other files.
struct SensorChannel {
    HardwareSensor::Kind kind;
    /// Such as temp1.
    std::string name;
};
std::optional<SensorChannel> parseSensorFile(std::string_view fileName);

/// Chip by chip, in the order of the ids of the chips; missing when the directory cannot be read.
Fact<std::vector<HardwareSensor>> readHardwareSensors(const std::filesystem::path& directory,
                                                      const SystemCalls& calls);

/// The fans alone; no other sensor is asked.
Fact<std::vector<HardwareSensor>> readFans(const std::filesystem::path& directory,
                                           const SystemCalls& calls);

}  // namespace cimomd
