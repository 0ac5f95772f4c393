// Stands in for cimomd where a test starts it as a child: answers on the descriptor of "--fd N"
// until the connection is closed. What the child was given is what it tells:
//
//   EnumerateInstances of Fake_Process: one instance with its Pid, Arguments, Environment,
//     Descriptors ("0 /dev/null" and so on) and BlockedOrIgnoredSignals;
//   GetClass of Fake_Thing: a class without properties;
//   GetClass of Fake_End: ends without an answer;
//   GetClass of Fake_Stubborn: a class, and from then on it neither heeds SIGTERM nor the end of
//     the connection.

#include <dirent.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "support/ReplySender.h"
#include "support/RequestReader.h"

extern char** environ;

namespace {

using support::RecordedRequest;
using support::Reply;

std::vector<std::string> openDescriptors() {
    std::vector<std::string> found;
    for (int number = 0; number < 1024; ++number) {
        struct stat status {};
        if (fstat(number, &status) != 0) {
            continue;
        }
        std::array<char, 256> target{};
        const std::string link = "/proc/self/fd/" + std::to_string(number);
        const ssize_t length = readlink(link.c_str(), target.data(), target.size() - 1);
        std::string name = length > 0 ? target.data() : "?";
        if (S_ISSOCK(status.st_mode)) {
            name = "socket";
        }
        found.push_back(std::to_string(number) + " " + name);
    }
    return found;
}

unsigned blockedOrIgnoredSignals() {
    sigset_t blocked;
    sigprocmask(SIG_SETMASK, nullptr, &blocked);
    unsigned count = 0;
    for (int number = 1; number < NSIG; ++number) {
        struct sigaction action {};
        const bool ignored =
            sigaction(number, nullptr, &action) == 0 && action.sa_handler == SIG_IGN;
        if (ignored || sigismember(&blocked, number) == 1) {
            ++count;
        }
    }
    return count;
}

std::string number(const std::string& name, unsigned long value) {
    return "<PROPERTY NAME=\"" + name + "\" TYPE=\"uint32\"><VALUE>" + std::to_string(value) +
           "</VALUE></PROPERTY>";
}

std::string texts(const std::string& name, const std::vector<std::string>& values) {
    std::string xml = "<PROPERTY.ARRAY NAME=\"" + name + "\" TYPE=\"string\"><VALUE.ARRAY>";
    for (const std::string& value : values) {
        xml += "<VALUE>" + value + "</VALUE>";
    }
    return xml + "</VALUE.ARRAY></PROPERTY.ARRAY>";
}

Reply processReply(const std::vector<std::string>& arguments) {
    std::vector<std::string> environment;
    for (char** entry = environ; *entry != nullptr; ++entry) {
        // A build for coverage adds a variable of its own.
        if (std::string_view(*entry).substr(0, 15) != "__LLVM_PROFILE_")
            environment.emplace_back(*entry);
    }
    return Reply::ok(
        "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"Fake_Process\"/>"
        "<INSTANCE CLASSNAME=\"Fake_Process\">" +
        number("Pid", static_cast<unsigned long>(getpid())) + texts("Arguments", arguments) +
        texts("Environment", environment) + texts("Descriptors", openDescriptors()) +
        number("BlockedOrIgnoredSignals", blockedOrIgnoredSignals()) +
        "</INSTANCE></VALUE.NAMEDINSTANCE>");
}

Reply replyTo(const RecordedRequest& request, const std::vector<std::string>& arguments) {
    if (request.method == "EnumerateInstances" && request.className == "Fake_Process") {
        return processReply(arguments);
    }
    if (request.className == "Fake_End") {
        _exit(0);
    }
    return Reply::ok("<CLASS NAME=\"" + request.className + "\"/>");
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3 || std::strcmp(argv[1], "--fd") != 0) {
        return 2;
    }
    const std::vector<std::string> arguments(argv + 1, argv + argc);
    const int connection = std::atoi(argv[2]);
    support::RequestReader reader(connection, -1);
    bool stubborn = false;
    while (const std::optional<RecordedRequest> request = reader.next()) {
        if (request->className == "Fake_Stubborn") {
            stubborn = true;
            std::signal(SIGTERM, SIG_IGN);
        }
        support::sendReply(connection, -1, replyTo(*request, arguments), *request);
    }
    while (stubborn) {
        pause();
    }
    return 0;
}
