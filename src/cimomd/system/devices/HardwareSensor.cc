#include "system/devices/HardwareSensor.h"

#include <algorithm>
#include <array>
#include <set>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/FileTexts.h"
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

constexpr std::array<const char*, 10> kValueSuffixes{"_input", "_label", "_min",       "_max",
                                                     "_lcrit", "_crit",  "_emergency", "_fault",
                                                     "_alarm", "_target"};

/// A chip's directory and what its sensors share.
struct Chip {
    std::filesystem::path directory;
    std::string number;
    std::string name;
    std::string id;
    std::set<std::string> fileNames;
    std::vector<SensorChannel> channels;
};

// Its name, unlike what its sensors measure, is no question to the chip.
Chip readChip(const std::filesystem::path& directory, const std::string& number) {
    Chip chip{directory, number, readFact(directory / "name").value_or(number), "", {}, {}};
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

Fact<std::int64_t> possibleValue(const Fact<std::int64_t>& number, Kind kind) {
    return number.then([kind](std::int64_t value) {
        const bool isPossible =
            kind != Kind::Temperature || (value > kLeastMillidegrees && value < kMostMillidegrees);
        return isPossible ? std::optional(value) : std::nullopt;
    });
}

bool hasSpeedControl(const Chip& chip, const SensorChannel& channel) {
    constexpr std::size_t kFanPrefix = 3;
    return channel.kind == Kind::Fan &&
           chip.fileNames.count("pwm" + channel.name.substr(kFanPrefix)) > 0;
}

HardwareSensor sensorOf(const Chip& chip, const SensorChannel& channel, const FileTexts& texts) {
    const auto file = [&](const char* suffix) { return chip.directory / (channel.name + suffix); };
    const auto value = [&](const char* suffix) {
        return possibleValue(texts.signedNumber(file(suffix)), channel.kind);
    };
    HardwareSensor out;
    out.kind = channel.kind;
    out.id = chip.id + "/" + channel.name;
    out.chip = chip.name;
    out.channel = channel.name;
    out.label = texts.fact(file("_label"));
    out.reading = value("_input");
    out.min = value("_min");
    out.max = value("_max");
    out.lowerCritical = value("_lcrit");
    out.upperCritical = value("_crit");
    out.emergency = value("_emergency");
    out.fault = texts.switchState(file("_fault"));
    out.alarm = texts.switchState(file("_alarm"));
    out.targetRpm = texts.number(file("_target"));
    out.hasSpeedControl = hasSpeedControl(chip, channel);
    return out;
}

/// Without the kinds that `isWanted` refuses.
void listChannels(Chip& chip, bool (*isWanted)(Kind)) {
    const auto names = listDirectory(chip.directory).value_or(std::vector<std::string>());
    chip.fileNames.insert(names.begin(), names.end());
    for (const std::string& fileName : names) {
        auto channel = parseSensorFile(fileName);
        if (channel && isWanted(channel->kind))
            chip.channels.push_back(std::move(*channel));
    }
    std::sort(chip.channels.begin(), chip.channels.end(),
              [](const SensorChannel& a, const SensorChannel& b) {
                  return a.kind != b.kind ? a.kind < b.kind : naturallyBefore(a.name, b.name);
              });
}

/// Those that are there: each that is asked for costs a question to the chip.
std::vector<std::filesystem::path> filesOf(const std::vector<Chip>& chips) {
    std::vector<std::filesystem::path> files;
    for (const Chip& chip : chips) {
        for (const SensorChannel& channel : chip.channels) {
            for (const char* suffix : kValueSuffixes) {
                if (chip.fileNames.count(channel.name + suffix) > 0)
                    files.push_back(chip.directory / (channel.name + suffix));
            }
        }
    }
    return files;
}

Fact<std::vector<HardwareSensor>> readSensors(const std::filesystem::path& directory,
                                              const SystemCalls& calls, bool (*isWanted)(Kind)) {
    const auto numbers = listDirectory(directory);
    if (!numbers)
        return numbers.reason();
    std::vector<Chip> chips = readChips(directory, *numbers);
    for (Chip& chip : chips)
        listChannels(chip, isWanted);
    const FileTexts texts(TextSource::Sensors, filesOf(chips), calls);
    std::vector<HardwareSensor> sensors;
    for (const Chip& chip : chips) {
        for (const SensorChannel& channel : chip.channels)
            sensors.push_back(sensorOf(chip, channel, texts));
    }
    return sensors;
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

Fact<std::vector<HardwareSensor>> readHardwareSensors(const std::filesystem::path& directory,
                                                      const SystemCalls& calls) {
    return readSensors(directory, calls, [](Kind) { return true; });
}

Fact<std::vector<HardwareSensor>> readFans(const std::filesystem::path& directory,
                                           const SystemCalls& calls) {
    return readSensors(directory, calls, [](Kind kind) { return kind == Kind::Fan; });
}

}  // namespace cimomd
