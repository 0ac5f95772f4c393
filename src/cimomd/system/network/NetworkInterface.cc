#include "system/network/NetworkInterface.h"

#include "files/TextFields.h"
#include "files/TextFile.h"

namespace cimomd {
namespace {

bool isThere(const std::filesystem::path& path) {
    std::error_code error;
    return std::filesystem::exists(std::filesystem::symlink_status(path, error));
}

std::optional<bool> duplexOf(const std::optional<std::string>& text) {
    if (text == "full")
        return true;
    if (text == "half")
        return false;
    return std::nullopt;
}

NetworkInterface readInterface(const std::filesystem::path& directory, const std::string& name) {
    NetworkInterface out;
    out.name = name;
    out.address = readFact(directory / "address");
    if (const auto assignment = readNumber(directory / "addr_assign_type"))
        out.addressIsPermanent = *assignment == 0;
    out.linkType = readNumber(directory / "type");
    out.mtuBytes = readNumber(directory / "mtu");
    out.operationalState = readFact(directory / "operstate");
    if (const auto flags = readFact(directory / "flags"))
        out.flags = parseHexadecimal(*flags);
    const auto speed = readNumber(directory / "speed");
    // An unknown speed is -1, which some drivers show as the largest unsigned number.
    if (speed && *speed > 0 && *speed < UINT32_MAX)
        out.speedMbps = speed;
    out.fullDuplex = duplexOf(readFact(directory / "duplex"));
    out.hasDevice = isThere(directory / "device");
    out.isWireless = isThere(directory / "phy80211") || isThere(directory / "wireless");
    return out;
}

}  // namespace

std::optional<std::vector<NetworkInterface>> readNetworkInterfaces(
    const std::filesystem::path& directory) {
    const auto names = listDirectory(directory);
    if (!names)
        return std::nullopt;
    std::vector<NetworkInterface> out;
    for (const std::string& name : *names) {
        std::error_code error;
        if (std::filesystem::is_directory(directory / name, error))
            out.push_back(readInterface(directory / name, name));
    }
    return out;
}

}  // namespace cimomd
