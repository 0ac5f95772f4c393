#include "service/MainLoop.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <thread>

#include "CimRequests.h"
#include "RunningCimomd.h"
#include "ServedModel.h"

namespace cimomd {
namespace {

constexpr const char* kClasses =
    "Qualifier Key : boolean = false, Scope(property, reference), Flavor(DisableOverride);"
    "class Test_Item { [Key] uint32 Id; };";

/// Tells that it was asked, and never answers.
class HangingProvider : public Provider {
  public:
    explicit HangingProvider(int toldDescriptor) : told(toldDescriptor) {}

    const char* className() const override { return "Test_Item"; }
    std::unique_ptr<InstanceStream> enumerate() const override {
        static_cast<void>(::write(told, "!", 1) == 1);
        std::this_thread::sleep_for(std::chrono::hours(1));
        return nullptr;
    }

  private:
    int told;
};

/// Serves one connection until it is told to stop; never returns.
[[noreturn]] void serveHanging(int connection, int told) {
    constexpr int kEndedInOrder = 7;
    {
        Signals signals;
        ProviderList providers;
        providers.push_back(std::make_unique<HangingProvider>(told));
        const ServedModel model(kClasses, std::move(providers));
        const CimService service(model.dispatcher);
        HttpServer server(service, {1, std::chrono::seconds(0)});
        MainLoop loop(server, signals);
        loop.serveOnly(connection);
        loop.run([] {});
    }
    ::_exit(kEndedInOrder);
}

/// The status of the child as waitpid gives it; nothing when it lives on for ten seconds.
std::optional<int> statusOf(pid_t child) {
    constexpr int kTries = 1000;
    int status = 0;
    for (int i = 0; i < kTries; ++i) {
        if (::waitpid(child, &status, WNOHANG) == child)
            return status;
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    }
    ::kill(child, SIGKILL);
    ::waitpid(child, &status, 0);
    return std::nullopt;
}

TEST(MainLoop, endsAlthoughASourceDoesNotAnswer) {
    std::array<int, 2> ends{};
    std::array<int, 2> told{};
    ASSERT_EQ(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()), 0);
    ASSERT_EQ(::pipe2(told.data(), O_CLOEXEC), 0);
    const pid_t child = ::fork();
    if (child == 0)
        serveHanging(ends[1], told[1]);
    ::close(ends[1]);
    ::close(told[1]);
    const Connection connection(ends[0]);
    connection.send(postOf(requestBody("EnumerateInstances", "root/cimv2", "Test_Item")));
    char byte = 0;
    EXPECT_EQ(::read(told[0], &byte, 1), 1);
    ::close(told[0]);
    ::kill(child, SIGTERM);
    EXPECT_EQ(statusOf(child), 0);
}

}  // namespace
}  // namespace cimomd
