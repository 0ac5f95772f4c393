// Reads any bytes as lines and compares them with a plain split of the whole. The first byte gives
// the limit.

#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "Require.h"
#include "velmclient/FileDescriptor.h"
#include "velmclient/LineReader.h"

namespace {

std::vector<std::string_view> splitLines(std::string_view text, std::size_t limit) {
    std::vector<std::string_view> lines;
    while (!text.empty()) {
        const std::size_t lineFeed = text.find('\n');
        std::string_view line = text.substr(0, lineFeed);
        text.remove_prefix(std::min(text.size(), line.size() + 1));
        if (lineFeed != std::string_view::npos && !line.empty() && line.back() == '\r') {
            line.remove_suffix(1);
        }
        lines.push_back(line.substr(0, limit));
    }
    return lines;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) {
        return 0;
    }
    const int limit = data[0];
    const std::string_view text(reinterpret_cast<const char*>(data) + 1, size - 1);
    Velm::FileDescriptor file(::memfd_create("lines", MFD_CLOEXEC));
    require(file.isOpen() && file.writeAll(text.data(), text.size()) == 0 &&
            ::lseek(file.get(), 0, SEEK_SET) == 0);

    Velm::LineReader reader(std::move(file), "lines");
    for (const std::string_view expected : splitLines(text, data[0])) {
        std::vector<char> line(data[0]);
        const int length = reader.readLine(line.data(), limit);
        require(length >= 0 &&
                std::string_view(line.data(), static_cast<std::size_t>(length)) == expected);
    }
    char nothing = 0;
    require(reader.readLine(&nothing, 0) < 0);
    return 0;
}
