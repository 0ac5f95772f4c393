#include "RunningCimomd.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <chrono>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <thread>

namespace cimomd {
namespace {

constexpr int kPatienceMs = 10000;
constexpr auto kPatience = std::chrono::milliseconds(kPatienceMs);
constexpr auto kPause = std::chrono::milliseconds(5);

bool isWholeAnswer(const std::string& text) {
    const std::size_t headEnd = text.find("\r\n\r\n");
    if (headEnd == std::string::npos)
        return false;
    const std::string head = text.substr(0, headEnd);
    if (head.find("Transfer-Encoding: chunked") != std::string::npos) {
        const std::size_t lastChunk = text.find("\r\n0\r\n", headEnd);
        return lastChunk != std::string::npos &&
               text.find("\r\n\r\n", lastChunk + 3) != std::string::npos;
    }
    const std::size_t length = head.find("Content-Length: ");
    return length != std::string::npos &&
           text.size() - headEnd - 4 >= std::stoul(head.substr(length + 16));
}

/// In the child: what sd_listen_fds(3) looks for. The descriptor's new number.
int activate(int listeningSocket) {
    constexpr int kFirstHandedOver = 3;
    ::dup2(listeningSocket, kFirstHandedOver);
    ::setenv("LISTEN_FDS", "1", 1);
    ::setenv("LISTEN_PID", std::to_string(::getpid()).c_str(), 1);
    return kFirstHandedOver;
}

}  // namespace

Connection::Connection(const std::string& socketPath)
    : descriptor(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0)) {
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    std::strncpy(address.sun_path, socketPath.c_str(), sizeof address.sun_path - 1);
    if (::connect(descriptor, reinterpret_cast<sockaddr*>(&address), sizeof address) != 0)
        close();
}

void Connection::send(std::string_view bytes) const {
    while (!bytes.empty()) {
        const ssize_t count = ::send(descriptor, bytes.data(), bytes.size(), MSG_NOSIGNAL);
        if (count <= 0)
            return;
        bytes.remove_prefix(static_cast<std::size_t>(count));
    }
}

std::string Connection::readMore() const {
    std::array<char, 65536> buffer;
    pollfd waiting{descriptor, POLLIN, 0};
    if (::poll(&waiting, 1, kPatienceMs) <= 0)
        return {};
    const ssize_t count = ::recv(descriptor, buffer.data(), buffer.size(), 0);
    return count <= 0 ? std::string() : std::string(buffer.data(), static_cast<size_t>(count));
}

std::string Connection::readToEnd() const {
    std::string text;
    for (std::string piece = readMore(); !piece.empty(); piece = readMore())
        text += piece;
    return text;
}

std::string Connection::readAnswer() const {
    std::string text;
    for (std::string piece = readMore(); !piece.empty(); piece = readMore()) {
        text += piece;
        if (isWholeAnswer(text))
            break;
    }
    return text;
}

bool Connection::peerHasClosed() const {
    char byte = 0;
    return ::recv(descriptor, &byte, 1, MSG_DONTWAIT) == 0;
}

void Connection::close() {
    if (descriptor >= 0)
        ::close(descriptor);
    descriptor = -1;
}

RunningCimomd::RunningCimomd(const std::vector<std::string>& arguments, int inherited,
                             Handover handover) {
    std::vector<std::string> words{TEST_BIN_DIR "/cimomd"};
    words.insert(words.end(), arguments.begin(), arguments.end());
    std::vector<char*> argv;
    for (std::string& word : words)
        argv.push_back(word.data());
    argv.push_back(nullptr);
    child = ::fork();
    if (child != 0)
        return;
    if (handover == Handover::Activation)
        inherited = activate(inherited);
    if (inherited >= 0)
        ::fcntl(inherited, F_SETFD, 0);
    const int quiet = ::open("/dev/null", O_WRONLY);
    ::dup2(quiet, STDOUT_FILENO);
    ::dup2(quiet, STDERR_FILENO);
    ::execv(argv[0], argv.data());
    ::_exit(127);
}

RunningCimomd::~RunningCimomd() {
    if (!hasEnded()) {
        ::kill(child, SIGKILL);
        ::waitpid(child, nullptr, 0);
    }
}

void RunningCimomd::signal(int number) const {
    ::kill(child, number);
}

bool RunningCimomd::hasEnded() {
    if (!ended && ::waitpid(child, &status, WNOHANG) == child)
        ended = true;
    return ended;
}

int RunningCimomd::wait() {
    const auto deadline = std::chrono::steady_clock::now() + kPatience;
    while (!hasEnded()) {
        if (std::chrono::steady_clock::now() > deadline)
            return -1;
        std::this_thread::sleep_for(kPause);
    }
    return WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
}

bool RunningCimomd::serves(const std::string& socketPath) {
    const auto deadline = std::chrono::steady_clock::now() + kPatience;
    while (std::chrono::steady_clock::now() < deadline && !hasEnded()) {
        if (Connection(socketPath).isOpen())
            return true;
        std::this_thread::sleep_for(kPause);
    }
    return false;
}

std::string postOf(std::string_view body, std::string_view moreHeaders) {
    return "POST /cimom HTTP/1.1\r\nHost: localhost\r\nContent-Type: application/xml; "
           "charset=utf-8\r\nCIMOperation: MethodCall\r\nContent-Length: " +
           std::to_string(body.size()) + "\r\n" + std::string(moreHeaders) + "\r\n" +
           std::string(body);
}

}  // namespace cimomd
