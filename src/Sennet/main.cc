#include "Sennet/Driver.h"
#include "process/ProcessGuards.h"

int main(int argc, char** argv) {
    if (!holdStandardStreams()) {
        return 1;
    }
    keepOthersFromWriting();
    outliveFileSizeLimit();
    endWhenMemoryIsShort("sennet");
    return runSennet(argc, argv);
}
