#pragma once

// Compiled time zones from readable tables, in the second version of TZif (RFC 9636).

#include <cstdint>
#include <string>
#include <vector>

namespace cimomd {

struct ZoneType {
    std::int32_t offsetSeconds;
    bool isDaylight;
};

struct ZoneChange {
    std::int64_t time;
    std::uint8_t type;
};

inline std::string bigEndianBytes(std::uint64_t number, int count) {
    std::string bytes;
    for (int shift = (count - 1) * 8; shift >= 0; shift -= 8)
        bytes += static_cast<char>(number >> shift & 0xFFU);
    return bytes;
}

inline std::string zoneHeader(std::size_t changes, std::size_t types) {
    return "TZif2" + std::string(15, '\0') + std::string(12, '\0') + bigEndianBytes(changes, 4) +
           bigEndianBytes(types, 4) + bigEndianBytes(4, 4);
}

inline std::string zoneBytes(const std::vector<ZoneType>& types,
                             const std::vector<ZoneChange>& changes, const std::string& rules) {
    const std::string shortBlock = std::string(6, '\0') + std::string("UTC\0", 4);
    std::string bytes = zoneHeader(0, 1) + shortBlock + zoneHeader(changes.size(), types.size());
    for (const ZoneChange& change : changes)
        bytes += bigEndianBytes(static_cast<std::uint64_t>(change.time), 8);
    for (const ZoneChange& change : changes)
        bytes += static_cast<char>(change.type);
    for (const ZoneType& type : types)
        bytes += bigEndianBytes(static_cast<std::uint32_t>(type.offsetSeconds), 4) +
                 static_cast<char>(type.isDaylight ? 1 : 0) + '\0';
    return bytes + std::string("UTC\0", 4) + "\n" + rules + "\n";
}

}  // namespace cimomd
