#include "model/XmlText.h"

#include <gtest/gtest.h>

namespace Pegasus {
namespace {

std::string escapedAsUtf8(const std::string& utf8) {
    std::string xml;
    appendEscaped(xml, std::string_view(utf8));
    return xml;
}

std::string escapedAsString(const std::string& utf8) {
    std::string xml;
    appendEscaped(xml, String(utf8.data(), static_cast<Uint32>(utf8.size())));
    return xml;
}

// Texts are looked at in blocks: a special character may stand anywhere in one.
TEST(XmlTextTest, EscapesAtEveryPlace) {
    for (std::size_t place = 0; place < 50; ++place) {
        const std::string before(place, 'x');
        const std::string behind(49 - place, '~');
        const std::string text = before + "<" + behind;
        const std::string expected = before + "&lt;" + behind;
        EXPECT_EQ(escapedAsUtf8(text), expected);
        EXPECT_EQ(escapedAsString(text), expected);
    }
}

TEST(XmlTextTest, EscapesWhatMayNotStandForItself) {
    const std::string text = "a&b<c>d\"e'f\tg\nh\ri\x01j\x1Fk l~m\x7Fn";
    const std::string expected =
        "a&amp;b&lt;c&gt;d&quot;e&apos;f&#9;g&#10;h&#13;i\xEF\xBF\xBDj\xEF\xBF\xBDk l~m\x7Fn";
    EXPECT_EQ(escapedAsUtf8(text), expected);
    EXPECT_EQ(escapedAsString(text), expected);
}

TEST(XmlTextTest, ReplacesNonCharacters) {
    const std::string text = "\xEF\xBF\xBE\xEF\xBF\xBFz\xEF\xBF\xBD\xEF\xBC\xA1\xEF\xBF\xBE";
    const std::string expected = "\xEF\xBF\xBD\xEF\xBF\xBDz\xEF\xBF\xBD\xEF\xBC\xA1\xEF\xBF\xBD";
    EXPECT_EQ(escapedAsUtf8(text), expected);
    EXPECT_EQ(escapedAsString(text), expected);
}

TEST(XmlTextTest, KeepsOtherCharactersOfAllLengths) {
    const std::string text = "\xC3\xA9 and \xE2\x82\xAC and \xF0\x9F\x98\x80, each among others";
    EXPECT_EQ(escapedAsUtf8(text), text);
    EXPECT_EQ(escapedAsString(text), text);
}

}  // namespace
}  // namespace Pegasus
