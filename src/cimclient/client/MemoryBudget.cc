#include "client/MemoryBudget.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <malloc.h>
#include <sys/resource.h>
#include <unistd.h>

#include <algorithm>
#include <fstream>
#include <limits>

#include "client/ControlGroupMemory.h"

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

void MemoryBudget::take(std::size_t octets) {
    sinceLook += octets;
    if (sinceLook >= kStep) {
        sinceLook = 0;
        look();
    }
}

void MemoryBudget::look() {
    if (firstUse == 0) {
        firstUse = residentOctets();
        if (!limit) {
            limit = memoryForAnswers();
        }
        return;
    }
    if (!isExceeded()) {
        return;
    }
    // What was freed meanwhile may still be counted.
    ::malloc_trim(0);
    if (isExceeded()) {
        throw CIMClientMalformedHTTPException("HTTP answer needs more memory than the limit");
    }
}

bool MemoryBudget::isExceeded() const {
    const Uint64 use = residentOctets();
    return use > firstUse && use - firstUse > *limit;
}

Uint64 addressSpaceLimit() {
    static_assert(RLIM_INFINITY == std::numeric_limits<Uint64>::max());
    rlimit allowed{};
    return ::getrlimit(RLIMIT_AS, &allowed) == 0 ? allowed.rlim_cur : RLIM_INFINITY;
}

Uint64 memoryForAnswers(const std::string& root, Uint64 addressSpace) {
    const Uint64 installed = static_cast<Uint64>(::sysconf(_SC_PHYS_PAGES)) * pageSize();
    return std::min({installed, addressSpace, controlGroupMemoryLimit(root)}) / 4;
}

}  // namespace Pegasus
