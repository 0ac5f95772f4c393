#include "providers/InstanceBuilder.h"

#include <gtest/gtest.h>

#include "InstanceText.h"

namespace cimomd {
namespace {

std::string keyOf(const std::string& value, std::size_t maxLength) {
    return textOf(InstanceBuilder("Test_Thing").key("Name", value, maxLength).take().instance,
                  "Name");
}

TEST(InstanceBuilder, keepsKeysThatFit) {
    EXPECT_EQ(keyOf("sda", 64), "sda");
    EXPECT_EQ(keyOf(std::string(64, 'x'), 64), std::string(64, 'x'));
    EXPECT_EQ(keyOf(std::string(300, 'x'), 0), std::string(300, 'x'));
}

// Cut keys of two things were the same when only their ends differed. The digits are FNV-1a of
// the whole.
TEST(InstanceBuilder, keepsKeysApartThatAreTooLong) {
    EXPECT_EQ(keyOf("abcdefghijklmnop", 12), "abc~068bb1f5");
    EXPECT_EQ(keyOf("abcdefghijklmnoq", 12), "abc~058bb062");
    const std::string path = "/" + std::string(300, 'x');
    EXPECT_EQ(keyOf(path + "1", 256), path.substr(0, 247) + "~2af8d43d");
    EXPECT_EQ(keyOf(path + "2", 256), path.substr(0, 247) + "~27f8cf84");
    // Thirteen letters of two bytes each.
    EXPECT_EQ(
        keyOf("\u00e4\u00f6\u00fc\u00e4\u00f6\u00fc\u00e4\u00f6\u00fc\u00e4\u00f6\u00fc\u00e4", 12),
        "\u00e4\u00f6\u00fc~93f80e5a");
}

TEST(InstanceBuilder, knowsThingsByTheirWholeKeys) {
    const std::string id(100, 'y');
    const auto provided = InstanceBuilder("Test_Thing").deviceKeys("node7", id + "1").take();
    EXPECT_EQ(provided.identity, id + "1");
    EXPECT_EQ(textOf(provided.instance, "DeviceID").size(), 64U);
    EXPECT_NE(textOf(provided.instance, "DeviceID"),
              textOf(InstanceBuilder("Test_Thing").deviceKeys("node7", id + "2").take().instance,
                     "DeviceID"));
}

TEST(InstanceBuilder, saysThatANumberWithWordsIsUnknown) {
    const auto provided = InstanceBuilder("Test_Thing")
                              .enumerated("Kind", Absence::NeedsRoot)
                              .enumerated("State", Absence::Absent, 2)
                              .enumerated("Mode", Fact<Pegasus::Uint16>(Pegasus::Uint16{7}))
                              .take();
    EXPECT_EQ(textOf(provided.instance, "Kind"), "0");
    EXPECT_EQ(textOf(provided.instance, "State"), "2");
    EXPECT_EQ(textOf(provided.instance, "Mode"), "7");
    ASSERT_EQ(provided.missing.size(), 2U);
    EXPECT_EQ(provided.missing[0].property, std::string("Kind"));
    EXPECT_EQ(provided.missing[0].reason, Absence::NeedsRoot);
    EXPECT_EQ(provided.missing[1].property, std::string("State"));
    EXPECT_EQ(provided.missing[1].reason, Absence::Absent);
}

TEST(InstanceBuilder, replacesWhatCimXmlCannotCarry) {
    const auto provided = InstanceBuilder("Test_Thing")
                              .text("Name", "a\x01\x62\x7F\xFF")
                              .texts("More", std::vector<std::string>{"plain", "\xC3\xA4\x02"})
                              .text("Short", "\u00e4\u00f6\u00fc", 2)
                              .take();
    EXPECT_EQ(textOf(provided.instance, "Name"), "a\uFFFDb\uFFFD\uFFFD");
    EXPECT_EQ(textOf(provided.instance, "More"), "plain \u00e4\uFFFD ");
    EXPECT_EQ(textOf(provided.instance, "Short"), "\u00e4\u00f6");
}

TEST(InstanceBuilder, makesInstancesOfAClassThatDiffer) {
    const auto first = InstanceBuilder("Test_Thing").text("Name", "a").take();
    const auto second =
        InstanceBuilder("Test_Thing").value<Pegasus::Uint32>("Size", 5).text("Name", "b").take();
    EXPECT_EQ(first.instance.getPropertyCount(), 1U);
    EXPECT_EQ(textOf(first.instance, "Name"), "a");
    EXPECT_EQ(textOf(second.instance, "Size"), "5");
    EXPECT_EQ(textOf(second.instance, "Name"), "b");
}

TEST(InstanceBuilder, takesEachPropertyOnce) {
    InstanceBuilder builder("Test_Thing");
    builder.text("Name", "a").text("NAME", "b");
    EXPECT_THROW(builder.take(), std::logic_error);
}

}  // namespace
}  // namespace cimomd
