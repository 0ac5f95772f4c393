#pragma once

// Where a command writes to and how, and what it tells by its exit status.

#include <cstddef>
#include <iosfwd>

namespace sennetctl {

/// The exit statuses of all commands.
constexpr int kFine = 0;
constexpr int kFindings = 1;   ///< the command did its work and found something
constexpr int kCannotRun = 2;  ///< the command could not do its work; standard error says why

struct Output {
    std::ostream& out;
    std::ostream& err;
    bool json = false;      ///< one JSON document instead of text for people
    bool colour = false;    ///< `out` shows colours: it is a terminal
    bool progress = false;  ///< `err` may be written over: it is a terminal
    std::size_t width = 0;  ///< characters of a line of `out`; 0 where it is no terminal
};

}  // namespace sennetctl
