#include "system/LiveSystemCalls.h"

#include <sys/utsname.h>

#include <ctime>

#include "system/network/AddressDump.h"

namespace cimomd {

std::int64_t LiveSystemCalls::now() const {
    return std::time(nullptr);
}

int LiveSystemCalls::utcOffsetMinutes(std::int64_t time) const {
    // The administrator may have changed the zone since the last call.
    ::tzset();
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
    const std::vector<std::filesystem::path>& wanted) const {
    return files.read(wanted);
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
