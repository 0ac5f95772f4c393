#include "report/DescriptorBuffer.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <cerrno>
#include <ostream>
#include <string>

#include "support/Files.h"
#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

TEST(DescriptorBufferTest, WritesEveryOctet) {
    const support::TempDirectory directory;
    const std::string path = directory.path("file");
    const int file = ::open(path.c_str(), O_CREAT | O_WRONLY | O_CLOEXEC, 0600);
    ASSERT_GE(file, 0);
    std::string expected;
    {
        DescriptorBuffer buffer(file);
        std::ostream stream(&buffer);
        for (int i = 0; i < 20000; ++i) {
            stream << i << '\n';
            expected += std::to_string(i) + '\n';
        }
        EXPECT_TRUE(stream.flush());
        EXPECT_EQ(buffer.error(), 0);
        stream << "at the end";
    }
    ::close(file);
    EXPECT_EQ(support::readFile(path), expected + "at the end");
}

TEST(DescriptorBufferTest, RemembersWhyAWriteFailed) {
    const int full = ::open("/dev/full", O_WRONLY | O_CLOEXEC);
    ASSERT_GE(full, 0);
    DescriptorBuffer buffer(full);
    std::ostream stream(&buffer);
    stream << std::string(100000, 'x');
    EXPECT_FALSE(stream);
    errno = 0;
    EXPECT_EQ(buffer.error(), ENOSPC);
    ::close(full);
    DescriptorBuffer closed(full);
    std::ostream lost(&closed);
    EXPECT_FALSE(lost << "x" << std::flush);
    EXPECT_EQ(closed.error(), EBADF);
}

}  // namespace
}  // namespace sennetctl
