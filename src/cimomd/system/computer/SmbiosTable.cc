#include "system/computer/SmbiosTable.h"

#include "files/TextFile.h"

namespace cimomd {
namespace {

// A 32-bit entry point cannot announce more than 64 KB; tables of large servers have some 100 KB.
constexpr std::size_t kMaxTableBytes = std::size_t{1} << 20;

// A handle is a number of 16 bits, and no two structures share one.
constexpr std::size_t kMaxStructures = std::size_t{1} << 16;

constexpr std::uint8_t kEndOfTable = 127;

/// Takes structures off the front of a table.
class StructureReader {
  public:
    explicit StructureReader(std::string_view bytes) : rest(bytes) {}

    /// The next one; nothing when it is not there as a whole.
    std::optional<SmbiosStructure> next() {
        if (rest.size() < SmbiosStructure::kHeaderBytes)
            return std::nullopt;
        const std::size_t length = static_cast<std::uint8_t>(rest[1]);
        if (length < SmbiosStructure::kHeaderBytes || length > rest.size())
            return std::nullopt;
        const std::string_view area = rest.substr(0, length);
        rest.remove_prefix(length);
        std::optional<std::vector<std::string>> texts = textSet();
        if (!texts)
            return std::nullopt;
        return SmbiosStructure(area, std::move(*texts));
    }

  private:
    /// A set is ended by an empty text; one without any texts is two NUL bytes.
    std::optional<std::vector<std::string>> textSet() {
        std::vector<std::string> texts;
        for (;;) {
            const std::size_t end = rest.find('\0');
            if (end == std::string_view::npos)
                return std::nullopt;
            const std::string_view text = rest.substr(0, end);
            rest.remove_prefix(end + 1);
            if (text.empty())
                break;
            texts.emplace_back(text);
        }
        if (texts.empty() && !rest.empty() && rest.front() == '\0')
            rest.remove_prefix(1);
        return texts;
    }

    std::string_view rest;
};

}  // namespace

std::vector<const SmbiosStructure*> SmbiosTable::ofType(std::uint8_t type) const {
    std::vector<const SmbiosStructure*> found;
    for (const SmbiosStructure& structure : structures) {
        if (structure.type() == type)
            found.push_back(&structure);
    }
    return found;
}

// The kernel has found the entry point by its check sums, so they are not computed again.
Fact<SmbiosVersion> parseSmbiosEntryPoint(std::string_view bytes) {
    constexpr std::string_view kAnchor32 = "_SM_";
    constexpr std::string_view kAnchor64 = "_SM3_";
    constexpr std::size_t kVersion32 = 6;
    constexpr std::size_t kVersion64 = 7;
    const auto versionAt = [bytes](std::size_t offset) -> Fact<SmbiosVersion> {
        if (bytes.size() < offset + 2)
            return Absence::Unreadable;
        return SmbiosVersion{static_cast<std::uint8_t>(bytes[offset]),
                             static_cast<std::uint8_t>(bytes[offset + 1])};
    };
    if (bytes.substr(0, kAnchor64.size()) == kAnchor64)
        return versionAt(kVersion64);
    if (bytes.substr(0, kAnchor32.size()) == kAnchor32)
        return versionAt(kVersion32);
    return Absence::Unreadable;
}

std::vector<SmbiosStructure> parseSmbiosStructures(std::string_view bytes) {
    std::vector<SmbiosStructure> structures;
    StructureReader reader(bytes);
    while (structures.size() < kMaxStructures) {
        std::optional<SmbiosStructure> structure = reader.next();
        if (!structure || structure->type() == kEndOfTable)
            break;
        structures.push_back(std::move(*structure));
    }
    return structures;
}

Fact<SmbiosTable> readSmbiosTable(const SystemPaths& paths) {
    const std::filesystem::path tables = paths.firmwareTables();
    const Fact<std::string> entryPoint = readText(tables / "smbios_entry_point");
    if (!entryPoint)
        return entryPoint.reason();
    const Fact<SmbiosVersion> version = parseSmbiosEntryPoint(*entryPoint);
    if (!version)
        return version.reason();
    const Fact<std::string> bytes = readText(tables / "DMI", kMaxTableBytes);
    return bytes.then([&version](const std::string& structures) {
        return SmbiosTable{*version, parseSmbiosStructures(structures)};
    });
}

}  // namespace cimomd
