#include "CommandLine.h"
#include "process/ProcessGuards.h"

int main(int argc, char** argv) {
    if (!holdStandardStreams()) {
        return 2;
    }
    return sennetctl::runCommandLine(argc, argv);
}
