#include "velmclient/SystemLog.h"

#include <syslog.h>

#include <cerrno>
#include <system_error>

namespace Velm {

void logFailure(const char* action, const std::string& path, int error) {
    const int saved = errno;
    const std::string reason = std::generic_category().message(error);
    syslog(LOG_ERR, "cannot %s %s: %s", action, path.c_str(), reason.c_str());
    errno = saved;
}

}  // namespace Velm
