#include "system/processor/ArmProcessorNames.h"

#include <algorithm>
#include <array>
#include <cstdint>

#include "files/TextFields.h"

namespace cimomd {
namespace {

struct Name {
    std::uint64_t number;
    std::string_view text;
};

constexpr std::uint64_t kArm = 0x41;

constexpr std::array kImplementers{
    Name{kArm, "ARM"},      Name{0x42, "Broadcom"},  Name{0x43, "Cavium"},  Name{0x44, "DEC"},
    Name{0x46, "Fujitsu"},  Name{0x48, "HiSilicon"}, Name{0x4e, "NVIDIA"},  Name{0x50, "APM"},
    Name{0x51, "Qualcomm"}, Name{0x53, "Samsung"},   Name{0x56, "Marvell"}, Name{0x61, "Apple"},
    Name{0x69, "Intel"},    Name{0x6d, "Microsoft"}, Name{0x70, "Phytium"}, Name{0xc0, "Ampere"}};

constexpr std::array kArmParts{
    Name{0xb76, "ARM1176"},     Name{0xc05, "Cortex-A5"},   Name{0xc07, "Cortex-A7"},
    Name{0xc08, "Cortex-A8"},   Name{0xc09, "Cortex-A9"},   Name{0xc0d, "Cortex-A17"},
    Name{0xc0e, "Cortex-A17"},  Name{0xc0f, "Cortex-A15"},  Name{0xd02, "Cortex-A34"},
    Name{0xd03, "Cortex-A53"},  Name{0xd04, "Cortex-A35"},  Name{0xd05, "Cortex-A55"},
    Name{0xd07, "Cortex-A57"},  Name{0xd08, "Cortex-A72"},  Name{0xd09, "Cortex-A73"},
    Name{0xd0a, "Cortex-A75"},  Name{0xd0b, "Cortex-A76"},  Name{0xd0c, "Neoverse-N1"},
    Name{0xd0d, "Cortex-A77"},  Name{0xd40, "Neoverse-V1"}, Name{0xd41, "Cortex-A78"},
    Name{0xd44, "Cortex-X1"},   Name{0xd46, "Cortex-A510"}, Name{0xd47, "Cortex-A710"},
    Name{0xd49, "Neoverse-N2"}, Name{0xd4f, "Neoverse-V2"}};

template <typename Names>
std::optional<std::string_view> find(const Names& names, std::optional<std::uint64_t> number) {
    const auto place = std::find_if(names.begin(), names.end(),
                                    [number](const Name& name) { return name.number == number; });
    return place == names.end() ? std::nullopt : std::optional(place->text);
}

}  // namespace

std::optional<std::string_view> armImplementerName(std::string_view implementer) {
    return find(kImplementers, parseHexadecimal(implementer));
}

std::optional<std::string_view> armPartName(std::string_view implementer, std::string_view part) {
    if (parseHexadecimal(implementer) != kArm)
        return std::nullopt;
    return find(kArmParts, parseHexadecimal(part));
}

}  // namespace cimomd
