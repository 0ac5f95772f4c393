#include "Sennet/Driver.h"

int main(int argc, char** argv) {
    return runSennet(argc, argv);
}
