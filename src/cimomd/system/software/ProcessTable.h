#pragma once

// /proc/PID: the processes. They come and go while one reads, so that any file may be missing.

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "system/Fact.h"

namespace cimomd {

/// /proc/PID/stat, see proc(5). Times are in clock ticks, of which a second has kTicksPerSecond.
struct ProcessStatus {
    /// Cut by the kernel after 15 bytes.
    std::string name;
    char state = '\0';
    std::int64_t parentId = 0;
    std::int64_t groupId = 0;
    std::int64_t sessionId = 0;
    /// Major and minor number of the controlling terminal; 0 is none.
    std::int64_t terminal = 0;
    std::uint64_t userTicks = 0;
    std::uint64_t kernelTicks = 0;
    std::int64_t priority = 0;
    std::int64_t nice = 0;
    /// After the machine's start.
    std::uint64_t startTicks = 0;
};

/// What /proc counts in whatever the kernel's own clock does.
inline constexpr std::uint64_t kTicksPerSecond = 100;

/// Nothing when a field is missing or no number. The name may hold blanks and parentheses.
std::optional<ProcessStatus> parseProcessStatus(std::string_view text);

/// From /proc/PID/status; the kernel's own threads have no memory to tell of.
struct ProcessOwnership {
    Fact<std::uint64_t> realUserId;
    /// Resident memory in units of 1,024 bytes.
    Fact<std::uint64_t> residentKB;
};
ProcessOwnership parseProcessOwnership(std::string_view text);

/// Every user chooses the command lines of his processes, which all answers about processes hold.
inline constexpr std::size_t kMaxCommandLineWords = 256;
/// In UTF-16 units, the ends of words included.
inline constexpr std::size_t kMaxCommandLineCharacters = 4096;

/// The words of /proc/PID/cmdline, of a long one the beginning: at most kMaxCommandLineWords, of at
/// most kMaxCommandLineCharacters together, where the last word may be cut. None for the kernel's
/// own threads. Some programs replace theirs by one line of text, with NUL bytes behind it.
std::vector<std::string> parseCommandLine(std::string_view bytes);

struct Process {
    std::uint64_t id = 0;
    ProcessStatus status;
    ProcessOwnership ownership;
    /// Of a long command line the beginning.
    Fact<std::vector<std::string>> commandLine;
    Fact<std::string> executable;
};

/// The numbers of the processes below `directory`, ascending.
Fact<std::vector<std::uint64_t>> listProcesses(const std::filesystem::path& directory);

/// The file of a process's command line. It takes a lock of the process, which one that hangs may
/// hold for ever.
std::filesystem::path commandLineFile(const std::filesystem::path& directory, std::uint64_t id);

/// Nothing when there is no such process, or no longer. `commandLine` is the text of its file.
std::optional<Process> readProcess(const std::filesystem::path& directory, std::uint64_t id,
                                   const Fact<std::string>& commandLine);

}  // namespace cimomd
