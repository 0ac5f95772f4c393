#include "SyslogSpy.h"

#include <cstdarg>
#include <cstdio>
#include <utility>

namespace {

std::vector<SyslogEntry> entries;

void keep(int priority, const char* format, std::va_list arguments) {
    char text[1024];
    std::vsnprintf(text, sizeof text, format, arguments);
    entries.push_back({priority, text});
}

}  // namespace

std::vector<SyslogEntry> takeSyslog() {
    return std::exchange(entries, {});
}

extern "C" void syslog(int priority, const char* format, ...);
extern "C" void __syslog_chk(int priority, int flag, const char* format, ...);

extern "C" void syslog(int priority, const char* format, ...) {
    std::va_list arguments;
    va_start(arguments, format);
    keep(priority, format, arguments);
    va_end(arguments);
}

// What fortified builds call instead.
extern "C" void __syslog_chk(int priority, int /*flag*/, const char* format, ...) {
    std::va_list arguments;
    va_start(arguments, format);
    keep(priority, format, arguments);
    va_end(arguments);
}
