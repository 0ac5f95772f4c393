#include "system/network/LinkSettings.h"

#include <fmt/format.h>

#include <algorithm>

#include "files/TextFields.h"
#include "system/Narrowing.h"

namespace cimomd {
namespace {

std::optional<PortConnector> recordedConnector(std::string_view text) {
    const auto number = parseUnsigned(text);
    const auto port = number ? narrowedTo<unsigned>(*number) : std::nullopt;
    return port ? connectorOf(*port) : std::nullopt;
}

}  // namespace

std::optional<PortConnector> connectorOf(unsigned port) {
    switch (port) {
        case 0:
            return PortConnector::TwistedPair;
        case 1:
            return PortConnector::Aui;
        case 2:
            return PortConnector::Mii;
        case 3:
            return PortConnector::Fibre;
        case 4:
            return PortConnector::Bnc;
        case 5:
            return PortConnector::DirectAttach;
        default:
            return std::nullopt;
    }
}

std::optional<std::string> hardwareAddressText(std::string_view bytes) {
    if (std::all_of(bytes.begin(), bytes.end(), [](char byte) { return byte == '\0'; }))
        return std::nullopt;
    std::string out;
    for (const char byte : bytes)
        out += fmt::format("{}{:02x}", out.empty() ? "" : ":", static_cast<unsigned char>(byte));
    return out;
}

std::map<std::string, LinkSettings> parseRecordedLinks(std::string_view text) {
    constexpr std::size_t kFieldCount = 3;
    std::map<std::string, LinkSettings> out;
    for (const std::string_view line : linesOf(text)) {
        const std::vector<std::string_view> fields = fieldsOf(line);
        if (fields.size() != kFieldCount)
            continue;
        LinkSettings& settings = out[std::string(fields[0])];
        if (fields[1] != "-")
            settings.permanentAddress = std::string(fields[1]);
        settings.connector = recordedConnector(fields[2]);
    }
    return out;
}

}  // namespace cimomd
