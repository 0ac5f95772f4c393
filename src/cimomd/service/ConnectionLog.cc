#include "service/ConnectionLog.h"

#include <fmt/format.h>

namespace cimomd {

void ConnectionLog::add(std::string_view line, Clock::time_point now) {
    tellLeftOut(now);
    if (written == 0)
        begin = now;
    if (written == kLinesASecond) {
        ++leftOut;
        return;
    }
    ++written;
    write(line);
}

void ConnectionLog::tellLeftOut(Clock::time_point now) {
    if (written == 0 || now - begin < std::chrono::seconds(1))
        return;
    if (leftOut > 0)
        write(fmt::format("connections within a second that are not listed: {}", leftOut));
    written = 0;
    leftOut = 0;
}

}  // namespace cimomd
