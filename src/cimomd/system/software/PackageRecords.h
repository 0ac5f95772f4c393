#pragma once

// The output of package tools: records and fields between control characters, which no package's
// own texts have a use for.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

inline constexpr char kPackageFieldEnd = '\x1f';
inline constexpr char kPackageRecordEnd = '\x1e';

/// A format for a tool whose tags are written with `open` and `close` around their names.
std::string packageFormat(std::string_view open, const std::vector<std::string>& tags,
                          std::string_view close);

/// The fields of each record that has as many as `fieldCount`; other records are dropped. They look
/// into `output`.
std::vector<std::vector<std::string_view>> packageRecords(std::string_view output,
                                                          std::size_t fieldCount);

/// The field unless it is empty or stands for nothing.
Fact<std::string> packageField(std::string_view field);

}  // namespace cimomd
