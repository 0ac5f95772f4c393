#include "system/software/ProcessTable.h"

#include <algorithm>
#include <array>
#include <cstddef>

#include "files/LinkTarget.h"
#include "files/TextFields.h"
#include "files/TextFile.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

// Places of the fields behind the name.
enum Field : std::size_t {
    kState = 0,
    kParentId = 1,
    kGroupId = 2,
    kSessionId = 3,
    kTerminal = 4,
    kUserTicks = 11,
    kKernelTicks = 12,
    kPriority = 15,
    kNice = 16,
    kStartTicks = 19,
    kFieldCount = 20
};

/// Reads numbers out of fields and remembers whether each was one.
class NumberFields {
  public:
    explicit NumberFields(std::string_view text) : fields(fieldsOf(text)) {
        isComplete = fields.size() >= kFieldCount && fields[kState].size() == 1;
    }

    void read(Field place, std::int64_t& number) { take(place, parseSigned, number); }
    void read(Field place, std::uint64_t& number) { take(place, parseUnsigned, number); }
    char state() const { return isComplete ? fields[kState].front() : '\0'; }
    bool complete() const { return isComplete; }

  private:
    template <typename Number>
    void take(Field place, std::optional<Number> (*parse)(std::string_view), Number& number) {
        if (!isComplete)
            return;
        const std::optional<Number> parsed = parse(fields[place]);
        isComplete = parsed.has_value();
        number = parsed.value_or(0);
    }

    std::vector<std::string_view> fields;
    bool isComplete = false;
};

std::string_view beginningOfCommandLine(std::string_view bytes) {
    std::string_view beginning = firstCharacters(bytes, kMaxCommandLineCharacters);
    // Of the word behind it nothing is left, which is not the same as an empty word.
    if (beginning.size() < bytes.size() && beginning.back() == '\0')
        beginning.remove_suffix(1);
    return beginning;
}

}  // namespace

std::optional<ProcessStatus> parseProcessStatus(std::string_view text) {
    const std::size_t nameStart = text.find('(');
    const std::size_t nameEnd = text.rfind(')');
    if (nameStart == std::string_view::npos || nameEnd == std::string_view::npos ||
        nameEnd < nameStart)
        return std::nullopt;
    ProcessStatus out;
    out.name = text.substr(nameStart + 1, nameEnd - nameStart - 1);
    NumberFields fields(trimmed(text.substr(nameEnd + 1)));
    out.state = fields.state();
    fields.read(kParentId, out.parentId);
    fields.read(kGroupId, out.groupId);
    fields.read(kSessionId, out.sessionId);
    fields.read(kTerminal, out.terminal);
    fields.read(kUserTicks, out.userTicks);
    fields.read(kKernelTicks, out.kernelTicks);
    fields.read(kPriority, out.priority);
    fields.read(kNice, out.nice);
    fields.read(kStartTicks, out.startTicks);
    return fields.complete() ? std::optional(out) : std::nullopt;
}

ProcessOwnership parseProcessOwnership(std::string_view text) {
    ProcessOwnership out;
    for (const std::string_view line : linesOf(text)) {
        const auto entry = keyValueOf(line, ':');
        if (!entry || entry->value.empty())
            continue;
        if (entry->key == "Uid")
            out.realUserId = parseUnsigned(fieldsOf(entry->value)[0]);
        else if (entry->key == "VmRSS")
            out.residentKB = parseUnsigned(fieldsOf(entry->value)[0]);
    }
    return out;
}

std::vector<std::string> parseCommandLine(std::string_view bytes) {
    const std::size_t end = bytes.find_last_not_of('\0');
    if (end == std::string_view::npos)
        return {};
    const std::vector<std::string_view> words =
        partsOf(beginningOfCommandLine(bytes.substr(0, end + 1)), '\0');
    const std::size_t count = std::min(words.size(), kMaxCommandLineWords);
    return {words.begin(), words.begin() + static_cast<std::ptrdiff_t>(count)};
}

Fact<std::vector<std::uint64_t>> listProcesses(const std::filesystem::path& directory) {
    return listDirectory(directory).then([](const std::vector<std::string>& names) {
        std::vector<std::uint64_t> ids;
        for (const std::string& name : names) {
            if (const auto id = parseUnsigned(name); id && std::to_string(*id) == name)
                ids.push_back(*id);
        }
        std::sort(ids.begin(), ids.end());
        return std::optional(std::move(ids));
    });
}

std::filesystem::path commandLineFile(const std::filesystem::path& directory, std::uint64_t id) {
    return directory / std::to_string(id) / "cmdline";
}

std::optional<Process> readProcess(const std::filesystem::path& directory, std::uint64_t id,
                                   const Fact<std::string>& commandLine) {
    const std::filesystem::path place = directory / std::to_string(id);
    const Fact<std::string> statusLine = readText(place / "stat");
    const auto status = statusLine ? parseProcessStatus(*statusLine) : std::nullopt;
    if (!status)
        return std::nullopt;
    Process out;
    out.id = id;
    out.status = *status;
    const Fact<std::string> ownership = readText(place / "status");
    if (ownership)
        out.ownership = parseProcessOwnership(*ownership);
    else
        out.ownership = {ownership.reason(), ownership.reason()};
    out.commandLine = commandLine.then(parseCommandLine);
    out.executable = linkTargetOf(place / "exe");
    return out;
}

}  // namespace cimomd
