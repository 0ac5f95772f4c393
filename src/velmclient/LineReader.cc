#include "velmclient/LineReader.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <utility>

#include "velmclient/SystemLog.h"

namespace Velm {

namespace {

constexpr std::size_t kBufferSize = 64 * 1024;

}  // namespace

LineReader::LineReader(FileDescriptor file, std::string path)
    : file(std::move(file)), path(std::move(path)), buffer(kBufferSize) {}

int LineReader::readLine(char* line, int limit) {
    const auto room = static_cast<std::size_t>(limit);
    std::size_t length = 0;
    bool endsInCr = false;
    bool ended = false;
    while (!ended && fill()) {
        const char* unread = buffer.data() + begin;
        const auto* lineFeed = static_cast<const char*>(std::memchr(unread, '\n', end - begin));
        ended = lineFeed != nullptr;
        const std::size_t count = ended ? static_cast<std::size_t>(lineFeed - unread) : end - begin;
        if (length < room) {
            std::copy_n(unread, std::min(count, room - length), line + length);
        }
        if (count > 0) {
            endsInCr = unread[count - 1] == '\r';
        }
        length += count;
        begin += count + (ended ? 1 : 0);
    }
    if (failed || (!ended && length == 0)) {
        return -1;
    }
    if (ended && endsInCr) {
        --length;
    }
    return static_cast<int>(std::min(length, room));
}

bool LineReader::fill() {
    if (begin < end) {
        return true;
    }
    if (failed) {
        return false;
    }
    const ssize_t count = file.read(buffer.data(), buffer.size());
    if (count < 0) {
        logFailure("read", path, errno);
        failed = true;
        return false;
    }
    begin = 0;
    end = static_cast<std::size_t>(count);
    return count > 0;
}

}  // namespace Velm
