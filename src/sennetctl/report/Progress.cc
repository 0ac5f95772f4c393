#include "report/Progress.h"

#include <ostream>

#include "report/Text.h"

namespace sennetctl {

void Progress::show(const std::string& text) const {
    if (output.progress) {
        output.err << "\r\x1B[K" << printable(text) << std::flush;
    }
}

}  // namespace sennetctl
