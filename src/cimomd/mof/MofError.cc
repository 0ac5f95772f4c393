#include "mof/MofError.h"

#include <fmt/format.h>

#include <utility>

namespace cimomd {
namespace {

std::string linesOf(const std::vector<MofError>& errors, bool isCut) {
    std::string lines;
    for (const MofError& error : errors) {
        if (!lines.empty())
            lines += '\n';
        lines += error.what();
    }
    if (isCut)
        lines += fmt::format("\nmore than {} mistakes, the rest is not told", errors.size());
    return lines;
}

}  // namespace

MofError::MofError(std::string_view file, MofPosition position, std::string_view found,
                   std::string_view expected)
    : std::runtime_error(fmt::format("{}:{}:{}: found {}, expected {}", file, position.line,
                                     position.column, found, expected)),
      position_(position) {}

MofErrors::MofErrors(std::vector<MofError> errors, bool isCut)
    : std::runtime_error(linesOf(errors, isCut)), errors_(std::move(errors)) {}

}  // namespace cimomd
