#pragma once

// What becomes of the values of one column on their way into the files.

#include <Velm/Properties.h>

#include <string>
#include <vector>

#include "report/Finding.h"
#include "script/ColumnCheck.h"

namespace sennetctl {

struct ValueRemark {
    Severity severity = Severity::Warning;
    std::string message;
};

/// A remark for each way in which the files show something else than the values: texts that are cut
/// or longer than the column, letters that become blanks, double quotes and line ends, backslashes
/// that hide the end of a literal, numbers that do not survive 32 bits, dates that are none for the
/// products, what stands for values that are missing in some rows, and a size that is too little
/// for other values of the type.
std::vector<ValueRemark> remarksOn(const Column& column, const AnsweredClass& answered,
                                   const Velm::Properties& texts);

/// What the files show where the column has no value, such as "0 (for QVE null)"; empty where that
/// is an empty text.
std::string standInFor(const Column& column, const AnsweredClass& answered);

/// How many values do not survive 32 bits.
std::size_t countWideValues(const Column& column, const AnsweredClass& answered);

/// Characters of the longest text that is written, before any column limits it; 0 for none.
/// Of an array that is longer than what is written, only that it is.
std::size_t longestText(const Column& column, const AnsweredClass& answered);

}  // namespace sennetctl
