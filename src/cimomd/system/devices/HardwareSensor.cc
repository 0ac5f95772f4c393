#include "system/devices/HardwareSensor.h"

#include <algorithm>
#include <array>
#include <tuple>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/devices/DeviceFiles.h"
#include "text/NaturalOrder.h"

namespace cimomd {
namespace {

using Kind = HardwareSensor::Kind;

struct KindPrefix {
    Kind kind;
    std::string_view prefix;
};
constexpr std::array<KindPrefix, 6> kKinds{{{Kind::Temperature, "temp"},
                                            {Kind::Fan, "fan"},
                                            {Kind::Voltage, "in"},
                                            {Kind::Current, "curr"},
                                            {Kind::Power, "power"},
                                            {Kind::Humidity, "humidity"}}};

constexpr std::string_view kReadingSuffix = "_input";

// Absolute zero, and what no sensor survives: drives and sockets without one give such numbers.
constexpr std::int64_t kLeastMillidegrees = -273150;
constexpr std::int64_t kMostMillidegrees = 1000000;

/// A chip's directory and what its sensors share.
struct Chip {
    std::filesystem::path directory;
    std::string number;
    std::string name;
    std::string id;
};

Chip readChip(const std::filesystem::path& directory, const std::string& number) {
    Chip chip{directory, number, readFact(directory / "name").value_or(number), ""};
    std::error_code error;
    const auto device = std::filesystem::read_symlink(directory / "device", error);
    chip.id = error ? chip.name : chip.name + "@" + device.filename().string();
    return chip;
}

/// Chips that nothing but the kernel's number tells apart are numbered in its order.
void makeIdsUnique(std::vector<Chip>& chips) {
    for (std::size_t i = 0; i < chips.size();) {
        const std::string id = chips[i].id;
        std::size_t copy = 1;
        for (++i; i < chips.size() && chips[i].id == id; ++i)
            chips[i].id += "#" + std::to_string(++copy);
    }
}

std::vector<Chip> readChips(const std::filesystem::path& directory,
                            const std::vector<std::string>& names) {
    std::vector<Chip> chips;
    chips.reserve(names.size());
    for (const std::string& name : names)
        chips.push_back(readChip(directory / name, name));
    std::sort(chips.begin(), chips.end(), [](const Chip& a, const Chip& b) {
        return a.id != b.id ? naturallyBefore(a.id, b.id) : naturallyBefore(a.number, b.number);
    });
    makeIdsUnique(chips);
    return chips;
}

Fact<std::int64_t> readValue(const std::filesystem::path& path, Kind kind) {
    return readSignedNumber(path).then([kind](std::int64_t value) {
        const bool isPossible =
            kind != Kind::Temperature || (value > kLeastMillidegrees && value < kMostMillidegrees);
        return isPossible ? std::optional(value) : std::nullopt;
    });
}

bool hasSpeedControl(const Chip& chip, const SensorChannel& channel) {
    constexpr std::size_t kFanPrefix = 3;
    std::error_code error;
    return channel.kind == Kind::Fan &&
           std::filesystem::exists(chip.directory / ("pwm" + channel.name.substr(kFanPrefix)),
                                   error);
}

HardwareSensor readSensor(const Chip& chip, const SensorChannel& channel) {
    const auto file = [&](const char* suffix) { return chip.directory / (channel.name + suffix); };
    const auto value = [&](const char* suffix) { return readValue(file(suffix), channel.kind); };
    HardwareSensor out;
    out.kind = channel.kind;
    out.id = chip.id + "/" + channel.name;
    out.chip = chip.name;
    out.channel = channel.name;
    out.label = readFact(file("_label"));
    out.reading = value("_input");
    out.min = value("_min");
    out.max = value("_max");
    out.lowerCritical = value("_lcrit");
    out.upperCritical = value("_crit");
    out.emergency = value("_emergency");
    out.fault = readSwitch(file("_fault"));
    out.alarm = readSwitch(file("_alarm"));
    out.targetRpm = readNumber(file("_target"));
    out.hasSpeedControl = hasSpeedControl(chip, channel);
    return out;
}

std::vector<SensorChannel> channelsOf(const Chip& chip) {
    std::vector<SensorChannel> channels;
    for (const std::string& fileName :
         listDirectory(chip.directory).value_or(std::vector<std::string>())) {
        if (auto channel = parseSensorFile(fileName))
            channels.push_back(std::move(*channel));
    }
    std::sort(channels.begin(), channels.end(), [](const SensorChannel& a, const SensorChannel& b) {
        return a.kind != b.kind ? a.kind < b.kind : naturallyBefore(a.name, b.name);
    });
    return channels;
}

}  // namespace

std::optional<SensorChannel> parseSensorFile(std::string_view fileName) {
    if (fileName.size() <= kReadingSuffix.size() ||
        fileName.substr(fileName.size() - kReadingSuffix.size()) != kReadingSuffix)
        return std::nullopt;
    const std::string_view name = fileName.substr(0, fileName.size() - kReadingSuffix.size());
    for (const auto& [kind, prefix] : kKinds) {
        if (name.substr(0, prefix.size()) == prefix && parseUnsigned(name.substr(prefix.size())))
            return SensorChannel{kind, std::string(name)};
    }
    return std::nullopt;
}

Fact<std::vector<HardwareSensor>> readHardwareSensors(const std::filesystem::path& directory) {
    const auto names = listDirectory(directory);
    if (!names)
        return names.reason();
    std::vector<HardwareSensor> sensors;
    for (const Chip& chip : readChips(directory, *names)) {
        for (const SensorChannel& channel : channelsOf(chip))
            sensors.push_back(readSensor(chip, channel));
    }
    return sensors;
}

}  // namespace cimomd
