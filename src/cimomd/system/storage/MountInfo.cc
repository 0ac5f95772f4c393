#include "system/storage/MountInfo.h"

#include <algorithm>
#include <optional>

#include "files/TextFields.h"

namespace cimomd {
namespace {

constexpr std::size_t kFixedFields = 6;
constexpr std::size_t kFieldsAfterDash = 3;

/// id parent major:minor root point options [tags...] - type source options
std::optional<Mount> parseLine(std::string_view line) {
    // The source may be empty, so that two blanks follow each other.
    const std::vector<std::string_view> fields = partsOf(line, ' ');
    if (fields.size() < kFixedFields)
        return std::nullopt;
    const auto dash = std::find(fields.begin() + kFixedFields, fields.end(), "-");
    if (static_cast<std::size_t>(fields.end() - dash) < kFieldsAfterDash + 1)
        return std::nullopt;
    Mount mount;
    mount.id = fields[0];
    mount.parentId = fields[1];
    mount.device = fields[2];
    mount.fileSystemRoot = unescapeOctal(fields[3]);
    mount.mountPoint = unescapeOctal(fields[4]);
    mount.type = dash[1];
    mount.source = unescapeOctal(dash[2]);
    mount.fileSystemOptions = MountOptions(dash[3]);
    // A single mount may be read-only for this process alone, as in a service's own view of the
    // tree.
    mount.readOnly = mount.fileSystemOptions.has("ro");
    return mount;
}

}  // namespace

std::vector<Mount> parseMountInfo(std::string_view text) {
    std::vector<Mount> mounts;
    for (const std::string_view line : linesOf(text)) {
        if (auto mount = parseLine(line))
            mounts.push_back(std::move(*mount));
    }
    return mounts;
}

}  // namespace cimomd
