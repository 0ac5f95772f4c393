// Any bytes as the body of a request: an answer or a refusal, never a crash.

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "mof/MofCompiler.h"
#include "protocol/CimService.h"

namespace {

constexpr std::string_view kClasses =
    "Qualifier Key : boolean = false, Scope(property), Flavor(DisableOverride);\n"
    "class Base { [Key] uint32 Id; string Note; };\nclass Leaf : Base { uint16 More[]; };\n";

/// Made once: the service keeps nothing from request to request.
struct Server {
    cimomd::ClassRepository repository;
    cimomd::ProviderList providers;
    cimomd::Dispatcher dispatcher{repository, providers};
    cimomd::CimService service{dispatcher};

    Server() {
        cimomd::MofCompiler(repository, Pegasus::CIMNamespaceName("root/cimv2"))
            .compileText(kClasses, "classes.mof");
    }
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const Server server;
    cimomd::HttpHead head;
    head.cimMethod = "GetClass";
    if (size % 2 == 0)
        head.te = "trailers";
    cimomd::HttpAnswer answer =
        server.service.answer(head, {reinterpret_cast<const char*>(data), size});
    std::array<char, 512> buffer;
    std::size_t count = 0;
    while (answer.body && answer.body->read(buffer.data(), buffer.size(), count) ==
                              cimomd::ResponseStream::Outcome::Data) {
    }
    return 0;
}
