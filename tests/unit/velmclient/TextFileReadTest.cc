#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <syslog.h>

#include <string>
#include <string_view>
#include <vector>

#include "SyslogSpy.h"
#include "Velm/TextFile.h"
#include "support/TempDirectory.h"

namespace Velm {
namespace {

using namespace std::string_literals;
using namespace std::string_view_literals;
using support::TempDirectory;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr char kUntouched = '\x55';

// All lines of a file; checks that readLine keeps to its limit and stays at the end once there.
std::vector<std::string> linesOf(std::string_view bytes, int limit) {
    const TempDirectory directory;
    TextFile file(directory.write("x", bytes).c_str());
    EXPECT_EQ(file.open(0), 0);
    const auto room = static_cast<std::size_t>(limit);
    std::vector<std::string> lines;
    for (;;) {
        std::string buffer(room + 1, kUntouched);
        const int length = file.readLine(buffer.data(), limit);
        EXPECT_EQ(buffer[room], kUntouched);
        EXPECT_LE(length, limit);
        if (length < 0) {
            break;
        }
        lines.push_back(buffer.substr(0, static_cast<std::size_t>(length)));
    }
    char c = kUntouched;
    EXPECT_LT(file.readLine(&c, 1), 0);
    EXPECT_EQ(file.close(), 0);
    return lines;
}

struct LineCase {
    const char* what;
    std::string_view bytes;
    int limit;
    std::vector<std::string> lines;
};

const LineCase kLineCases[] = {
    {"empty file", ""sv, 10, {}},
    {"LF", "a\nbc\n"sv, 10, {"a", "bc"}},
    {"CR LF", "a\r\nbc\r\n"sv, 10, {"a", "bc"}},
    {"no end of the last line", "a\nbc"sv, 10, {"a", "bc"}},
    {"empty lines", "\n\r\na\n\n"sv, 10, {"", "", "a", ""}},
    {"CR alone is text", "a\rb\n\rc\n"sv, 10, {"a\rb", "\rc"}},
    {"only one CR belongs to the line end", "a\r\r\n"sv, 10, {"a\r"}},
    {"CR at the end of the file is text", "a\r"sv, 10, {"a\r"}},
    {"LF CR", "a\n\rb\n\r"sv, 10, {"a", "\rb", "\r"}},
    {"line of the limit's length", "abcd\ne\n"sv, 4, {"abcd", "e"}},
    {"line of the limit's length, CR LF", "abcd\r\ne\r\n"sv, 4, {"abcd", "e"}},
    {"CR LF just before the limit", "abc\r\ne\r\n"sv, 4, {"abc", "e"}},
    {"line one longer than the limit", "abcde\nf\n"sv, 4, {"abcd", "f"}},
    {"line one longer than the limit, CR LF", "abcde\r\nf\r\n"sv, 4, {"abcd", "f"}},
    {"much longer", "abcdefghijklmnopqrstuvwxyz\nf"sv, 4, {"abcd", "f"}},
    {"longer without an end", "abcdefgh"sv, 4, {"abcd"}},
    {"CR as the last byte within the limit is text", "abc\rde\nf"sv, 4, {"abc\r", "f"}},
    {"limit 1", "ab\n\nc\r\n"sv, 1, {"a", "", "c"}},
    {"limit 0", "ab\n\nc"sv, 0, {"", "", ""}},
    {"NUL bytes are counted", "a\0b\n\0\n"sv, 10, {"a\0b"s, "\0"s}},
    {"bytes of any value", "\xFF\xFE\x80\n"sv, 10, {"\xFF\xFE\x80"}},
};

TEST(TextFileRead, Lines) {
    for (const LineCase& test : kLineCases) {
        SCOPED_TRACE(test.what);
        EXPECT_EQ(linesOf(test.bytes, test.limit), test.lines);
    }
}

// A line end may fall on any place of an inner buffer, whose size is a power of two.
TEST(TextFileRead, LineEndsAroundPowersOfTwo) {
    for (const std::size_t edge : {4096U, 65536U, 131072U}) {
        for (std::size_t length = edge - 3; length <= edge + 2; ++length) {
            SCOPED_TRACE(length);
            const std::string line(length, 'x');
            const std::string cut(1024, 'x');
            EXPECT_THAT(linesOf(line + "\r\nnext\r\n", 200000), ElementsAre(line, "next"));
            EXPECT_THAT(linesOf(line + "\nnext", 1024), ElementsAre(cut, "next"));
            EXPECT_THAT(linesOf(line + "\r", 200000), ElementsAre(line + "\r"));
        }
    }
}

TEST(TextFileRead, ALineOfManyMegabytesIsCut) {
    const std::string line(std::size_t{8} * 1024 * 1024, 'x');
    EXPECT_THAT(linesOf(line + "\nb\n", 3), ElementsAre("xxx", "b"));
}

TEST(TextFileRead, ALimitLargerThanTheInnerBufferIsKept) {
    const std::string line(200000, 'x');
    EXPECT_THAT(linesOf(line + "\nb\n", 70000), ElementsAre(line.substr(0, 70000), "b"));
}

TEST(TextFileRead, BadArgumentsGiveAnErrorAndTakeNoLine) {
    const TempDirectory directory;
    TextFile file(directory.write("x", "abc\n").c_str());
    ASSERT_EQ(file.open(0), 0);
    char buffer[4] = {};
    EXPECT_EQ(file.readLine(nullptr, 3), -1);
    EXPECT_EQ(file.readLine(buffer, -1), -1);
    EXPECT_EQ(file.readLine(buffer, 3), 3);
    EXPECT_STREQ(buffer, "abc");
}

TEST(TextFileRead, NothingIsReadBeforeOpenOrAfterClose) {
    const TempDirectory directory;
    TextFile file(directory.write("x", "a\nb\n").c_str());
    char c = 0;
    EXPECT_EQ(file.readLine(&c, 1), -1);
    ASSERT_EQ(file.open(0), 0);
    EXPECT_EQ(file.readLine(&c, 1), 1);
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(file.readLine(&c, 1), -1);
}

TEST(TextFileRead, OpeningAgainStartsAgain) {
    const TempDirectory directory;
    TextFile file(directory.write("x", "a\nb\n").c_str());
    char c = 0;
    ASSERT_EQ(file.open(0), 0);
    ASSERT_EQ(file.readLine(&c, 1), 1);
    ASSERT_EQ(file.open(0), 0);
    EXPECT_EQ(file.readLine(&c, 1), 1);
    EXPECT_EQ(c, 'a');
}

TEST(TextFileRead, WritingToAFileOpenForReadingIsRefused) {
    const TempDirectory directory;
    TextFile file(directory.write("x", "a\n").c_str());
    ASSERT_EQ(file.open(0), 0);
    EXPECT_EQ(file.writeLine("b", 1), -1);
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(directory.read("x"), "a\n");
}

TEST(TextFileRead, AMissingFileReadsAsEmptyAndIsReported) {
    const TempDirectory directory;
    const std::string path = directory.path("missing");
    takeSyslog();
    TextFile file(path.c_str());
    EXPECT_NE(file.open(0), 0);
    char c = 0;
    EXPECT_EQ(file.readLine(&c, 1), -1);
    EXPECT_EQ(file.close(), 0);
    const auto log = takeSyslog();
    ASSERT_EQ(log.size(), 1U);
    EXPECT_EQ(log[0].priority, LOG_ERR);
    EXPECT_EQ(log[0].text, "cannot read " + path + ": No such file or directory");
}

TEST(TextFileRead, OnlyRegularFilesAreOpened) {
    const TempDirectory directory;
    const std::string fifo = directory.path("fifo");
    ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
    EXPECT_NE(TextFile(fifo.c_str()).open(0), 0);
    EXPECT_NE(TextFile(directory.path().c_str()).open(0), 0);
    EXPECT_NE(TextFile("/dev/null").open(0), 0);
    EXPECT_NE(TextFile("").open(0), 0);
    EXPECT_NE(TextFile(nullptr).open(0), 0);
}

TEST(TextFileRead, AReadErrorEndsTheFileAndIsReported) {
    takeSyslog();
    // The kernel refuses to read a process's memory at address 0.
    TextFile file("/proc/self/mem");
    ASSERT_EQ(file.open(0), 0);
    char c = 0;
    EXPECT_EQ(file.readLine(&c, 1), -1);
    EXPECT_EQ(file.readLine(&c, 1), -1);
    const auto log = takeSyslog();
    ASSERT_EQ(log.size(), 1U);
    EXPECT_EQ(log[0].text, "cannot read /proc/self/mem: Input/output error");
}

}  // namespace
}  // namespace Velm
