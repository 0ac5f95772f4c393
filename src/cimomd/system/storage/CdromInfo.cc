#include "system/storage/CdromInfo.h"

#include <vector>

#include "files/TextFields.h"

namespace cimomd {
namespace {

using Columns = std::vector<std::string_view>;

std::optional<std::uint64_t> numberIn(const std::map<std::string_view, Columns>& rows,
                                      std::string_view row, std::size_t column) {
    const auto place = rows.find(row);
    if (place == rows.end() || column >= place->second.size())
        return std::nullopt;
    return parseUnsigned(place->second[column]);
}

std::optional<bool> flagIn(const std::map<std::string_view, Columns>& rows, std::string_view row,
                           std::size_t column) {
    const auto number = numberIn(rows, row, column);
    if (!number || *number > 1)
        return std::nullopt;
    return *number == 1;
}

}  // namespace

std::map<std::string, CdromAbilities> parseCdromInfo(std::string_view text) {
    std::map<std::string_view, Columns> rows;
    for (const std::string_view line : linesOf(text)) {
        if (const auto row = keyValueOf(line, ':'))
            rows.emplace(row->key, fieldsOf(row->value));
    }
    std::map<std::string, CdromAbilities> out;
    const Columns names = rows["drive name"];
    for (std::size_t column = 0; column < names.size(); ++column) {
        CdromAbilities& drive = out[std::string(names[column])];
        drive.speed = numberIn(rows, "drive speed", column);
        drive.writesCdR = flagIn(rows, "Can write CD-R", column);
        drive.writesCdRw = flagIn(rows, "Can write CD-RW", column);
        drive.readsDvd = flagIn(rows, "Can read DVD", column);
        drive.writesDvdR = flagIn(rows, "Can write DVD-R", column);
        drive.writesDvdRam = flagIn(rows, "Can write DVD-RAM", column);
    }
    return out;
}

}  // namespace cimomd
