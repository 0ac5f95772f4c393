#include "Velm/PropertiesFile.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <syslog.h>
#include <unistd.h>

#include <string>
#include <string_view>

#include "ChildProcess.h"
#include "SyslogSpy.h"
#include "support/TempDirectory.h"

namespace Velm {
namespace {

using namespace std::string_view_literals;
using support::TempDirectory;

constexpr std::size_t kMebibyte = 1024 * 1024;

struct GrammarCase {
    const char* what;
    std::string_view file;
    const char* key;
    const char* value;  // null: the key must be absent
};

const GrammarCase kGrammarCases[] = {
    {"equals sign", "key=value\n"sv, "key", "value"},
    {"colon", "key: value\n"sv, "key", "value"},
    {"no line end at the end of the file", "a=1\nkey=value"sv, "key", "value"},
    {"blanks around key and separator", " \t key \t = \t value"sv, "key", "value"},
    {"blanks at the end of the value stay", "key=value \t"sv, "key", "value \t"},
    {"value of blanks only", "key= \t "sv, "key", ""},
    {"empty value", "key=\nother=x"sv, "key", ""},
    {"no separator", "key\n"sv, "key", ""},
    {"no separator, blanks at the end", "key  \n"sv, "key", ""},
    {"a blank does not separate", "a key=value\n"sv, "a key", "value"},
    {"a blank does not separate (key)", "a key=value\n"sv, "a", nullptr},
    {"empty key", "=value"sv, "", "value"},
    {"the first separator counts: equals", "key=a:b=c"sv, "key", "a:b=c"},
    {"the first separator counts: colon", "key:a=b:c"sv, "key", "a=b:c"},
    {"equals after colon belongs to the value", "key:=x"sv, "key", "=x"},
    {"equals after blanks and colon", "key : = x"sv, "key", "= x"},
    {"the last of equal keys wins", "key=1\nother=x\nkey=2\n"sv, "key", "2"},
    {"keys that an escape makes equal", "a b=1\na\\ b=2"sv, "a b", "2"},
    {"keys differ in case", "KEY=1\nkey=2\n"sv, "KEY", "1"},

    {"hash comment", "#key=value\n"sv, "#key", nullptr},
    {"exclamation mark comment", "!key=value\n"sv, "!key", nullptr},
    {"comment after blanks", " \t #key=value\n"sv, "#key", nullptr},
    {"hash inside a line is no comment", "key=a # b"sv, "key", "a # b"},
    {"hash inside a key is no comment", "a#b=c"sv, "a#b", "c"},
    {"hash at the value's start is no comment", "key=#FF0000"sv, "key", "#FF0000"},
    {"a comment does not continue", "# text \\\nkey=value\n"sv, "key", "value"},
    {"empty and blank lines", "\n\n  \t \nkey=value\n\n"sv, "key", "value"},

    {"CR LF ends a line", "a=1\r\nkey=value\r\nb=2\r\n"sv, "key", "value"},
    {"CR ends a line", "a=1\rkey=value\rb=2"sv, "key", "value"},
    {"LF CR is two line ends", "a=1\n\rkey=value\n\r"sv, "key", "value"},
    {"byte-order mark", "\xEF\xBB\xBFkey=value"sv, "key", "value"},
    {"comment after a byte-order mark", "\xEF\xBB\xBF#key=value"sv, "#key", nullptr},
    {"byte-order mark inside the file is text", "\n\xEF\xBB\xBFkey=v"sv, "\xEF\xBB\xBFkey", "v"},
    {"half a byte-order mark is no character", "\xEF\xBBkey=v"sv, "\xEF\xBF\xBD\xEF\xBF\xBDkey",
     "v"},

    {"continued line", "key=one\\\ntwo\n"sv, "key", "onetwo"},
    {"continued line, CR LF", "key=one\\\r\ntwo\r\n"sv, "key", "onetwo"},
    {"continued line, CR", "key=one\\\rtwo\r"sv, "key", "onetwo"},
    {"leading blanks of the next line are dropped", "key=one \\\n \t two"sv, "key", "one two"},
    {"continued twice", "key=a\\\n  b\\\n  c\nd=e"sv, "key", "abc"},
    {"a continuing line is never a comment", "key=a\\\n#b"sv, "key", "a#b"},
    {"an empty line ends a continuation", "key=a\\\n\nb=c"sv, "key", "a"},
    {"line after an ended continuation", "key=a\\\n\nb=c"sv, "b", "c"},
    {"key continued", "ke\\\n  y=value"sv, "key", "value"},
    {"separator in the continuing line", "key\\\n  = value"sv, "key", "value"},
    {"value wholly in the continuing line", "key = \\\n  value"sv, "key", "value"},
    {"line of a backslash only", "\\\nkey=value"sv, "key", "value"},
    {"continued line at the end of the file", "key=value\\"sv, "key", "value"},
    {"continued line at the end of the file, line end", "key=value\\\n"sv, "key", "value"},
    {"two backslashes do not continue", "key=one\\\\\ntwo=2"sv, "key", "one\\"},
    {"two backslashes do not continue (next line)", "key=one\\\\\ntwo=2"sv, "two", "2"},
    {"three backslashes continue", "key=one\\\\\\\ntwo"sv, "key", "one\\two"},
    {"four backslashes do not continue", "key=one\\\\\\\\\ntwo=2"sv, "key", "one\\\\"},
    {"backslash and blank at the end do not continue", "key=one\\ \ntwo=2"sv, "key", "one "},
    {"escape across a continuation", "key=\\u00\\\n  e9"sv, "key", "\xC3\xA9"},

    {"tab, line feed, carriage return, backslash", R"(key=\t\n\r\\)"sv, "key", "\t\n\r\\"},
    {"escaped backslash before a letter", R"(key=a\\tb)"sv, "key", "a\\tb"},
    {"escaped blank at the start of the value", R"(key=\  x)"sv, "key", "  x"},
    {"escaped tab", "key=\\\tx"sv, "key", "\tx"},
    {"escaped blank in the key", R"(a\ b=c)"sv, "a b", "c"},
    {"escaped blank at the key's start", R"(\ a=b)"sv, " a", "b"},
    {"escaped blank at the key's end", R"(a\  =b)"sv, "a ", "b"},
    {"blank after an escaped backslash is dropped", R"(a\\ =b)"sv, "a\\", "b"},
    {"escaped equals sign", R"(a\=b=c)"sv, "a=b", "c"},
    {"escaped colon", R"(a\:b:c)"sv, "a:b", "c"},
    {"separator after an escaped backslash", R"(a\\=b)"sv, "a\\", "b"},
    {"escaped separators in the value", R"(key=a\=b\:c)"sv, "key", "a=b:c"},
    {"line of escaped separator only", R"(a\=b)"sv, "a=b", ""},
    {"escaped line feed in a key", R"(a\nb=c)"sv, "a\nb", "c"},

    {"two-byte character", R"(key=\u00e9)"sv, "key", "\xC3\xA9"},
    {"last one-byte character", R"(key=\u007F)"sv, "key", "\x7F"},
    {"first two-byte character", R"(key=\u0080)"sv, "key", "\xC2\x80"},
    {"last two-byte character", R"(key=\u07FF)"sv, "key", "\xDF\xBF"},
    {"first three-byte character", R"(key=\u0800)"sv, "key", "\xE0\xA0\x80"},
    {"last before the surrogates", R"(key=\uD7FF)"sv, "key", "\xED\x9F\xBF"},
    {"first after the surrogates", R"(key=\uE000)"sv, "key", "\xEE\x80\x80"},
    {"last three-byte character", R"(key=\uFFFF)"sv, "key", "\xEF\xBF\xBF"},
    {"upper and lower case digits", R"(key=\u20aC)"sv, "key", "\xE2\x82\xAC"},
    {"exactly four digits are taken", R"(key=\u00411)"sv, "key", "A1"},
    {"escaped ASCII letter in a key", R"(\u006Bey=v)"sv, "key", "v"},
    {"an escaped code does not separate", R"(a\u003Db=c)"sv, "a=b", "c"},
    {"first surrogate pair", R"(key=\uD800\uDC00)"sv, "key", "\xF0\x90\x80\x80"},
    {"surrogate pair", R"(key=\uD83D\uDE00)"sv, "key", "\xF0\x9F\x98\x80"},
    {"last surrogate pair", R"(key=\uDBFF\uDFFF)"sv, "key", "\xF4\x8F\xBF\xBF"},
    {"high surrogate alone", R"(key=\uD83Dx)"sv, "key", "\xEF\xBF\xBDx"},
    {"high surrogate at the end", R"(key=\uD83D)"sv, "key", "\xEF\xBF\xBD"},
    {"low surrogate alone", R"(key=\uDE00x)"sv, "key", "\xEF\xBF\xBDx"},
    {"high surrogate before a letter's code", R"(key=\uD83D\u0041)"sv, "key",
     "\xEF\xBF\xBD"
     "A"},
    {"high surrogate before a pair", R"(key=\uD83D\uD83D\uDE00)"sv, "key",
     "\xEF\xBF\xBD\xF0\x9F\x98\x80"},
    {"high surrogate before a malformed escape", R"(key=\uD83D\uDE0)"sv, "key",
     "\xEF\xBF\xBD\\uDE0"},

    {"too few digits at the end", R"(key=\u12)"sv, "key", "\\u12"},
    {"no digits", R"(key=\u)"sv, "key", "\\u"},
    {"a wrong digit", R"(key=\u12g4)"sv, "key", "\\u12g4"},
    {"a sign is no digit", R"(key=\u+123)"sv, "key", "\\u+123"},
    {"upper case U", R"(key=\U0041)"sv, "key", "\\U0041"},
    {"unknown letters", R"(key=\a\f\x41\")"sv, "key", "\\a\\f\\x41\\\""},
    {"escaped hash is kept as written", R"(\#a=b)"sv, "\\#a", "b"},
    {"malformed escape before a real one", R"(key=\q\\)"sv, "key", "\\q\\"},
    {"malformed escape in a key", R"(a\qb=c)"sv, "a\\qb", "c"},

    {"UTF-8 text",
     "gr\xC3\xB6\xC3\x9F"
     "e=\xE2\x82\xAC"sv,
     "gr\xC3\xB6\xC3\x9F"
     "e",
     "\xE2\x82\xAC"},
    {"a Latin-1 letter in the value", "key=caf\xE9 x"sv, "key", "caf\xEF\xBF\xBD x"},
    {"a Latin-1 letter in the key", "caf\xE9=x"sv, "caf\xEF\xBF\xBD", "x"},
    {"each byte that is no character is replaced", "key=\xFF\xC3("sv, "key",
     "\xEF\xBF\xBD\xEF\xBF\xBD("},
    {"half a character at the end of the file", "key=\xE2\x82"sv, "key",
     "\xEF\xBF\xBD\xEF\xBF\xBD"},
    {"a coded surrogate", "key=\xED\xA0\x80"sv, "key", "\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD"},
    {"a code above U+10FFFF", "key=\xF4\x90\x80\x80"sv, "key",
     "\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD"},
    {"a character cut by a continued line", "key=\xC3\\\n\xA9"sv, "key",
     "\xEF\xBF\xBD\xEF\xBF\xBD"},
    {"a form feed is no blank", "key=\fx"sv, "key", "\fx"},
    {"a NUL ends the value for the caller", "key=a\0b\nother=x"sv, "key", "a"},
    {"a NUL does not end the file", "key=a\0b\nother=x"sv, "other", "x"},
    {"an escaped NUL, too", R"(key=a\u0000b)"sv, "key", "a"},
};

TEST(PropertiesFile, Grammar) {
    const TempDirectory directory;
    for (const GrammarCase& test : kGrammarCases) {
        SCOPED_TRACE(test.what);
        PropertiesFile file(directory.write("x.properties", test.file).c_str());
        EXPECT_TRUE(file.load());
        EXPECT_STREQ(file.getProperties().getPropertyValue(test.key), test.value);
    }
}

TEST(PropertiesFile, NothingIsReadBeforeLoad) {
    const TempDirectory directory;
    const PropertiesFile file(directory.write("x", "key=value").c_str());
    EXPECT_EQ(file.getProperties().getPropertyValue("key"), nullptr);
}

TEST(PropertiesFile, LoadReplacesWhatWasLoadedBefore) {
    const TempDirectory directory;
    PropertiesFile file(directory.write("x", "a=1\nb=2").c_str());
    EXPECT_TRUE(file.load());
    directory.write("x", "b=3");
    EXPECT_TRUE(file.load());
    EXPECT_EQ(file.getProperties().getPropertyValue("a"), nullptr);
    EXPECT_STREQ(file.getProperties().getPropertyValue("b"), "3");
}

TEST(PropertiesFile, AFileThatIsGoneEmptiesTheSet) {
    const TempDirectory directory;
    const std::string path = directory.write("x", "a=1");
    PropertiesFile file(path.c_str());
    EXPECT_TRUE(file.load());
    ASSERT_EQ(::unlink(path.c_str()), 0);
    EXPECT_FALSE(file.load());
    EXPECT_EQ(file.getProperties().getPropertyValue("a"), nullptr);
}

TEST(PropertiesFile, AnEmptyFileIsAnEmptySet) {
    const TempDirectory directory;
    PropertiesFile file(directory.write("x", "").c_str());
    EXPECT_TRUE(file.load());
    EXPECT_EQ(file.getProperties().getPropertyValue(""), nullptr);
}

TEST(PropertiesFile, AMissingFileIsNoFailureWorthAReport) {
    const TempDirectory directory;
    takeSyslog();
    PropertiesFile file(directory.path("missing").c_str());
    EXPECT_FALSE(file.load());
    EXPECT_FALSE(PropertiesFile(nullptr).load());
    EXPECT_TRUE(takeSyslog().empty());
}

TEST(PropertiesFile, ADirectoryIsUnreadable) {
    const TempDirectory directory;
    takeSyslog();
    PropertiesFile file(directory.path().c_str());
    EXPECT_FALSE(file.load());
    const auto log = takeSyslog();
    ASSERT_EQ(log.size(), 1U);
    EXPECT_EQ(log[0].priority, LOG_ERR);
    EXPECT_EQ(log[0].text, "cannot read " + directory.path() + ": Is a directory");
}

TEST(PropertiesFile, AFifoIsUnreadableAndNotWaitedFor) {
    const TempDirectory directory;
    const std::string path = directory.path("fifo");
    ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0);
    PropertiesFile file(path.c_str());
    EXPECT_FALSE(file.load());
}

TEST(PropertiesFile, AFileOfTheGreatestSizeIsRead) {
    const TempDirectory directory;
    std::string bytes = "key=value\n#";
    bytes.resize(16 * kMebibyte, 'x');
    PropertiesFile file(directory.write("x", bytes).c_str());
    EXPECT_TRUE(file.load());
    EXPECT_STREQ(file.getProperties().getPropertyValue("key"), "value");
}

TEST(PropertiesFile, ALargerFileIsUnreadable) {
    const TempDirectory directory;
    std::string bytes = "key=value\n#";
    bytes.resize(16 * kMebibyte + 1, 'x');
    takeSyslog();
    const std::string path = directory.write("x", bytes);
    PropertiesFile file(path.c_str());
    EXPECT_FALSE(file.load());
    EXPECT_EQ(file.getProperties().getPropertyValue("key"), nullptr);
    const auto log = takeSyslog();
    ASSERT_EQ(log.size(), 1U);
    EXPECT_EQ(log[0].text, "cannot read " + path + ": File too large");
}

TEST(PropertiesFile, ALineOfManyContinuationsIsOneLine) {
    const TempDirectory directory;
    std::string bytes = "key=";
    for (int i = 0; i < 100000; ++i) {
        bytes += "x\\\n";
    }
    PropertiesFile file(directory.write("x", bytes).c_str());
    EXPECT_TRUE(file.load());
    EXPECT_EQ(file.getProperties().getPropertyValue("key"), std::string(100000, 'x'));
}

TEST(PropertiesFile, AFileWithoutReadPermissionIsAnEmptySet) {
    const TempDirectory directory;
    const std::string path = directory.write("x", "key=value");
    ASSERT_EQ(::chmod(path.c_str(), 0), 0);
    ASSERT_EQ(::chmod(directory.path().c_str(), 0755), 0);
    const std::string result = runInChild([&] {
        if (::geteuid() == 0 && ::seteuid(65534) != 0) {
            return std::string("cannot change the user");
        }
        PropertiesFile file(path.c_str());
        return std::string(file.load() ? "read" : "unreadable");
    });
    EXPECT_EQ(result, "unreadable");
}

}  // namespace
}  // namespace Velm
