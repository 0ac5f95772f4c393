// What a server may send to the client over HTTP: status line, header, coded body, trailer, and
// what the client reads out of them. None of it may crash, hang or be read past its limits.

#include <Pegasus/Common/Exception.h>
#include <fcntl.h>
#include <sys/socket.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>

#include "client/AnswerStatus.h"
#include "client/FileDescriptor.h"
#include "client/HttpExchange.h"
#include "client/LocalAuthentication.h"

namespace {

constexpr std::size_t kBodyLimit = 4096;
constexpr std::size_t kHeadLimit = 2048;

void exchange(int connection) {
    using namespace Pegasus;
    const HttpRequest request{{"Content-Type: text/xml"}, "<x/>"};
    HttpExchange current(connection, request, Deadline(10000), HttpLimits{kBodyLimit, kHeadLimit});
    const HttpAnswer& answer = current.awaitHead();
    if (const std::string* challenge = answer.header().find("WWW-Authenticate")) {
        challengeFile(*challenge);
    }
    checkHead(answer);
    std::array<char, 100> buffer{};
    std::size_t total = 0;
    while (const std::size_t count = current.read(buffer.data(), buffer.size())) {
        total += count;
    }
    if (total > kBodyLimit) {
        std::abort();
    }
    checkReportedStatus(answer);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::array<int, 2> ends{};
    if (size > 16384 ||
        socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0, ends.data()) != 0) {
        return 0;
    }
    const Pegasus::FileDescriptor client(ends[0]);
    const Pegasus::FileDescriptor server(ends[1]);
    if (send(server.get(), data, size, MSG_NOSIGNAL) < 0 || shutdown(server.get(), SHUT_WR) != 0) {
        std::abort();
    }
    try {
        exchange(client.get());
    } catch (const Pegasus::ConnectionTimeoutException&) {
        std::abort();  // everything was there from the beginning
    } catch (const Pegasus::Exception&) {
    }
    return 0;
}
