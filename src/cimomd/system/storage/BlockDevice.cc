#include "system/storage/BlockDevice.h"

#include <algorithm>
#include <limits>

#include "files/TextFile.h"
#include "text/DeviceNameOrder.h"

namespace cimomd {

BlockDevice readBlockDevice(const std::filesystem::path& directory) {
    BlockDevice out;
    out.name = deviceNameOf(directory.filename().string());
    out.sizeSectors = readSectors(directory / "size");
    out.logicalBlockBytes =
        readNumber(directory / "queue/logical_block_size").then([](std::uint64_t bytes) {
            return bytes == 0 ? std::nullopt : std::optional(bytes);
        });
    out.isReadOnly = readFlag(directory / "ro");
    out.isRemovable = readFlag(directory / "removable");
    out.isRotational = readFlag(directory / "queue/rotational");
    return out;
}

std::string deviceNameOf(std::string_view entry) {
    std::string name(entry);
    std::replace(name.begin(), name.end(), '!', '/');
    return name;
}

Fact<std::vector<std::string>> listDevices(const std::filesystem::path& directory) {
    return listDirectory(directory).then([](std::vector<std::string> names) {
        std::sort(names.begin(), names.end(), deviceNameLess);
        return std::optional(std::move(names));
    });
}

Fact<bool> readFlag(const std::filesystem::path& file) {
    return readNumber(file).then([](std::uint64_t number) {
        return number > 1 ? std::nullopt : std::optional(number == 1);
    });
}

Fact<std::uint64_t> readSectors(const std::filesystem::path& file) {
    return readNumber(file).then([](std::uint64_t sectors) {
        const bool fits = sectors <= std::numeric_limits<std::uint64_t>::max() / kSectorBytes;
        return fits ? std::optional(sectors) : std::nullopt;
    });
}

}  // namespace cimomd
