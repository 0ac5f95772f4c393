#include "CommandLine.h"

int main(int argc, char** argv) {
    return sennetctl::runCommandLine(argc, argv);
}
