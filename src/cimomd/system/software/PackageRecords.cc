#include "system/software/PackageRecords.h"

#include "files/TextFields.h"
#include "text/Utf8.h"

namespace cimomd {

std::string packageFormat(std::string_view open, const std::vector<std::string>& tags,
                          std::string_view close) {
    std::string format;
    for (const std::string& tag : tags) {
        if (!format.empty())
            format += kPackageFieldEnd;
        format.append(open).append(tag).append(close);
    }
    return format + kPackageRecordEnd;
}

std::vector<std::vector<std::string_view>> packageRecords(std::string_view output,
                                                          std::size_t fieldCount) {
    const std::vector<std::string_view> parts = partsOf(output, kPackageRecordEnd);
    std::vector<std::vector<std::string_view>> records;
    records.reserve(parts.size());
    for (const std::string_view record : parts) {
        std::vector<std::string_view> fields = partsOf(record, kPackageFieldEnd);
        if (fields.size() == fieldCount)
            records.push_back(std::move(fields));
    }
    return records;
}

Fact<std::string> packageField(std::string_view field) {
    const std::string_view text = trimmed(field);
    // Second what rpm writes for a tag that a package does not have.
    if (text.empty() || text == "(none)")
        return Absence::Absent;
    // What rpm's build tool puts in place of a group that the packager did not name.
    if (text == "Unspecified")
        return Absence::Filtered;
    return std::string(text);
}

}  // namespace cimomd
