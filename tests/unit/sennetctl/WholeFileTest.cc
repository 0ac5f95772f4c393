#include "report/WholeFile.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

#include "support/TempDirectory.h"

namespace sennetctl {
namespace {

std::string failureOf(const std::string& path, std::size_t limit = kLargestFileOctets) {
    try {
        readWholeFile(path, limit);
    } catch (const CannotRun& failure) {
        return failure.what();
    }
    return "none";
}

TEST(WholeFileTest, ReadsEveryOctet) {
    const support::TempDirectory directory;
    const std::string octets("a\0b\r\n\xFF", 6);
    EXPECT_EQ(readWholeFile(directory.write("file", octets)), octets);
    EXPECT_EQ(readWholeFile(directory.write("empty", "")), "");
    const std::string large(200000, 'x');
    EXPECT_EQ(readWholeFile(directory.write("large", large)), large);
}

TEST(WholeFileTest, TellsWhyAFileIsNotRead) {
    const support::TempDirectory directory;
    EXPECT_EQ(failureOf(directory.path("none")),
              directory.path("none") + ": there is no such file");
    EXPECT_EQ(failureOf(directory.path()), directory.path() + ": is no regular file");
    const std::string pipe = directory.path("pipe");
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    EXPECT_EQ(failureOf(pipe), pipe + ": is no regular file");
    const std::string large = directory.write("large", std::string((1 << 20) + 1, 'x'));
    EXPECT_EQ(failureOf(large, 1 << 20), large + ": is larger than 1 MiB");
}

}  // namespace
}  // namespace sennetctl
