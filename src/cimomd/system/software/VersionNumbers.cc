#include "system/software/VersionNumbers.h"

#include <limits>

#include "files/TextFields.h"

namespace cimomd {
namespace {

Fact<std::uint16_t> numberOf(std::string_view digits) {
    if (digits.empty())
        return Absence::Absent;
    const auto number = parseUnsigned(digits);
    if (!number || *number > std::numeric_limits<std::uint16_t>::max())
        return Absence::Filtered;
    return static_cast<std::uint16_t>(*number);
}

}  // namespace

VersionNumbers versionNumbersOf(std::string_view version) {
    VersionNumbers out;
    for (Fact<std::uint16_t>* part : {&out.major, &out.minor, &out.revision, &out.build}) {
        const std::size_t length =
            std::min(version.find_first_not_of("0123456789"), version.size());
        *part = numberOf(version.substr(0, length));
        if (length == 0 || length == version.size() || version[length] != '.')
            break;
        version.remove_prefix(length + 1);
    }
    return out;
}

}  // namespace cimomd
