#include <fcntl.h>
#include <unistd.h>

#include <iostream>

#include "CommandLine.h"
#include "process/ProcessGuards.h"
#include "report/Output.h"

int main(int argc, char** argv) {
    const bool outputIsClosed = ::fcntl(STDOUT_FILENO, F_GETFD) < 0;
    if (!holdStandardStreams()) {
        return sennetctl::kCannotRun;
    }
    if (outputIsClosed) {
        std::cerr << "sennetctl: standard output is closed\n";
        return sennetctl::kCannotRun;
    }
    return sennetctl::runCommandLine(argc, argv);
}
