// An answer of a million instances, over a socket, in the memory of a few.

#include <gtest/gtest.h>
#include <sys/socket.h>
#include <unistd.h>

#include <array>
#include <fstream>
#include <limits>
#include <string>
#include <string_view>

#include "mof/MofCompiler.h"
#include "protocol/HttpServer.h"
#include "providers/InstanceBuilder.h"

namespace cimomd {
namespace {

// A sanitizer keeps freed memory for a while, so that a peak says nothing; it is slow besides.
#ifdef SENNET_TEST_SANITIZED
constexpr bool kMeasuresMemory = false;
constexpr std::uint32_t kInstances = 20'000;
#else
constexpr bool kMeasuresMemory = true;
constexpr std::uint32_t kInstances = 1'000'000;
#endif
constexpr std::size_t kMaxMemoryKiB = std::size_t{64} << 10;
constexpr std::string_view kInstanceStart = "<VALUE.NAMEDINSTANCE>";

class CountingStream : public InstanceStream {
  public:
    bool next(ProvidedInstance& out) override {
        if (last == kInstances)
            return false;
        InstanceBuilder builder("Test_Item");
        builder.value<Pegasus::Uint32>("Id", ++last);
        out = builder.take();
        return true;
    }

  private:
    std::uint32_t last = 0;
};

class CountingProvider : public Provider {
  public:
    const char* className() const override { return "Test_Item"; }
    std::unique_ptr<InstanceStream> enumerate() const override {
        return std::make_unique<CountingStream>();
    }
};

ProviderList onlyCounting() {
    ProviderList providers;
    providers.push_back(std::make_unique<CountingProvider>());
    return providers;
}

std::shared_ptr<const ClassRepository> itemClass(const Pegasus::CIMNamespaceName& nameSpace) {
    auto classes = std::make_shared<ClassRepository>();
    MofCompiler(*classes, nameSpace)
        .compileText(
            "Qualifier Key : boolean = false, Scope(property, reference), Flavor(DisableOverride);"
            "class Test_Item { [Key] uint32 Id; };",
            "item.mof");
    return classes;
}

std::string enumerateRequest() {
    const std::string body =
        "<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"><MESSAGE ID=\"1\" PROTOCOLVERSION=\"1.0\">"
        "<SIMPLEREQ><IMETHODCALL NAME=\"EnumerateInstances\"><LOCALNAMESPACEPATH>"
        "<NAMESPACE NAME=\"root\"/><NAMESPACE NAME=\"cimv2\"/></LOCALNAMESPACEPATH>"
        "<IPARAMVALUE NAME=\"ClassName\"><CLASSNAME NAME=\"Test_Item\"/></IPARAMVALUE>"
        "</IMETHODCALL></SIMPLEREQ></MESSAGE></CIM>";
    return "POST /cimom HTTP/1.1\r\nHost: localhost\r\nContent-Type: application/xml\r\n"
           "CIMOperation: MethodCall\r\nConnection: close\r\nContent-Length: " +
           std::to_string(body.size()) + "\r\n\r\n" + body;
}

/// Takes the framing of chunks out of a stream that comes in pieces of any size.
class ChunkReader {
  public:
    /// Appends the content in `bytes` to `content`.
    void read(std::string_view bytes, std::string& content) {
        while (!bytes.empty()) {
            if (left > 0) {
                const std::string_view piece = bytes.substr(0, left);
                content += piece;
                left -= piece.size();
                bytes.remove_prefix(piece.size());
                continue;
            }
            line += bytes.front();
            bytes.remove_prefix(1);
            if (line.size() > 2 && line.ends_with("\r\n")) {
                left = std::stoul(line, nullptr, 16);
                line.clear();
            }
        }
    }

  private:
    std::size_t left = 0;
    std::string line;
};

/// How often kInstanceStart stands in a text that comes in pieces; `rest` keeps the end of each.
std::size_t countStarts(std::string& rest) {
    std::size_t count = 0;
    std::size_t behind = 0;
    for (std::size_t at = rest.find(kInstanceStart); at != std::string::npos;
         at = rest.find(kInstanceStart, behind)) {
        ++count;
        behind = at + kInstanceStart.size();
    }
    const std::size_t keepFrom =
        rest.size() < kInstanceStart.size() ? 0 : rest.size() - kInstanceStart.size() + 1;
    rest.erase(0, std::max(behind, keepFrom));
    return count;
}

std::size_t peakMemoryKiB() {
    std::ifstream status("/proc/self/status");
    std::string word;
    std::size_t amount = std::numeric_limits<std::size_t>::max();
    while (status >> word) {
        if (word == "VmHWM:")
            status >> amount;
    }
    return amount;
}

struct Received {
    std::size_t instances = 0;
    bool whole = false;
};

Received receive(int socket) {
    Received result;
    std::array<char, 65536> buffer;
    std::string head;
    ChunkReader chunks;
    std::string content;
    for (ssize_t size = ::recv(socket, buffer.data(), buffer.size(), 0); size > 0;
         size = ::recv(socket, buffer.data(), buffer.size(), 0)) {
        std::string_view bytes(buffer.data(), static_cast<std::size_t>(size));
        if (!head.ends_with("\r\n\r\n")) {
            while (!bytes.empty() && !head.ends_with("\r\n\r\n")) {
                head += bytes.front();
                bytes.remove_prefix(1);
            }
        }
        chunks.read(bytes, content);
        result.whole = result.whole || content.find("</CIM>") != std::string::npos;
        result.instances += countStarts(content);
    }
    return result;
}

TEST(ManyInstances, streamThroughLittleMemory) {
    const Pegasus::CIMNamespaceName nameSpace("root/cimv2");
    const ProviderList providers = onlyCounting();
    const ProviderIndex index(providers, nameSpace);
    const CurrentRepository repository(itemClass(nameSpace));
    const Dispatcher dispatcher(repository, index);
    const CimService service(dispatcher);
    HttpServer server(service, {1, std::chrono::seconds(30)});
    server.start([] {});
    std::array<int, 2> ends{};
    ASSERT_EQ(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()), 0);
    ASSERT_TRUE(server.serve(ends[1]));
    const std::string request = enumerateRequest();
    ASSERT_EQ(::send(ends[0], request.data(), request.size(), MSG_NOSIGNAL),
              static_cast<ssize_t>(request.size()));
    const Received received = receive(ends[0]);
    ::close(ends[0]);
    EXPECT_TRUE(received.whole);
    EXPECT_EQ(received.instances, kInstances);
    if (kMeasuresMemory) {
        EXPECT_LT(peakMemoryKiB(), kMaxMemoryKiB);
    }
    RecordProperty("peakMemoryKiB", std::to_string(peakMemoryKiB()));
}

}  // namespace
}  // namespace cimomd
