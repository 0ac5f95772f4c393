#include "support/TempDirectory.h"
#include "velmclient/FileDescriptor.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <pthread.h>
#include <signal.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <cerrno>
#include <string>
#include <thread>
#include <utility>

namespace Velm {
namespace {

using support::TempDirectory;

bool isOpen(int descriptor) {
    return ::fcntl(descriptor, F_GETFD) >= 0;
}

int openNull() {
    return ::open("/dev/null", O_RDWR | O_CLOEXEC);
}

void ignoreSignal(int /*number*/) {}

TEST(FileDescriptor, TheDescriptorIsClosedWithItsOwner) {
    const int number = openNull();
    {
        const FileDescriptor file(number);
        EXPECT_TRUE(file.isOpen());
        EXPECT_EQ(file.get(), number);
    }
    EXPECT_FALSE(isOpen(number));
}

TEST(FileDescriptor, MovingHandsItOver) {
    const int number = openNull();
    FileDescriptor first(number);
    FileDescriptor second(std::move(first));
    EXPECT_EQ(second.get(), number);
    const int replaced = openNull();
    FileDescriptor third(replaced);
    third = std::move(second);
    EXPECT_FALSE(isOpen(replaced));
    EXPECT_EQ(third.get(), number);
    EXPECT_TRUE(isOpen(number));
}

TEST(FileDescriptor, CloseReportsTheErrorAndClosingNothingIsNone) {
    FileDescriptor none;
    EXPECT_FALSE(none.isOpen());
    EXPECT_EQ(none.close(), 0);
    FileDescriptor stale(openNull());
    ::close(stale.get());
    EXPECT_EQ(stale.close(), EBADF);
    EXPECT_FALSE(stale.isOpen());
}

TEST(FileDescriptor, OpenRegularFileSaysWhyNot) {
    const TempDirectory directory;
    EXPECT_TRUE(FileDescriptor::openRegularFile(directory.write("a", "").c_str()).isOpen());
    EXPECT_FALSE(FileDescriptor::openRegularFile(directory.path("b").c_str()).isOpen());
    EXPECT_EQ(errno, ENOENT);
    EXPECT_FALSE(FileDescriptor::openRegularFile(directory.path().c_str()).isOpen());
    EXPECT_EQ(errno, EISDIR);
    EXPECT_FALSE(FileDescriptor::openRegularFile("/dev/null").isOpen());
    EXPECT_EQ(errno, EINVAL);
}

TEST(FileDescriptor, AWriteThatASignalCutsShortIsContinued) {
    int ends[2];
    ASSERT_EQ(::pipe(ends), 0);
    const FileDescriptor readEnd(ends[0]);
    FileDescriptor writeEnd(ends[1]);
    struct sigaction action {};
    action.sa_handler = ignoreSignal;
    struct sigaction before {};
    ASSERT_EQ(::sigaction(SIGUSR1, &action, &before), 0);

    std::string sent;
    for (int i = 0; i < 100000; ++i) {
        sent += std::to_string(i);
    }
    const pthread_t writer = ::pthread_self();
    std::string received;
    std::thread reader([&] {
        // The writer waits in its system call once the pipe holds some pages and takes no more.
        int held = 0;
        int heldBefore = -1;
        while (held == 0 || held != heldBefore) {
            heldBefore = held;
            ::usleep(20000);
            ::ioctl(readEnd.get(), FIONREAD, &held);
        }
        ::pthread_kill(writer, SIGUSR1);
        char buffer[4096];
        for (ssize_t count = 0; (count = readEnd.read(buffer, sizeof buffer)) > 0;) {
            received.append(buffer, static_cast<std::size_t>(count));
        }
    });
    EXPECT_EQ(writeEnd.writeAll(sent.data(), sent.size()), 0);
    writeEnd.close();
    reader.join();
    EXPECT_EQ(received, sent);
    ::sigaction(SIGUSR1, &before, nullptr);
}

TEST(FileDescriptor, AWriteErrorIsReturned) {
    const FileDescriptor full(::open("/dev/full", O_WRONLY | O_CLOEXEC));
    ASSERT_TRUE(full.isOpen());
    EXPECT_EQ(full.writeAll("x", 1), ENOSPC);
    EXPECT_EQ(full.writeAll("", 0), 0);
}

}  // namespace
}  // namespace Velm
