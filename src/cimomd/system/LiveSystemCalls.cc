#include "system/LiveSystemCalls.h"

#include <sys/statvfs.h>
#include <sys/utsname.h>

#include <ctime>

namespace cimomd {

std::int64_t LiveSystemCalls::now() const {
    return std::time(nullptr);
}

int LiveSystemCalls::utcOffsetMinutes(std::int64_t time) const {
    const std::time_t seconds = time;
    std::tm local{};
    if (::localtime_r(&seconds, &local) == nullptr)
        return 0;
    return static_cast<int>(local.tm_gmtoff / 60);
}

std::optional<FileSystemSize> LiveSystemCalls::fileSystemSize(const std::string& mountPoint) const {
    struct statvfs status {};
    if (::statvfs(mountPoint.c_str(), &status) != 0)
        return std::nullopt;
    return FileSystemSize{status.f_frsize, status.f_blocks, status.f_bavail, status.f_files,
                          status.f_ffree};
}

std::optional<std::string> LiveSystemCalls::machine() const {
    utsname names{};
    if (::uname(&names) != 0)
        return std::nullopt;
    return names.machine;
}

}  // namespace cimomd
