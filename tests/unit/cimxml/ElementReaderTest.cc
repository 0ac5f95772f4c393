// The walk through a document: children, attributes, texts, and what each of them refuses.

#include "xml/ElementReader.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "xml/MemorySource.h"

namespace Pegasus {
namespace {

template <typename Call>
std::string messageOf(Call call) {
    try {
        call();
    } catch (const XmlError& error) {
        EXPECT_EQ(error.kind, XmlError::Kind::Content);
        return error.message;
    }
    ADD_FAILURE() << "no error";
    return "";
}

TEST(ElementReader, WalksChildrenInOrder) {
    MemorySource source("<a> <b><c/></b> <d>t</d> </a>");
    ElementReader reader(source);
    reader.readRoot();
    EXPECT_EQ(reader.name(), "a");
    ASSERT_TRUE(reader.nextChild());
    EXPECT_TRUE(reader.is("b"));
    EXPECT_EQ(reader.offset(), 4U);
    ASSERT_TRUE(reader.nextChild());
    EXPECT_TRUE(reader.is("c"));
    EXPECT_FALSE(reader.nextChild());
    EXPECT_FALSE(reader.nextChild());
    ASSERT_TRUE(reader.nextChild());
    EXPECT_TRUE(reader.is("d"));
    EXPECT_EQ(reader.readText().raw, "t");
    EXPECT_FALSE(reader.nextChild());
    reader.readDocumentEnd();
}

TEST(ElementReader, SkipsAnElementWithAllThatIsInIt) {
    MemorySource source("<a><b>x<b><b/></b>y</b><c/></a>");
    ElementReader reader(source);
    reader.readRoot();
    ASSERT_TRUE(reader.nextChild());
    reader.skip();
    ASSERT_TRUE(reader.nextChild());
    EXPECT_TRUE(reader.is("c"));
    reader.skip();
    reader.readEnd();
    reader.readDocumentEnd();
}

TEST(ElementReader, GivesAttributes) {
    MemorySource source("<a b='1' t='TRUE' f='false'/>");
    ElementReader reader(source);
    reader.readRoot();
    EXPECT_EQ(reader.attribute("b"), "1");
    EXPECT_EQ(reader.attribute("B"), std::nullopt);
    EXPECT_EQ(reader.requiredAttribute("b"), "1");
    EXPECT_TRUE(reader.booleanAttribute("t", false));
    EXPECT_FALSE(reader.booleanAttribute("f", true));
    EXPECT_TRUE(reader.booleanAttribute("none", true));
    EXPECT_FALSE(reader.booleanAttribute("none", false));
    EXPECT_EQ(messageOf([&] { reader.requiredAttribute("x"); }),
              "element \"a\" has no attribute x; at byte 0");
    EXPECT_EQ(messageOf([&] { reader.booleanAttribute("b", true); }),
              "attribute b of element \"a\" is \"1\"; expected true or false; at byte 0");
}

struct TextCase {
    std::string document;
    std::string raw;
    std::string trimmed;
};

class TextOfElement : public testing::TestWithParam<TextCase> {};

TEST_P(TextOfElement, IsGivenRawAndTrimmed) {
    MemorySource source(GetParam().document);
    ElementReader reader(source);
    reader.readRoot();
    const ElementText text = reader.readText();
    EXPECT_EQ(text.raw, GetParam().raw);
    EXPECT_EQ(text.trimmed, GetParam().trimmed);
}

const TextCase kTexts[] = {
    {"<a/>", "", ""},
    {"<a></a>", "", ""},
    {"<a> </a>", " ", ""},
    {"<a> x y </a>", " x y ", "x y"},
    // References at the ends are white space like any other.
    {"<a>&#10;x&#32;</a>", "\nx ", "x"},
    {"<a><!-- --> x<!-- --> </a>", " x ", "x"},
    {"<a><![CDATA[ ]]></a>", " ", " "},
    {"<a> <![CDATA[ x ]]> </a>", "  x  ", " x "},
    {"<a> x <![CDATA[ ]]></a>", " x  ", "x  "},
    {"<a><![CDATA[x]]> y </a>", "x y ", "x y"},
    {"<a> <![CDATA[]]> </a>", "  ", ""},
};

INSTANTIATE_TEST_SUITE_P(ElementReader, TextOfElement, testing::ValuesIn(kTexts));

TEST(ElementReader, SaysWhatItFoundAndExpected) {
    const auto atRoot = [](std::string_view document, auto call) {
        MemorySource source(document);
        ElementReader reader(source);
        reader.readRoot();
        return messageOf([&] { call(reader); });
    };
    EXPECT_EQ(atRoot("<a>12<b/></a>", [](ElementReader& reader) { reader.nextChild(); }),
              "text \"12\" stands between elements; expected a tag; at byte 3");
    EXPECT_EQ(atRoot("<a><![CDATA[x]]></a>", [](ElementReader& reader) { reader.readEnd(); }),
              "text \"x\" stands between elements; expected a tag; at byte 3");
    EXPECT_EQ(atRoot("<a></a>", [](ElementReader& reader) { reader.requireChild("B"); }),
              "element \"a\" ends too early; expected B; at byte 3");
    EXPECT_EQ(atRoot("<a><c/></a>", [](ElementReader& reader) { reader.requireChildNamed("B"); }),
              "element \"c\" may not stand here; expected B; at byte 3");
    EXPECT_EQ(atRoot("<a><c/></a>", [](ElementReader& reader) { reader.readEnd(); }),
              "element \"c\" may not stand here; expected an end tag; at byte 3");
    EXPECT_EQ(atRoot("<a>t<c/></a>", [](ElementReader& reader) { reader.readText(); }),
              "element \"c\" may not stand here; expected text; at byte 4");
}

TEST(ElementReader, TheSumOfTheTextsOfAnElementIsBounded) {
    std::string document = "<a>";
    const std::string piece = "<![CDATA[" + std::string(1000000, 'x') + "]]>";
    for (int i = 0; i < 70; ++i) {
        document += piece;
    }
    document += "</a>";
    MemorySource source(document);
    ElementReader reader(source);
    reader.readRoot();
    try {
        reader.readText();
        FAIL();
    } catch (const XmlError& error) {
        EXPECT_EQ(error.kind, XmlError::Kind::Limit);
    }
}

}  // namespace
}  // namespace Pegasus
