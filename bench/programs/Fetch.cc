// The client library alone: what it takes to have all instances of a class in memory.
//
//   fetch [-n TIMES] CLASS...
//
// Prints how many instances it got.

#include <Pegasus/Client/CIMClient.h>

#include <cstdio>
#include <cstdlib>
#include <string_view>

namespace {

constexpr Pegasus::Uint32 kTimeoutMilliseconds = 180000;

unsigned long fetch(Pegasus::CIMClient& client, const char* className) {
    return client
        .enumerateInstances(Pegasus::CIMNamespaceName("root/cimv2"), Pegasus::CIMName(className),
                            true, false, true)
        .size();
}

}  // namespace

int main(int argc, char** argv) {
    int first = 1;
    long times = 1;
    if (argc > 2 && std::string_view(argv[1]) == "-n") {
        times = std::strtol(argv[2], nullptr, 10);
        first = 3;
    }
    if (argc <= first || times < 1) {
        std::fputs("usage: fetch [-n TIMES] CLASS...\n", stderr);
        return 1;
    }
    try {
        Pegasus::CIMClient client;
        client.setTimeout(kTimeoutMilliseconds);
        client.connectLocal();
        unsigned long instances = 0;
        for (long turn = 0; turn < times; ++turn) {
            for (int i = first; i < argc; ++i) {
                instances += fetch(client, argv[i]);
            }
        }
        std::printf("%lu instances\n", instances);
        return 0;
    } catch (const Pegasus::Exception& error) {
        std::fprintf(stderr, "fetch: %s\n",
                     static_cast<const char*>(error.getMessage().getCString()));
        return 1;
    }
}
