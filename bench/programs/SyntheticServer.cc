// Answers for a synthetic inventory out of its memory, so that what a client takes is the client's.
//
//   synthetic-server SOCKET DIRECTORY CLASSES PROPERTIES INSTANCES
//
// Writes the inventory scripts into DIRECTORY, makes all answers, listens at SOCKET and prints
// "ready". Serves one connection at a time until it is killed.

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <stdexcept>
#include <string>
#include <string_view>

#include "bench/programs/LocalSocket.h"
#include "bench/synthetic/ReadyInventory.h"
#include "bench/synthetic/SyntheticScripts.h"

namespace {

using bench::LocalSocket;
using bench::ReadyAnswer;
using bench::ReadyInventory;

std::string_view between(std::string_view text, std::string_view before, std::string_view after) {
    const std::size_t start = text.find(before);
    if (start == std::string_view::npos) {
        return {};
    }
    text.remove_prefix(start + before.size());
    return text.substr(0, text.find(after));
}

/// Whole requests of one connection.
class Requests {
  public:
    explicit Requests(const LocalSocket& peer) : peer(peer) {}

    /// Empty when the peer has gone.
    std::string next() {
        constexpr std::string_view kHeadEnd = "\r\n\r\n";
        while (received.find(kHeadEnd) == std::string::npos) {
            if (!more()) {
                return {};
            }
        }
        const std::size_t bodyStart = received.find(kHeadEnd) + kHeadEnd.size();
        const std::string length(between(received, "Content-Length: ", "\r\n"));
        const std::size_t size = bodyStart + std::strtoul(length.c_str(), nullptr, 10);
        while (received.size() < size) {
            if (!more()) {
                return {};
            }
        }
        std::string request = received.substr(0, size);
        received.erase(0, size);
        return request;
    }

  private:
    bool more() {
        constexpr std::size_t kPiece = 16384;
        const std::size_t before = received.size();
        received.resize(before + kPiece);
        received.resize(before + peer.receive(received.data() + before, kPiece));
        return received.size() != before;
    }

    const LocalSocket& peer;
    std::string received;
};

bool answer(const ReadyInventory& inventory, const LocalSocket& peer, std::string_view request) {
    const ReadyAnswer* found = inventory.find(between(request, "<IMETHODCALL NAME=\"", "\""),
                                              between(request, "<CLASSNAME NAME=\"", "\""));
    if (found == nullptr) {
        return peer.send("HTTP/1.1 404 Not Found\r\nContent-Length: 0\r\n\r\n");
    }
    return peer.send(found->beginning(between(request, "<MESSAGE ID=\"", "\""))) &&
           peer.send(found->rest());
}

void serve(const ReadyInventory& inventory, const LocalSocket& peer) {
    Requests requests(peer);
    for (std::string request = requests.next(); !request.empty(); request = requests.next()) {
        if (!answer(inventory, peer, request)) {
            return;
        }
    }
}

std::size_t count(const char* text) {
    const std::size_t value = std::strtoul(text, nullptr, 10);
    if (value == 0) {
        throw std::runtime_error(std::string("not a count: ") + text);
    }
    return value;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        if (argc != 6) {
            throw std::runtime_error(
                "usage: synthetic-server SOCKET DIRECTORY CLASSES PROPERTIES INSTANCES");
        }
        const ReadyInventory inventory({count(argv[3]), count(argv[4]), count(argv[5])});
        bench::writeScripts(argv[2], inventory.classes());
        const LocalSocket listening = LocalSocket::listenAt(argv[1]);
        std::puts("ready");
        std::fflush(stdout);
        for (;;) {
            serve(inventory, listening.accept());
        }
    } catch (const std::exception& error) {
        std::fprintf(stderr, "synthetic-server: %s\n", error.what());
        return 1;
    }
}
