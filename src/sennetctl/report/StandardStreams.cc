#include "report/StandardStreams.h"

#include <sys/ioctl.h>
#include <unistd.h>

#include <cstdlib>
#include <iostream>
#include <string_view>
#include <system_error>

namespace sennetctl {

namespace {

/// Whether there is a terminal that moves its cursor and shows colours.
bool takesEscapes(int descriptor) {
    const char* kind = std::getenv("TERM");
    return ::isatty(descriptor) == 1 && (kind == nullptr || std::string_view(kind) != "dumb");
}

/// As https://no-color.org has it: any value but the empty one refuses colours.
bool wantsColour() {
    const char* refused = std::getenv("NO_COLOR");
    return takesEscapes(STDOUT_FILENO) && (refused == nullptr || *refused == '\0');
}

/// 0 for what is no terminal, and for one that does not tell.
std::size_t lineWidthOf(int descriptor) {
    winsize size = {};
    return ::ioctl(descriptor, TIOCGWINSZ, &size) == 0 ? size.ws_col : 0;
}

}  // namespace

StandardStreams::StandardStreams()
    : buffer(STDOUT_FILENO), out(&buffer), usualTie(std::cerr.tie(&out)) {}

StandardStreams::~StandardStreams() {
    std::cerr.tie(usualTie);
}

Output StandardStreams::output(bool json) {
    return {out,
            std::cerr,
            json,
            wantsColour(),
            takesEscapes(STDERR_FILENO),
            lineWidthOf(STDOUT_FILENO)};
}

std::string StandardStreams::flush() {
    if (out.flush()) {
        return {};
    }
    return "standard output: " + std::generic_category().message(buffer.error());
}

}  // namespace sennetctl
