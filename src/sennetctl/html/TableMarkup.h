#pragma once

// The markup of one table: a column for each property, or a line for each where there is one row.

#include <cstddef>
#include <string>

#include "html/ShownTable.h"

namespace sennetctl {

/// What a browser still takes.
constexpr std::size_t kLargestPageOctets = std::size_t(256) << 20;

/// Appends the table without a heading.
/// @param headingId  the element that names the table
/// @param origin     markup that tells where the table comes from
/// Throws CannotRun when `html` becomes larger than kLargestPageOctets.
void appendTable(std::string& html, const ShownTable& table, const std::string& headingId,
                 const std::string& origin);

}  // namespace sennetctl
