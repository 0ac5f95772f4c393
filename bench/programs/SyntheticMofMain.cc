// Prints a synthetic class of 20 properties and its instances as MOF.
//
//   synthetic-mof INSTANCES

#include <cstdio>
#include <cstdlib>

#include "bench/synthetic/SyntheticMof.h"

int main(int argc, char** argv) {
    constexpr std::size_t kProperties = 20;
    const unsigned long instances = argc == 2 ? std::strtoul(argv[1], nullptr, 10) : 0;
    if (instances == 0) {
        std::fputs("usage: synthetic-mof INSTANCES\n", stderr);
        return 1;
    }
    const bench::SyntheticClass synthetic = bench::makeClass(0, kProperties);
    bench::Random random(1);
    std::fputs(bench::classMof(synthetic).c_str(), stdout);
    for (unsigned long i = 0; i < instances; ++i) {
        const bench::InstanceTexts texts = bench::makeInstance(synthetic, i, random);
        std::fputs(bench::instanceMof(synthetic, texts).c_str(), stdout);
    }
    return std::fflush(stdout) == 0 ? 0 : 1;
}
