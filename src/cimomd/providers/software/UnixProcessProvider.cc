#include "providers/software/UnixProcessProvider.h"

#include <limits>
#include <unordered_map>

#include "files/TextFile.h"
#include "providers/CimTime.h"
#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/software/OperatingSystemProvider.h"
#include "system/Narrowing.h"
#include "system/computer/SystemIdentity.h"
#include "system/software/KernelTables.h"
#include "system/software/OsRelease.h"
#include "system/software/UserAccount.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

constexpr std::uint64_t kMillisecondsPerTick = 1000 / kTicksPerSecond;
constexpr std::uint64_t kBytesPerKB = 1024;

// CIM_Process.ExecutionState
constexpr Uint16 kStateUnknown = 0;
constexpr Uint16 kStateRunning = 3;
constexpr Uint16 kStateBlocked = 4;
constexpr Uint16 kStateTerminated = 7;
constexpr Uint16 kStateStopped = 8;

Uint16 executionStateOf(char state) {
    switch (state) {
        case 'R':
            return kStateRunning;
        case 'S':
        case 'D':
        case 'I':
            return kStateBlocked;
        case 'T':
        case 't':
            return kStateStopped;
        case 'Z':
            return kStateTerminated;
        default:
            return kStateUnknown;
    }
}

Uint16 operationalStatusOf(char state) {
    switch (executionStateOf(state)) {
        case kStateRunning:
        case kStateBlocked:
            return kOperationalOk;
        case kStateStopped:
            return kOperationalStopped;
        case kStateTerminated:
            return kOperationalCompleted;
        default:
            return kOperationalUnknown;
    }
}

/// What the process table tells of every process.
Fact<std::int64_t> told(std::int64_t number) {
    return number;
}

Fact<Pegasus::CIMDateTime> creationDateOf(const ProcessSurroundings& surroundings,
                                          const Process& process) {
    constexpr std::int64_t kFarFuture = std::int64_t{1} << 40;
    const auto seconds = static_cast<std::int64_t>(process.status.startTicks / kTicksPerSecond);
    return surroundings.bootTime.then([&](std::int64_t boot) {
        return boot < 0 || boot > kFarFuture
                   ? std::nullopt
                   : cimTimeOf(boot + seconds, surroundings.utcOffsetMinutes);
    });
}

Fact<Uint64> milliseconds(std::uint64_t ticks) {
    if (ticks > std::numeric_limits<std::uint64_t>::max() / kMillisecondsPerTick)
        return Absence::Filtered;
    return static_cast<Uint64>(ticks * kMillisecondsPerTick);
}

Fact<std::uint64_t> processorTimeOf(const ProcessStatus& status) {
    if (status.userTicks > std::numeric_limits<std::uint64_t>::max() - status.kernelTicks)
        return Absence::Filtered;
    return (status.userTicks + status.kernelTicks) / kTicksPerSecond;
}

Fact<Uint64> identifier(std::int64_t number) {
    return number < 0 ? Fact<Uint64>(Absence::Filtered) : Fact<Uint64>(static_cast<Uint64>(number));
}

Fact<Uint64> bytesOf(const Fact<std::uint64_t>& sizeKB) {
    return sizeKB.then([](std::uint64_t size) {
        return size > std::numeric_limits<std::uint64_t>::max() / kBytesPerKB
                   ? std::nullopt
                   : std::optional(static_cast<Uint64>(size * kBytesPerKB));
    });
}

/// Terminals as their device files are called: 136 and up are pts, 4 has the consoles and serials.
Fact<std::string> terminalOf(std::int64_t device) {
    constexpr std::uint64_t kConsoleMajor = 4;
    constexpr std::uint64_t kFirstSerial = 64;
    constexpr std::uint64_t kFirstPtsMajor = 136;
    constexpr std::uint64_t kLastPtsMajor = 143;
    constexpr std::uint64_t kMinorsPerMajor = 256;
    const auto bits = static_cast<std::uint32_t>(device);
    const std::uint64_t majorNumber = (bits >> 8) & 0xFFFU;
    const std::uint64_t minorNumber = (bits & 0xFFU) | ((bits >> 12) & 0xFFF00U);
    if (majorNumber >= kFirstPtsMajor && majorNumber <= kLastPtsMajor)
        return "pts/" +
               std::to_string((majorNumber - kFirstPtsMajor) * kMinorsPerMajor + minorNumber);
    if (majorNumber == kConsoleMajor && minorNumber < kFirstSerial)
        return "tty" + std::to_string(minorNumber);
    if (majorNumber == kConsoleMajor)
        return "ttyS" + std::to_string(minorNumber - kFirstSerial);
    return Absence::Absent;
}

using UserNames = std::unordered_map<std::uint64_t, std::string>;

UserNames userNames(const SystemPaths& paths) {
    UserNames names;
    const auto accounts = readUserAccounts(paths.accounts());
    if (accounts) {
        for (const UserAccount& account : *accounts)
            names.emplace(account.userId, account.name);
    }
    return names;
}

/// How many command lines are read, and held, at a time.
constexpr std::size_t kProcessesAtOnce = 64;

class ProcessStream : public InstanceStream {
  public:
    /// `systemCalls` must outlive the stream.
    ProcessStream(std::filesystem::path processDirectory, std::vector<std::uint64_t> processIds,
                  const SystemCalls& systemCalls, ProcessSurroundings shared, UserNames userNames)
        : directory(std::move(processDirectory)),
          ids(std::move(processIds)),
          calls(systemCalls),
          surroundings(std::move(shared)),
          names(std::move(userNames)) {}

    bool next(ProvidedInstance& out) override {
        for (; position < ids.size(); ++position) {
            if (position % kProcessesAtOnce == 0)
                readCommandLines();
            const auto process =
                readProcess(directory, ids[position], commandLines[position % kProcessesAtOnce]);
            if (!process)
                continue;
            out = UnixProcessProvider::publish(surroundings, *process, userNameOf(*process));
            ++position;
            return true;
        }
        return false;
    }

  private:
    void readCommandLines() {
        std::vector<std::filesystem::path> files;
        for (std::size_t i = position; i < ids.size() && files.size() < kProcessesAtOnce; ++i)
            files.push_back(commandLineFile(directory, ids[i]));
        commandLines = calls.textsInTime(TextSource::Processes, files);
    }

    Fact<std::string> userNameOf(const Process& process) const {
        const Fact<std::uint64_t>& user = process.ownership.realUserId;
        if (!user)
            return user.reason();
        const auto name = names.find(*user);
        return name == names.end() ? Fact<std::string>() : Fact<std::string>(name->second);
    }

    std::filesystem::path directory;
    std::vector<std::uint64_t> ids;
    const SystemCalls& calls;
    /// Of the processes that `position` is among.
    std::vector<Fact<std::string>> commandLines;
    ProcessSurroundings surroundings;
    UserNames names;
    std::size_t position = 0;
};

}  // namespace

std::unique_ptr<InstanceStream> UnixProcessProvider::enumerate() const {
    Fact<std::vector<std::uint64_t>> ids = listProcesses(paths.processes());
    if (!ids)
        return std::make_unique<EmptyStream>(ids.reason());
    ProcessSurroundings surroundings;
    surroundings.hostName = readHostName(paths);
    surroundings.osName = nameOf(readOsRelease(paths));
    surroundings.bootTime = readBootTime(paths);
    surroundings.utcOffsetMinutes = calls.utcOffsetMinutes(calls.now());
    return std::make_unique<ProcessStream>(paths.processes(), std::move(*ids), calls,
                                           std::move(surroundings), userNames(paths));
}

ProvidedInstance UnixProcessProvider::publish(const ProcessSurroundings& surroundings,
                                              const Process& process,
                                              const Fact<std::string>& userName) {
    const ProcessStatus& status = process.status;
    const std::string handle = std::to_string(process.id);
    InstanceBuilder builder(kClassName);
    builder.label(status.name)
        .text("Name", status.name)
        .values<Uint16>("OperationalStatus", {operationalStatusOf(status.state)})
        .value<Uint16>("EnabledState", kStateNotApplicable)
        .text("CSCreationClassName", kComputerSystemClass)
        .text("CSName", surroundings.hostName, kSystemNameLength)
        .text("OSCreationClassName", OperatingSystemProvider::kClassName)
        .text("OSName", surroundings.osName, kSystemNameLength)
        .text("CreationClassName", kClassName)
        .key("Handle", handle)
        .value<Uint32>("Priority", told(status.priority).then(narrowedToCount<std::int64_t>))
        .value<Uint16>("ExecutionState", executionStateOf(status.state))
        .value<Pegasus::CIMDateTime>("CreationDate", creationDateOf(surroundings, process))
        .value<Uint64>("KernelModeTime", milliseconds(status.kernelTicks))
        .value<Uint64>("UserModeTime", milliseconds(status.userTicks))
        .value<Uint64>("WorkingSetSize", bytesOf(process.ownership.residentKB))
        .text("ParentProcessID", std::to_string(status.parentId))
        .value<Uint64>("RealUserID", process.ownership.realUserId.then([](std::uint64_t user) {
            return std::optional(static_cast<Uint64>(user));
        }))
        .value<Uint64>("ProcessGroupID", identifier(status.groupId))
        .value<Uint64>("ProcessSessionID", identifier(status.sessionId))
        .text("ProcessTTY", terminalOf(status.terminal))
        .text("ModulePath", process.executable)
        .texts("Parameters", process.commandLine)
        .value<Uint32>("ProcessNiceValue", told(status.nice).then(narrowedToCount<std::int64_t>))
        .text("UserName", userName)
        .value<Pegasus::Sint32>("Nice",
                                told(status.nice).then(narrowedTo<Pegasus::Sint32, std::int64_t>))
        .value<Uint32>("ProcessorSeconds",
                       processorTimeOf(status).then(narrowedToCount<std::uint64_t>))
        .value<Uint32>("WorkingSetSizeKB",
                       process.ownership.residentKB.then(narrowedToCount<std::uint64_t>));
    return builder.take();
}

}  // namespace cimomd
