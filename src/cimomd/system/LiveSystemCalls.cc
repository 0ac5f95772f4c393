#include "system/LiveSystemCalls.h"

#include <sys/utsname.h>

#include <atomic>
#include <ctime>

#include "system/network/AddressDump.h"

namespace cimomd {
namespace {

/// The administrator may change the zone at any time. Looking for that means looking at a file:
/// once a second is enough for the thousands of times of a list of packages.
void followZone() {
    static std::atomic<std::time_t> latestLook{-1};
    const std::time_t now = std::time(nullptr);
    if (latestLook.exchange(now) != now)
        ::tzset();
}

}  // namespace

LiveSystemCalls::LiveSystemCalls(const SilenceLimits& silence)
    : files{FileReadGuard(readFileStart, silence), FileReadGuard(readFileStart, silence),
            FileReadGuard(readFileStart, silence), FileReadGuard(readFileStart, silence)} {}

std::int64_t LiveSystemCalls::now() const {
    return std::time(nullptr);
}

int LiveSystemCalls::utcOffsetMinutes(std::int64_t time) const {
    followZone();
    const std::time_t seconds = time;
    std::tm local{};
    if (::localtime_r(&seconds, &local) == nullptr)
        return 0;
    return static_cast<int>(local.tm_gmtoff / 60);
}

Fact<FileSystemSize> LiveSystemCalls::fileSystemSize(const std::string& mountPoint) const {
    FileSystemSize size;
    const int error = readFileSystemSize(mountPoint.c_str(), size);
    return error == 0 ? Fact<FileSystemSize>(size) : absenceOfSize(error);
}

Fact<FileSystemSize> LiveSystemCalls::fileSystemSizeInTime(const std::string& mountPoint,
                                                           const std::string& device) const {
    return sizes.ask(device, mountPoint);
}

std::vector<Fact<std::string>> LiveSystemCalls::textsInTime(
    TextSource source, const std::vector<std::filesystem::path>& wanted) const {
    return files.at(static_cast<std::size_t>(source)).read(wanted);
}

std::optional<std::string> LiveSystemCalls::machine() const {
    utsname names{};
    if (::uname(&names) != 0)
        return std::nullopt;
    return names.machine;
}

Fact<std::vector<InterfaceAddress>> LiveSystemCalls::interfaceAddresses() const {
    return dumpAddresses();
}

LinkSettings LiveSystemCalls::linkSettings(const std::string& interfaceName) const {
    return links.ask(interfaceName);
}

}  // namespace cimomd
