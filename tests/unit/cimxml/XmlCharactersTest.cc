// The check of octets and the small helpers around characters.

#include "xml/XmlCharacters.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <string>
#include <string_view>

namespace Pegasus {
namespace {

using Verdict = OctetCheck::Verdict;

void expectCheck(std::string_view octets, std::size_t goodSize, Verdict verdict) {
    const OctetCheck check = checkOctets(octets);
    EXPECT_EQ(check.goodSize, goodSize);
    EXPECT_EQ(check.verdict, verdict);
}

// Octets are checked in blocks, so every place in and around some blocks is tried.
TEST(XmlCharacters, AFaultIsFoundAtEveryPlace) {
    for (std::size_t place = 0; place < 200; ++place) {
        std::string octets(200, 'x');
        octets[place] = '\x01';
        expectCheck(octets, place, Verdict::ForbiddenCharacter);
        octets[place] = '\0';
        expectCheck(octets, place, Verdict::ForbiddenCharacter);
        octets[place] = '\xFF';
        expectCheck(octets, place, Verdict::InvalidUtf8);
        octets[place] = '\x80';
        expectCheck(octets, place, Verdict::InvalidUtf8);
        octets[place] = '\n';
        expectCheck(octets, 200, Verdict::Good);
    }
}

TEST(XmlCharacters, ACharacterMayStandAtEveryPlace) {
    for (std::size_t place = 0; place < 200; ++place) {
        std::string octets(200, 'x');
        octets.insert(place, "\xF0\x90\x8D\x88");
        expectCheck(octets, 204, Verdict::Good);
        for (std::size_t cut = 1; cut < 4; ++cut) {
            expectCheck(std::string_view(octets).substr(0, place + cut), place,
                        Verdict::Incomplete);
        }
    }
}

TEST(XmlCharacters, ControlCharactersButThree) {
    for (char c = 0; c < 0x20; ++c) {
        const bool isAllowed = c == '\t' || c == '\n' || c == '\r';
        expectCheck(std::string_view(&c, 1), isAllowed ? 1 : 0,
                    isAllowed ? Verdict::Good : Verdict::ForbiddenCharacter);
    }
    expectCheck("\x7F", 1, Verdict::Good);
}

TEST(XmlCharacters, LeadOctetsThatNeverStand) {
    for (const int lead : {0x80, 0xBF, 0xC0, 0xC1, 0xF5, 0xF8, 0xFC, 0xFE, 0xFF}) {
        const std::string octets = static_cast<char>(lead) + std::string("\x80\x80\x80");
        expectCheck(octets, 0, Verdict::InvalidUtf8);
    }
}

TEST(XmlCharacters, AFaultInTheSecondOctetShowsBeforeTheThird) {
    expectCheck("\xE0\x80", 0, Verdict::InvalidUtf8);
    expectCheck("\xED\xA0", 0, Verdict::InvalidUtf8);
    expectCheck("\xF0\x80", 0, Verdict::InvalidUtf8);
    expectCheck("\xF4\x90", 0, Verdict::InvalidUtf8);
    expectCheck("\xE2\x82", 0, Verdict::Incomplete);
}

TEST(XmlCharacters, TrimAndBlank) {
    EXPECT_EQ(trimXmlSpace(" \t\r\na b\n"), "a b");
    EXPECT_EQ(trimXmlSpace(" \n"), "");
    EXPECT_EQ(trimXmlSpace("\va"), "\va");
    EXPECT_TRUE(isBlank(""));
    EXPECT_TRUE(isBlank(" \t\r\n"));
    EXPECT_FALSE(isBlank(" x "));
    EXPECT_FALSE(isBlank("\xC2\xA0"));
}

TEST(XmlCharacters, EqualIgnoringCase) {
    EXPECT_TRUE(equalsIgnoringCase("", ""));
    EXPECT_TRUE(equalsIgnoringCase("UTF-8", "utf-8"));
    EXPECT_FALSE(equalsIgnoringCase("utf-8", "utf-"));
    EXPECT_FALSE(equalsIgnoringCase("[", "{"));
}

TEST(XmlCharacters, QuotesForMessagesAreShortAndPrintable) {
    EXPECT_EQ(quotedForMessage(""), "\"\"");
    EXPECT_EQ(quotedForMessage("a\nb\x7F"), "\"a?b?\"");
    EXPECT_EQ(quotedForMessage(std::string(60, 'x')), "\"" + std::string(60, 'x') + "\"");
    EXPECT_EQ(quotedForMessage(std::string(61, 'x')), "\"" + std::string(60, 'x') + "...\"");
    // The cut would fall into the character, which goes as a whole.
    EXPECT_EQ(quotedForMessage(std::string(59, 'x') + "\xE2\x82\xACx"),
              "\"" + std::string(59, 'x') + "...\"");
}

}  // namespace
}  // namespace Pegasus
