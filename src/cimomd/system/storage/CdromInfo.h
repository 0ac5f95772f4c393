#pragma once

// /proc/sys/dev/cdrom/info: a table of all optical drives, one column for each.

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>

namespace cimomd {

/// What a drive can do; nothing where the table does not say.
struct CdromAbilities {
    std::optional<std::uint64_t> speed;
    std::optional<bool> writesCdR;
    std::optional<bool> writesCdRw;
    std::optional<bool> readsDvd;
    std::optional<bool> writesDvdR;
    std::optional<bool> writesDvdRam;
};

/// By the name of the drive, for example "sr0".
std::map<std::string, CdromAbilities> parseCdromInfo(std::string_view text);

}  // namespace cimomd
