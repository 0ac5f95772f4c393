#include "providers/processor/ProcessorNumbers.h"

#include <algorithm>
#include <array>

namespace cimomd {
namespace {

struct Range {
    std::uint16_t first;
    std::uint16_t last;
};

/// The families of the standard's list, which ends with those of SMBIOS 3.0; without 190, which two
/// makers have used.
constexpr std::array kFamilies{Range{1, 21},    Range{24, 44},   Range{48, 88},   Range{96, 105},
                               Range{112, 112}, Range{120, 122}, Range{128, 128}, Range{130, 150},
                               Range{160, 189}, Range{191, 206}, Range{210, 219}, Range{221, 224},
                               Range{228, 239}, Range{250, 251}, Range{256, 257}, Range{260, 261},
                               Range{280, 281}, Range{300, 302}, Range{320, 320}, Range{350, 350},
                               Range{500, 500}};

constexpr std::uint8_t kLastUpgradeMethod = 60;

}  // namespace

std::uint16_t processorFamilyOf(std::uint16_t smbiosFamily) {
    const bool isListed =
        std::any_of(kFamilies.begin(), kFamilies.end(), [smbiosFamily](const Range& range) {
            return smbiosFamily >= range.first && smbiosFamily <= range.last;
        });
    return isListed ? smbiosFamily : kProcessorOther;
}

std::uint16_t upgradeMethodOf(std::uint8_t smbiosUpgrade) {
    const bool isListed = smbiosUpgrade > 0 && smbiosUpgrade <= kLastUpgradeMethod;
    return isListed ? smbiosUpgrade : kProcessorOther;
}

}  // namespace cimomd
