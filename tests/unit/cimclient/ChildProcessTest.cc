#include "client/ChildProcess.h"

#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <filesystem>
#include <iterator>
#include <string>

#include "TestConnections.h"
#include "support/Files.h"
#include "support/TempDirectory.h"

namespace Pegasus {
namespace {

using testing_client::messageOf;
using testing_client::Stopwatch;

struct Ends {
    FileDescriptor own;
    FileDescriptor child;
};

Ends makeEnds() {
    std::array<int, 2> ends{};
    EXPECT_EQ(socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()), 0);
    return {FileDescriptor(ends[0]), FileDescriptor(ends[1])};
}

std::size_t openDescriptorCount() {
    return static_cast<std::size_t>(
        std::distance(std::filesystem::directory_iterator("/proc/self/fd"),
                      std::filesystem::directory_iterator()));
}

bool hasChildren() {
    return waitpid(-1, nullptr, WNOHANG) >= 0 || errno != ECHILD;
}

std::string script(const support::TempDirectory& directory, const std::string& commands) {
    std::string path = directory.path("server");
    support::writeFile(path, "#!/bin/sh\n" + commands);
    chmod(path.c_str(), 0700);
    return path;
}

TEST(ChildProcessTest, RunsTheProgramAndReapsIt) {
    const std::size_t before = openDescriptorCount();
    {
        Ends ends = makeEnds();
        const ChildProcess child(FAKE_CIMOMD, std::move(ends.child), Deadline(5000));
        EXPECT_EQ(kill(child.id(), 0), 0);
        ends.own.reset();
    }
    EXPECT_EQ(openDescriptorCount(), before);
    EXPECT_FALSE(hasChildren());
}

TEST(ChildProcessTest, SaysWhyAProgramCannotBeRun) {
    const std::size_t before = openDescriptorCount();
    const support::TempDirectory directory;
    support::writeFile(directory.path("text"), "text");
    const auto start = [&](const std::string& program) {
        return messageOf<CannotConnectException>([&] {
            Ends ends = makeEnds();
            const ChildProcess child(program, std::move(ends.child), Deadline(5000));
        });
    };
    EXPECT_EQ(start(directory.path("none")),
              "Cannot start " + directory.path("none") + ": No such file or directory");
    EXPECT_EQ(start(directory.path("text")),
              "Cannot start " + directory.path("text") + ": Permission denied");
    chmod(directory.path("text").c_str(), 0700);
    EXPECT_EQ(start(directory.path("text")),
              "Cannot start " + directory.path("text") + ": Exec format error");
    EXPECT_EQ(openDescriptorCount(), before);
    EXPECT_FALSE(hasChildren());
}

TEST(ChildProcessTest, EndsAChildThatDoesNotEndByItself) {
    const support::TempDirectory directory;
    const std::string program = script(directory, "exec sleep 100\n");
    const Stopwatch watch;
    {
        Ends ends = makeEnds();
        const ChildProcess child(program, std::move(ends.child), Deadline(5000));
        ends.own.reset();
    }
    EXPECT_LT(watch.milliseconds(), 10000);
    EXPECT_FALSE(hasChildren());
}

TEST(ChildProcessTest, EndsAChildThatHeedsNoSignal) {
    const support::TempDirectory directory;
    const std::string program =
        script(directory, "trap '' TERM\necho x >&3\nwhile :; do sleep 1; done\n");
    {
        Ends ends = makeEnds();
        const ChildProcess child(program, std::move(ends.child), Deadline(5000));
        char octet = 0;
        ASSERT_EQ(read(ends.own.get(), &octet, 1), 1) << "the child never set its trap";
        ends.own.reset();
    }
    EXPECT_FALSE(hasChildren());
}

TEST(ChildProcessTest, AProgramThatIgnoresItsChildrenLosesNothing) {
    const auto before = std::signal(SIGCHLD, SIG_IGN);
    const Stopwatch watch;
    {
        Ends ends = makeEnds();
        const ChildProcess child(FAKE_CIMOMD, std::move(ends.child), Deadline(5000));
        ends.own.reset();
    }
    std::signal(SIGCHLD, before);
    EXPECT_LT(watch.milliseconds(), 900);
}

}  // namespace
}  // namespace Pegasus
