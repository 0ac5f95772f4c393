// Any bytes as the body of a request: an answer or a refusal, never a crash.

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "mof/MofCompiler.h"
#include "protocol/CimService.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"

namespace {

constexpr std::string_view kClasses =
    "Qualifier Key : boolean = false, Scope(property), Flavor(DisableOverride);\n"
    "class Base { [Key] uint32 Id; string Note; };\nclass Leaf : Base { uint16 More[]; };\n";

class LeafProvider : public cimomd::Provider {
  public:
    const char* className() const override { return "Leaf"; }
    std::unique_ptr<cimomd::InstanceStream> enumerate() const override {
        return std::make_unique<cimomd::RecordStream<Pegasus::Uint32>>(
            std::vector<Pegasus::Uint32>{1, 2}, [](const Pegasus::Uint32& id) {
                cimomd::InstanceBuilder builder("Leaf");
                builder.value<Pegasus::Uint32>("Id", id).text("Note", "n");
                return builder.take();
            });
    }
};

cimomd::ProviderList oneProvider() {
    cimomd::ProviderList providers;
    providers.push_back(std::make_unique<LeafProvider>());
    return providers;
}

std::shared_ptr<const cimomd::ClassRepository> compiledClasses() {
    auto classes = std::make_shared<cimomd::ClassRepository>();
    cimomd::MofCompiler(*classes, Pegasus::CIMNamespaceName("root/cimv2"))
        .compileText(kClasses, "classes.mof");
    return classes;
}

/// Made once: the service keeps nothing from request to request.
struct Server {
    cimomd::ProviderList providers = oneProvider();
    cimomd::ProviderIndex index{providers, Pegasus::CIMNamespaceName("root/cimv2")};
    cimomd::CurrentRepository repository{compiledClasses()};
    cimomd::Dispatcher dispatcher{repository, index};
    cimomd::CimService service{dispatcher};
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const Server server;
    cimomd::HttpHead head;
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
