#include "system/computer/Board.h"

#include "system/computer/FirmwareText.h"

namespace cimomd {
namespace {

constexpr unsigned kHostingBit = 0;
constexpr unsigned kRemovableBit = 2;
constexpr unsigned kReplaceableBit = 3;
constexpr unsigned kHotSwappableBit = 4;

Board boardOf(const SmbiosStructure& structure) {
    const auto feature = [flags = structure.byte(0x09)](unsigned bit) {
        return flags.then([bit](std::uint8_t bits) { return (bits >> bit & 1U) != 0; });
    };
    Board out;
    out.manufacturer = structure.text(0x04);
    out.model = structure.text(0x05);
    out.version = structure.text(0x06);
    out.serialNumber = structure.text(0x07);
    out.assetTag = structure.text(0x08);
    out.location = structure.text(0x0A);
    out.hosting = feature(kHostingBit);
    out.removable = feature(kRemovableBit);
    out.replaceable = feature(kReplaceableBit);
    out.hotSwappable = feature(kHotSwappableBit);
    return out;
}

/// `missing`: why the tables cannot be read.
Fact<std::vector<Board>> boardFromKernel(const std::filesystem::path& directory, Absence missing) {
    const auto fact = [&directory](const char* name) { return readFirmwareText(directory / name); };
    const auto text = [&fact, missing](const char* name) { return fact(name).orElse(missing); };
    if (!fact("board_vendor") && !fact("board_name"))
        return missing;
    Board out;
    out.manufacturer = text("board_vendor");
    out.model = text("board_name");
    out.version = text("board_version");
    out.serialNumber = text("board_serial");
    out.assetTag = text("board_asset_tag");
    out.location = missing;
    // The kernel keeps the texts of one board only: the main one.
    out.hosting = true;
    out.removable = missing;
    out.replaceable = missing;
    out.hotSwappable = missing;
    return std::vector<Board>{out};
}

}  // namespace

std::vector<Board> boardsOf(const SmbiosTable& table) {
    std::vector<Board> found;
    for (const SmbiosStructure* structure : table.ofType(smbios::kBoard)) {
        found.push_back(boardOf(*structure));
        found.back().index = found.size() - 1;
    }
    // Everything is plugged into the only board, even if its flags were left at 0.
    if (found.size() == 1)
        found.front().hosting = true;
    return found;
}

Fact<std::vector<Board>> readBoards(const SystemPaths& paths) {
    const Fact<SmbiosTable> table = readSmbiosTable(paths);
    if (table)
        return boardsOf(*table);
    return boardFromKernel(paths.firmwareIdentity(), table.reason());
}

}  // namespace cimomd
