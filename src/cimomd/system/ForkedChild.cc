#include "system/ForkedChild.h"

#include <unistd.h>

#include <algorithm>

namespace cimomd {
namespace {

void closeRange(unsigned int first, unsigned int last) {
    if (::close_range(first, last, 0) == 0)
        return;
    constexpr unsigned int kUsualLimit = 65536;
    for (unsigned int number = first; number <= std::min(last, kUsualLimit); ++number)
        ::close(static_cast<int>(number));
}

}  // namespace

void closeOthers(unsigned int first, unsigned int kept) {
    if (kept > first)
        closeRange(first, kept - 1);
    closeRange(std::max(first, kept + 1), ~0U);
}

}  // namespace cimomd
