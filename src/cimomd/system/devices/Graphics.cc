#include "system/devices/Graphics.h"

#include <algorithm>

#include "files/TextFields.h"
#include "files/TextFile.h"
#include "system/devices/DeviceFiles.h"
#include "text/NaturalOrder.h"

namespace cimomd {
namespace {

/// The card of an entry of the directory; nothing for other entries, such as renderD128.
std::optional<std::string_view> cardOf(std::string_view name) {
    const std::string_view card = name.substr(0, name.find('-'));
    if (card.substr(0, 4) != "card" || !parseUnsigned(card.substr(4)))
        return std::nullopt;
    return card;
}

Fact<bool> enabledOf(const std::filesystem::path& connector) {
    return readFact(connector / "enabled").then([](const std::string& text) {
        return text == "enabled"    ? std::optional(true)
               : text == "disabled" ? std::optional(false)
                                    : std::nullopt;
    });
}

/// The file is there and empty while nothing is plugged in, or the monitor tells nothing.
Fact<Edid> readEdid(const std::filesystem::path& connector) {
    const Fact<std::string> bytes = readText(connector / "edid");
    if (bytes && bytes->empty())
        return Absence::Absent;
    return bytes.then([](const std::string& text) { return parseEdid(text); }, Absence::Unreadable);
}

/// Some connectors cannot sense a monitor that does not tell who it is.
bool hasMonitor(const std::filesystem::path& connector, const Monitor& monitor) {
    const Fact<std::string> status = readFact(connector / "status");
    return status == "connected" || (status != "disconnected" && monitor.edid);
}

Fact<std::vector<std::string>> entriesInOrder(const std::filesystem::path& directory) {
    return listDirectory(directory).then([](std::vector<std::string> names) {
        std::sort(names.begin(), names.end(), naturallyBefore);
        return names;
    });
}

}  // namespace

Fact<std::vector<Monitor>> readMonitors(const std::filesystem::path& directory) {
    const auto names = entriesInOrder(directory);
    if (!names)
        return names.reason();
    std::vector<Monitor> monitors;
    for (const std::string& name : *names) {
        const auto card = cardOf(name);
        if (!card || card->size() == name.size())
            continue;
        const Monitor monitor{name, enabledOf(directory / name), readEdid(directory / name)};
        if (hasMonitor(directory / name, monitor))
            monitors.push_back(monitor);
    }
    return monitors;
}

Fact<std::vector<BuiltInGraphics>> readBuiltInGraphics(const std::filesystem::path& directory) {
    const auto names = entriesInOrder(directory);
    if (!names)
        return names.reason();
    std::vector<BuiltInGraphics> cards;
    for (const std::string& name : *names) {
        if (cardOf(name) != name)
            continue;
        const std::filesystem::path device = directory / name / "device";
        if (const auto compatible = readUeventValue(device, "OF_COMPATIBLE_0"))
            cards.push_back({name, readUeventValue(device, "DRIVER"), *compatible});
    }
    return cards;
}

}  // namespace cimomd
