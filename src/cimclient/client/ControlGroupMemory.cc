#include "client/ControlGroupMemory.h"

#include <algorithm>
#include <fstream>
#include <limits>

namespace Pegasus {

namespace {

constexpr Uint64 kNoLimit = std::numeric_limits<Uint64>::max();

// kNoLimit for "max" or without such a file.
Uint64 limitIn(const std::string& path) {
    std::ifstream file(path);
    Uint64 limit = 0;
    return file >> limit ? limit : kNoLimit;
}

// In a container the limit is at the top, and the group may have a path that is not seen there.
Uint64 leastLimit(const std::string& top, const std::string& group, const std::string& fileName) {
    Uint64 least = limitIn(top + fileName);
    std::string place = top + group;
    for (; place.size() > top.size(); place.erase(place.find_last_of('/'))) {
        least = std::min(least, limitIn(place + fileName));
    }
    return least;
}

bool hasMemory(const std::string& controllers) {
    return ("," + controllers + ",").find(",memory,") != std::string::npos;
}

// Of a line "hierarchy:controllers:/group", where version 2 names no controllers.
Uint64 limitOfLine(const std::string& line, const std::string& mounts) {
    const std::size_t first = line.find(':');
    const std::size_t second = line.find(":/", first + 1);
    if (first == std::string::npos || second == std::string::npos) {
        return kNoLimit;
    }
    const std::string controllers = line.substr(first + 1, second - first - 1);
    const std::string group = line.substr(second + 1);
    if (controllers.empty()) {
        return leastLimit(mounts, group, "/memory.max");
    }
    return hasMemory(controllers) ? leastLimit(mounts + "/memory", group, "/memory.limit_in_bytes")
                                  : kNoLimit;
}

}  // namespace

Uint64 controlGroupMemoryLimit(const std::string& root) {
    Uint64 least = kNoLimit;
    std::ifstream file(root + "/proc/self/cgroup");
    for (std::string line; std::getline(file, line);) {
        least = std::min(least, limitOfLine(line, root + "/sys/fs/cgroup"));
    }
    return least;
}

}  // namespace Pegasus
