// Which markup of an element is kept, and which elements are left to the general way.

#include "xml/MarkupRun.h"

#include <gtest/gtest.h>

#include <string>

namespace Pegasus {
namespace {

TEST(MarkupRun, OfOneValueIsWhatStandsAroundIt) {
    const auto run =
        MarkupRun::of("\n<PROPERTY NAME=\"A\">\n<VALUE>x &lt; y</VALUE>\n</PROPERTY>", true);
    ASSERT_TRUE(run);
    EXPECT_EQ(run->before, "\n<PROPERTY NAME=\"A\">\n<VALUE>");
    EXPECT_EQ(run->between, "");
    EXPECT_EQ(run->after, "</VALUE>\n</PROPERTY>");
    EXPECT_TRUE(run->hasText);
    EXPECT_EQ(run->textTagSize, 7U);
}

TEST(MarkupRun, OfAnArrayKnowsWhatStandsBetweenValues) {
    const auto run = MarkupRun::of(
        "<P><VALUE.ARRAY> <VALUE>1</VALUE>\n<VALUE>2</VALUE>\n<VALUE>3</VALUE></VALUE.ARRAY></P>",
        true);
    ASSERT_TRUE(run);
    EXPECT_EQ(run->before, "<P><VALUE.ARRAY> <VALUE>");
    EXPECT_EQ(run->between, "</VALUE>\n<VALUE>");
    EXPECT_EQ(run->after, "</VALUE></VALUE.ARRAY></P>");
}

TEST(MarkupRun, OfAnArrayOfOneDoesNot) {
    const auto run = MarkupRun::of("<P><VALUE.ARRAY><VALUE>1</VALUE></VALUE.ARRAY></P>", true);
    ASSERT_TRUE(run);
    EXPECT_EQ(run->before, "<P><VALUE.ARRAY><VALUE>");
    EXPECT_EQ(run->between, "");
    EXPECT_EQ(run->after, "</VALUE></VALUE.ARRAY></P>");
}

TEST(MarkupRun, OfAnEmptyTextIsThatOfAnyText) {
    const auto run = MarkupRun::of("<P><VALUE></VALUE></P>", true);
    ASSERT_TRUE(run);
    EXPECT_EQ(run->before, "<P><VALUE>");
    EXPECT_EQ(run->after, "</VALUE></P>");
}

TEST(MarkupRun, OfANullIsAllOfIt) {
    const auto run = MarkupRun::of("\n<PROPERTY NAME=\"A\"/>", false);
    ASSERT_TRUE(run);
    EXPECT_EQ(run->before, "\n<PROPERTY NAME=\"A\"/>");
    EXPECT_EQ(run->between, "");
    EXPECT_EQ(run->after, "");
    EXPECT_FALSE(run->hasText);
}

TEST(MarkupRun, IsNotKeptOfWhatIsMoreThanTagsAndTexts) {
    for (const char* element :
         {"<P><!-- --><VALUE>1</VALUE></P>", "<P><VALUE>1<!-- --></VALUE></P>",
          "<P><VALUE><![CDATA[1]]></VALUE></P>", "<P><?pi?><VALUE>1</VALUE></P>"}) {
        EXPECT_FALSE(MarkupRun::of(element, true)) << element;
    }
    EXPECT_FALSE(MarkupRun::of("<!-- --><P/>", false));
    EXPECT_FALSE(MarkupRun::of("<P><?pi?></P>", false));
}

TEST(MarkupRun, IsNotKeptOfValuesThatAreNotSpelledAlike) {
    for (const char* element :
         {"<P><VALUE/></P>", "<P><VALUE ></VALUE ></P>", "<P><VALUE A=\"1\">1</VALUE></P>",
          "<P><VALUE.ARRAY></VALUE.ARRAY></P>", "<P><VALUE/><VALUE>1</VALUE></P>",
          "<P><VALUE>1</VALUE><VALUE/></P>", "<P><VALUE.NULL/><VALUE>1</VALUE></P>",
          "<P><VALUE>1</VALUE><VALUE.NULL/></P>",
          "<P><VALUE>1</VALUE><VALUE.NULL/><VALUE>2</VALUE></P>",
          "<P><VALUE>1</VALUE><VALUE /><VALUE>2</VALUE></P>", "<P><VALUE>1</VALUE ></P>",
          "<P><VALUE>1</VALUE\r></P>", "<P><VALUE>1</VALUE><VALUE>2</VALUE ></P>",
          "<P><VALUE >1</VALUE><VALUE>2</VALUE ></P>"}) {
        EXPECT_FALSE(MarkupRun::of(element, true)) << element;
    }
}

TEST(MarkupRun, IsKeptUpTo1024Octets) {
    const auto named = [](std::size_t nameSize, const std::string& rest) {
        return "<P N=\"" + std::string(nameSize, 'n') + rest;
    };
    // 6 octets before the name, 20 behind it that are not the text.
    EXPECT_TRUE(MarkupRun::of(named(1024 - 26, "\"><VALUE>1</VALUE></>"), true));
    EXPECT_FALSE(MarkupRun::of(named(1025 - 26, "\"><VALUE>1</VALUE></>"), true));
    EXPECT_TRUE(MarkupRun::of("<P><VALUE>" + std::string(5000, 'x') + "</VALUE></P>", true));
    // 3 octets behind the name.
    EXPECT_TRUE(MarkupRun::of(named(1024 - 9, "\"/>"), false));
    EXPECT_FALSE(MarkupRun::of(named(1025 - 9, "\"/>"), false));
}

TEST(MarkupRun, OfAKeyIsWhatStandsAroundItsText) {
    const auto run = MarkupRun::ofOneText(
        "<KEYBINDING NAME=\"A\"><KEYVALUE VALUETYPE=\"string\">x</KEYVALUE></KEYBINDING>",
        "KEYVALUE");
    ASSERT_TRUE(run);
    EXPECT_EQ(run->before, "<KEYBINDING NAME=\"A\"><KEYVALUE VALUETYPE=\"string\">");
    EXPECT_EQ(run->between, "");
    EXPECT_EQ(run->after, "</KEYVALUE></KEYBINDING>");
    EXPECT_TRUE(run->hasText);
    EXPECT_EQ(run->textTagSize, 29U);
}

TEST(MarkupRun, OfAKeyIsNotKeptWhenItsTextIsHardToFind) {
    for (const char* element :
         {"", "<B/>", "<B><K/></B>", "<B><K A=\"1\"/></B>", "<B><K>1</K><K>2</K></B>",
          "<B><K A=\">\">1</K></B>", "<B><K>a>b</K></B>", "<B><K>1<!-- --></K></B>",
          "<B><K><![CDATA[1]]></K></B>", "<?pi?><B><K>1</K></B>"}) {
        EXPECT_FALSE(MarkupRun::ofOneText(element, "K")) << element;
    }
    EXPECT_TRUE(MarkupRun::ofOneText("<B><K></K></B>", "K"));
    EXPECT_FALSE(MarkupRun::ofOneText("<B>" + std::string(1024, ' ') + "<K>1</K></B>", "K"));
}

}  // namespace
}  // namespace Pegasus
