#include "system/network/NetworkInterface.h"

#include <algorithm>
#include <limits>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/FileTexts.h"
#include "text/NaturalOrder.h"

namespace cimomd {
namespace {

constexpr std::uint64_t kEthernet = 1;

bool isThere(const std::filesystem::path& path) {
    std::error_code error;
    return std::filesystem::exists(std::filesystem::symlink_status(path, error));
}

Fact<bool> duplexOf(const Fact<std::string>& text) {
    return text.then(
        [](const std::string& word) {
            const bool isKnown = word == "full" || word == "half";
            return isKnown ? std::optional(word == "full") : std::nullopt;
        },
        Absence::Absent);
}

/// The kernel refuses to read link properties while an interface is down: there are none then.
template <typename T>
Fact<T> ofLink(const Fact<T>& fact) {
    return !fact && fact.reason() == Absence::Unreadable ? Fact<T>(Absence::Absent) : fact;
}

/// An unknown speed is -1, which some drivers show as the largest unsigned number.
Fact<std::uint64_t> speedOf(const Fact<std::int64_t>& number) {
    return ofLink(number).then(
        [](std::int64_t speed) {
            const bool isKnown = speed > 0 && speed <= std::numeric_limits<std::int32_t>::max();
            return isKnown ? std::optional(static_cast<std::uint64_t>(speed)) : std::nullopt;
        },
        Absence::Absent);
}

/// The value of a line `key=value` of a uevent file.
Fact<std::string> eventValue(const Fact<std::string>& event, std::string_view key) {
    return event.then(
        [key](const std::string& text) -> std::optional<std::string> {
            for (const std::string_view line : linesOf(text)) {
                const auto entry = keyValueOf(line, '=');
                if (entry && entry->key == key && !entry->value.empty())
                    return std::string(entry->value);
            }
            return std::nullopt;
        },
        Absence::Absent);
}

NetworkInterface readInterface(const std::filesystem::path& directory, const std::string& name,
                               const FileTexts& link) {
    NetworkInterface out;
    out.name = name;
    out.address = readFact(directory / "address");
    out.addressIsPermanent =
        readNumber(directory / "addr_assign_type").then([](std::uint64_t how) { return how == 0; });
    out.linkType = readNumber(directory / "type");
    out.mtuBytes = readNumber(directory / "mtu");
    out.operationalState = readFact(directory / "operstate");
    out.flags = readFact(directory / "flags").then([](const std::string& text) {
        return parseHexadecimal(text);
    });
    out.hasCarrier = ofLink(link.number(directory / "carrier")).then([](std::uint64_t carrier) {
        return carrier != 0;
    });
    out.speedMbps = speedOf(link.signedNumber(directory / "speed"));
    out.fullDuplex = duplexOf(ofLink(link.fact(directory / "duplex")));
    out.kind = eventValue(readFact(directory / "uevent"), "DEVTYPE");
    const Fact<std::string> deviceEvent = readFact(directory / "device" / "uevent");
    out.driver = eventValue(deviceEvent, "DRIVER");
    out.busAddress = eventValue(deviceEvent, "PCI_SLOT_NAME");
    // A virtio device is the only child of the PCI device that carries it.
    if (!out.busAddress)
        out.busAddress =
            eventValue(readFact(directory / "device" / ".." / "uevent"), "PCI_SLOT_NAME");
    out.hasDevice = isThere(directory / "device");
    out.isWireless = isThere(directory / "phy80211") || isThere(directory / "wireless");
    return out;
}

/// The files for which the kernel asks the driver.
FileTexts readLinks(const std::vector<std::filesystem::path>& interfaces,
                    const SystemCalls& calls) {
    std::vector<std::filesystem::path> files;
    for (const std::filesystem::path& directory : interfaces) {
        for (const char* name : {"carrier", "speed", "duplex"})
            files.push_back(directory / name);
    }
    return {TextSource::NetworkDrivers, files, calls};
}

}  // namespace

bool NetworkInterface::isEthernetPort() const {
    const bool isOtherKind = kind == "wlan" || kind == "wwan" || kind == "bluetooth";
    return hasDevice && !isWireless && !isOtherKind && linkType == kEthernet;
}

bool NetworkInterface::isWifiPort() const {
    return hasDevice && (isWireless || kind == "wlan") && linkType == kEthernet;
}

Fact<std::vector<NetworkInterface>> readNetworkInterfaces(const std::filesystem::path& directory,
                                                          const SystemCalls& calls) {
    const auto names = listDirectory(directory);
    if (!names)
        return names.reason();
    std::vector<std::filesystem::path> places;
    for (const std::string& name : *names) {
        std::error_code error;
        if (std::filesystem::is_directory(directory / name, error))
            places.push_back(directory / name);
    }
    const FileTexts links = readLinks(places, calls);
    std::vector<NetworkInterface> out;
    out.reserve(places.size());
    for (const std::filesystem::path& place : places)
        out.push_back(readInterface(place, place.filename().string(), links));
    std::sort(out.begin(), out.end(),
              [](const auto& a, const auto& b) { return naturallyBefore(a.name, b.name); });
    return out;
}

}  // namespace cimomd
