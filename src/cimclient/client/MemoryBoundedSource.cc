#include "client/MemoryBoundedSource.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <sys/resource.h>
#include <unistd.h>

#include <algorithm>
#include <fstream>

namespace Pegasus {

namespace {

Uint64 pageSize() {
    return static_cast<Uint64>(::sysconf(_SC_PAGESIZE));
}

// 0 where the kernel does not tell.
Uint64 residentOctets() {
    std::ifstream file("/proc/self/statm");
    Uint64 virtualPages = 0;
    Uint64 residentPages = 0;
    file >> virtualPages >> residentPages;
    return residentPages * pageSize();
}

}  // namespace

std::size_t MemoryBoundedSource::read(char* buffer, std::size_t capacity) {
    const std::size_t count = answer.read(buffer, capacity);
    octets += count;
    if (octets >= nextLook) {
        nextLook += kStep;
        look();
    }
    return count;
}

void MemoryBoundedSource::look() {
    const Uint64 use = residentOctets();
    if (firstUse == 0) {
        firstUse = use;
    } else if (use > firstUse && use - firstUse > limit) {
        throw CIMClientMalformedHTTPException("HTTP answer needs more memory than the limit");
    }
}

Uint64 memoryForOneAnswer() {
    Uint64 most = static_cast<Uint64>(::sysconf(_SC_PHYS_PAGES)) * pageSize();
    rlimit allowed{};
    if (::getrlimit(RLIMIT_AS, &allowed) == 0) {
        most = std::min<Uint64>(most, allowed.rlim_cur);
    }
    return most / 4;
}

}  // namespace Pegasus
