// How long a client waits for the first answer when it starts cimomd for itself, beside what the
// start of the smallest program takes.
//
//   embedded-start CIMOMD [ROUNDS]

#include <fcntl.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

using Clock = std::chrono::steady_clock;
using Milliseconds = std::chrono::duration<double, std::milli>;

constexpr int kChildDescriptor = 3;

pid_t start(std::vector<std::string> words, int inherited) {
    std::vector<char*> argv;
    for (std::string& word : words)
        argv.push_back(word.data());
    argv.push_back(nullptr);
    const pid_t child = ::fork();
    if (child < 0)
        throw std::runtime_error("no child");
    if (child != 0)
        return child;
    if (inherited == kChildDescriptor)
        ::fcntl(inherited, F_SETFD, 0);
    else if (inherited >= 0)
        ::dup2(inherited, kChildDescriptor);
    ::execv(argv[0], argv.data());
    ::_exit(127);
}

std::string request() {
    const std::string body =
        "<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"><MESSAGE ID=\"1\" PROTOCOLVERSION=\"1.0\">"
        "<SIMPLEREQ><IMETHODCALL NAME=\"GetClass\"><LOCALNAMESPACEPATH><NAMESPACE NAME=\"root\"/>"
        "<NAMESPACE NAME=\"cimv2\"/></LOCALNAMESPACEPATH><IPARAMVALUE NAME=\"ClassName\">"
        "<CLASSNAME NAME=\"CIM_ManagedElement\"/></IPARAMVALUE></IMETHODCALL></SIMPLEREQ>"
        "</MESSAGE></CIM>";
    return "POST /cimom HTTP/1.1\r\nHost: localhost\r\nContent-Type: application/xml\r\n"
           "CIMOperation: MethodCall\r\nContent-Length: " +
           std::to_string(body.size()) + "\r\n\r\n" + body;
}

void awaitAnswer(int socket) {
    std::string answer;
    std::array<char, 65536> buffer;
    while (answer.find("</CIM>") == std::string::npos) {
        const ssize_t size = ::recv(socket, buffer.data(), buffer.size(), 0);
        if (size <= 0)
            throw std::runtime_error("cimomd gave no answer");
        answer.append(buffer.data(), static_cast<std::size_t>(size));
    }
    if (answer.find("<CLASS ") == std::string::npos)
        throw std::runtime_error("cimomd gave no class");
}

Milliseconds firstAnswer(const std::string& program) {
    std::array<int, 2> ends{};
    if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) != 0)
        throw std::runtime_error("no socket");
    const auto begin = Clock::now();
    const pid_t child = start({program, "--fd", std::to_string(kChildDescriptor)}, ends[1]);
    ::close(ends[1]);
    const std::string text = request();
    static_cast<void>(::send(ends[0], text.data(), text.size(), MSG_NOSIGNAL));
    awaitAnswer(ends[0]);
    const Milliseconds taken = Clock::now() - begin;
    ::close(ends[0]);
    ::waitpid(child, nullptr, 0);
    return taken;
}

Milliseconds wholeRun(const std::vector<std::string>& words) {
    const auto begin = Clock::now();
    const pid_t child = start(words, -1);
    ::waitpid(child, nullptr, 0);
    return Clock::now() - begin;
}

double median(std::vector<double> values) {
    std::sort(values.begin(), values.end());
    return values[values.size() / 2];
}

void compare(const std::string& program, int rounds) {
    std::vector<double> answers;
    std::vector<double> smallest;
    // In turns, so that a busy moment of the machine strikes both.
    for (int i = 0; i < rounds; ++i) {
        answers.push_back(firstAnswer(program).count());
        smallest.push_back(wholeRun({"/bin/true"}).count());
    }
    std::printf("first answer of cimomd  median %6.2f ms  least %6.2f ms\n", median(answers),
                *std::min_element(answers.begin(), answers.end()));
    std::printf("/bin/true               median %6.2f ms  least %6.2f ms\n", median(smallest),
                *std::min_element(smallest.begin(), smallest.end()));
    std::printf("ratio of the medians    %.1f\n", median(answers) / median(smallest));
}

}  // namespace

int main(int argc, char** argv) {
    try {
        if (argc < 2 || argc > 3)
            throw std::runtime_error("usage: embedded-start CIMOMD [ROUNDS]");
        const int rounds = argc == 3 ? std::atoi(argv[2]) : 50;
        if (rounds < 1)
            throw std::runtime_error("ROUNDS is at least 1");
        compare(argv[1], rounds);
        return 0;
    } catch (const std::exception& error) {
        std::fprintf(stderr, "embedded-start: %s\n", error.what());
        return 1;
    }
}
