// Reading inventory scripts: sections, entries, slots, titles and property lists.

#include "CimScriptParser/CimScriptParser.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "ConverterFixture.h"

namespace {

using namespace Pegasus;
using generatortest::utf8;
using Texts = std::vector<std::string>;

Texts listed(const CIMPropertyList& list) {
    Texts result;
    for (Uint32 i = 0; i < list.size(); ++i) {
        result.push_back(utf8(list[i].getString()));
    }
    return result;
}

Texts tokens(const String& text, const char* separators) {
    const Array<String> found = CimScriptParser::parseTokens(text, separators);
    Texts result;
    for (Uint32 i = 0; i < found.size(); ++i) {
        result.push_back(utf8(found[i]));
    }
    return result;
}

class CimScriptParserTest : public generatortest::ConverterFixture {
  protected:
    Texts classes(const std::string& text) {
        const CimScriptParser& parser = script(text);
        Texts result;
        for (Uint32 i = 0; i < parser.getNumberOfClasses(); ++i) {
            result.push_back(utf8(parser.getClassName(static_cast<int>(i))));
        }
        return result;
    }

    std::string title(const std::string& text) { return utf8(script(text).getTitle()); }

    std::string spaceOf(const std::string& text, int slot) {
        return utf8(script(text).getNamespace(slot).getString());
    }

    Texts properties(const std::string& list) {
        return listed(script("[CIM]\nG[0]=C\nA[0]=" + list + "\n").getPropertyList(0));
    }
};

TEST_F(CimScriptParserTest, ReadsACompleteScript) {
    const CimScriptParser& parser = script(
        "[DEFAULT]\n"
        "title=Processor Inventory\n"
        "defaultnamespace=root/cimv2\n"
        "\n"
        "[CIM]\n"
        "G[0]=CIM_Processor\n"
        "A[0]=DeviceID, Name, MaxClockSpeed\n"
        "G[1]=CIM_CacheMemory\n"
        "N[1]=root/other\n");
    EXPECT_EQ(utf8(parser.getTitle()), "Processor Inventory");
    ASSERT_EQ(parser.getNumberOfClasses(), 2U);
    EXPECT_EQ(utf8(parser.getClassName(0)), "CIM_Processor");
    EXPECT_EQ(utf8(parser.getClassName(1)), "CIM_CacheMemory");
    EXPECT_EQ(utf8(parser.getNamespace(0).getString()), "root/cimv2");
    EXPECT_EQ(utf8(parser.getNamespace(1).getString()), "root/other");
    EXPECT_EQ(listed(parser.getPropertyList(0)), (Texts{"DeviceID", "Name", "MaxClockSpeed"}));
}

TEST_F(CimScriptParserTest, HasTenEmptySlotsBeforeParsing) {
    const CimScriptParser parser{String("/nowhere/cpu.script.inv")};
    EXPECT_EQ(parser.getNumberOfClasses(), 10U);
    EXPECT_EQ(utf8(parser.getClassName(9)), "");
    EXPECT_EQ(utf8(parser.getNamespace(0).getString()), "root/velmira");
}

TEST_F(CimScriptParserTest, TakesAMissingFileAsEmpty) {
    CimScriptParser parser(String(path("gone.script.inv").c_str()));
    parser.parse();
    EXPECT_EQ(parser.getNumberOfClasses(), 0U);
    EXPECT_EQ(utf8(parser.getTitle()), "gone");
}

TEST_F(CimScriptParserTest, HasNoClassWithoutAGroupLine) {
    EXPECT_EQ(classes("[DEFAULT]\ntitle=T\ndefaultnamespace=root/x\n"), Texts{});
    EXPECT_EQ(classes("[CIM]\nN[0]=root/x\nA[0]=Name\n"), Texts{});
    EXPECT_EQ(classes(""), Texts{});
}

TEST_F(CimScriptParserTest, MovesALoneSlotToTheFront) {
    EXPECT_EQ(classes("[CIM]\nG[3]=X\n"), Texts{"X"});
    EXPECT_EQ(spaceOf("[CIM]\nG[3]=X\n", 0), "root/velmira");
}

TEST_F(CimScriptParserTest, DiscardsWhatBelongsToUnnamedSlots) {
    const CimScriptParser& parser =
        script("[CIM]\nG[0]=A\nG[2]=B\nN[2]=root/other\nN[1]=root/lost\nA[1]=Lost\nA[2]=Kept\n");
    ASSERT_EQ(parser.getNumberOfClasses(), 2U);
    EXPECT_EQ(utf8(parser.getClassName(0)), "A");
    EXPECT_EQ(utf8(parser.getNamespace(0).getString()), "root/velmira");
    EXPECT_EQ(listed(parser.getPropertyList(0)), Texts{});
    EXPECT_EQ(utf8(parser.getClassName(1)), "B");
    EXPECT_EQ(utf8(parser.getNamespace(1).getString()), "root/other");
    EXPECT_EQ(listed(parser.getPropertyList(1)), Texts{"Kept"});
}

TEST_F(CimScriptParserTest, DropsSeveralEmptySlotsInARow) {
    EXPECT_EQ(classes("[CIM]\nG[9]=I\nG[4]=E\nG[3]=D\n"), (Texts{"D", "E", "I"}));
}

TEST_F(CimScriptParserTest, TakesTenClasses) {
    std::string text = "[CIM]\n";
    Texts expected;
    for (char slot = '0'; slot <= '9'; ++slot) {
        text += std::string("G[") + slot + "]=C" + slot + "\n";
        expected.push_back(std::string("C") + slot);
    }
    EXPECT_EQ(classes(text), expected);
}

TEST_F(CimScriptParserTest, IgnoresTheCaseOfLetters) {
    const CimScriptParser& parser = script("[CIM]\ng[1]=X\nn[1]=root/low\na[1]=P\n");
    ASSERT_EQ(parser.getNumberOfClasses(), 1U);
    EXPECT_EQ(utf8(parser.getClassName(0)), "X");
    EXPECT_EQ(utf8(parser.getNamespace(0).getString()), "root/low");
    EXPECT_EQ(listed(parser.getPropertyList(0)), Texts{"P"});
}

TEST_F(CimScriptParserTest, IgnoresMalformedEntries) {
    for (const char* line : {"GG[1]=X", "G[-1]=X", "G[1]", "X[1]=X", "G", "=",
                             "[]=", "G[1]=", "comment", "G[-99999999999999999999]=X", "# G[1]"}) {
        EXPECT_EQ(classes(std::string("[CIM]\n") + line + "\n"), Texts{}) << line;
    }
}

TEST_F(CimScriptParserTest, KeepsASlotWhenALaterLineHasNoValue) {
    EXPECT_EQ(classes("[CIM]\nG[0]=A\nG[0]=\n"), Texts{"A"});
}

TEST_F(CimScriptParserTest, ReadsTheSlotAsALeadingNumber) {
    EXPECT_EQ(classes("[CIM]\nG[x]=X\nG[1]=Y\n"), (Texts{"X", "Y"}));
    EXPECT_EQ(classes("[CIM]\nG[0]=A\nG[2]=B\nG[ 1]=C\n"), (Texts{"A", "C", "B"}));
    EXPECT_EQ(classes("[CIM]\nG[0]=A\nG[2]=B\nG[+1x]=C\n"), (Texts{"A", "C", "B"}));
    EXPECT_EQ(classes("[CIM]\nG[0]=A\nG[007]=B\nG[7]=C\n"), (Texts{"A", "C"}));
    EXPECT_EQ(classes("[CIM]\nG[-0]=A\n"), Texts{"A"});
}

TEST_F(CimScriptParserTest, LeavesParsingAtASlotOfTenOrMore) {
    for (const char* line :
         {"G[10]=X", "N[10]=X", "A[10]=X", "g[11]=X", "G[99999999999999999999]=X",
          "G[4294967296]=X", "G[18446744073709551616]=X"}) {
        EXPECT_THROW(script(std::string("[CIM]\n") + line + "\n"), IndexOutOfBoundsException)
            << line;
    }
}

TEST_F(CimScriptParserTest, LooksAtTheLetterBeforeTheBound) {
    EXPECT_EQ(classes("[CIM]\nX[10]=a\nGG[10]=a\nG[0]=A\n"), Texts{"A"});
}

TEST_F(CimScriptParserTest, DoesNotTrimBlanksAroundTheEqualsSign) {
    EXPECT_EQ(classes("[CIM]\nG[0] = X\n"), Texts{" "});
    EXPECT_EQ(classes("[CIM]\n G[0]=X\n"), Texts{});
}

TEST_F(CimScriptParserTest, NeedsOnlySeparatorsBetweenTokens) {
    EXPECT_EQ(classes("[CIM]\nG\t0\tX\n"), Texts{"X"});
    EXPECT_EQ(classes("[CIM]\nG[0]X\n"), Texts{"X"});
    EXPECT_EQ(classes("[CIM]\n\t[G[[0]]==X=Y\n"), Texts{"X"});
}

TEST_F(CimScriptParserTest, KnowsHeadersExactlyOnly) {
    EXPECT_EQ(classes("[cim]\nG[0]=X\n"), Texts{});
    EXPECT_EQ(classes("[CIM] \nG[0]=X\n"), Texts{});
    EXPECT_EQ(classes(" [CIM]\nG[0]=X\n"), Texts{});
    EXPECT_EQ(classes("[DEFAULT]\n[cim]\nG[0]=X\n"), Texts{});
    EXPECT_EQ(classes("[CIM]\n[default]\nG[0]=X\n"), Texts{"X"});
}

TEST_F(CimScriptParserTest, DropsLinesBeforeTheFirstSection) {
    EXPECT_EQ(classes("G[0]=X\n[CIM]\nG[1]=Y\n"), Texts{"Y"});
    EXPECT_EQ(title("title=Lost\n[DEFAULT]\n"), "cpu");
}

TEST_F(CimScriptParserTest, StaysInTheSectionAtAnUnknownHeader) {
    EXPECT_EQ(classes("[CIM]\n[OTHER]\nG[0]=X\n"), Texts{"X"});
    EXPECT_EQ(title("[DEFAULT]\n[OTHER]\ntitle=T\n"), "T");
}

TEST_F(CimScriptParserTest, TakesSectionsInAnyOrderAndAgain) {
    const CimScriptParser& parser = script(
        "[CIM]\nG[0]=A\n[DEFAULT]\ntitle=One\n[CIM]\nG[1]=B\nG[0]=C\n[DEFAULT]\n"
        "title=Two\ndefaultnamespace=root/late\n");
    EXPECT_EQ(parser.getNumberOfClasses(), 2U);
    EXPECT_EQ(utf8(parser.getClassName(0)), "C");
    EXPECT_EQ(utf8(parser.getClassName(1)), "B");
    EXPECT_EQ(utf8(parser.getTitle()), "Two");
    EXPECT_EQ(utf8(parser.getNamespace(0).getString()), "root/late");
}

TEST_F(CimScriptParserTest, KeepsEntriesToTheirSection) {
    EXPECT_EQ(classes("[DEFAULT]\nG[0]=X\n"), Texts{});
    EXPECT_EQ(title("[CIM]\ntitle=T\n"), "cpu");
}

TEST_F(CimScriptParserTest, SplitsDefaultEntriesAtTabAndEquals) {
    EXPECT_EQ(title("[DEFAULT]\nTITLE\tBig Iron\n"), "Big Iron");
    EXPECT_EQ(title("[DEFAULT]\nTitle==A=B\n"), "A");
    EXPECT_EQ(title("[DEFAULT]\n=title=X\n"), "X");
    EXPECT_EQ(title("[DEFAULT]\ntitle=X[0]\n"), "X[0]");
    EXPECT_EQ(title("[DEFAULT]\ntitle= X \n"), " X ");
    EXPECT_EQ(spaceOf("[DEFAULT]\nDefaultNamespace=root/x\n[CIM]\nG[0]=A\n", 0), "root/x");
}

TEST_F(CimScriptParserTest, KeepsASeparatorThatEndsTheValue) {
    EXPECT_EQ(title("[DEFAULT]\ntitle=X=\n"), "X=");
}

TEST_F(CimScriptParserTest, SetsNothingFromAnEntryThatDoesNotFit) {
    for (const char* line : {"title = X", "title", "title=", "title==", "titles=X", "title X"}) {
        EXPECT_EQ(title(std::string("[DEFAULT]\n") + line + "\n"), "cpu") << line;
    }
}

TEST_F(CimScriptParserTest, DropsACarriageReturnBeforeTheNewlineOnly) {
    EXPECT_EQ(classes("[CIM]\r\n\r\nG[0]=X\r\n"), Texts{"X"});
    EXPECT_EQ(classes("[CIM]\nG[0]=X\r"), Texts{"X\r"});
    EXPECT_EQ(title("[DEFAULT]\ntitle=A\rB\r\r\n"), "A\rB\r");
}

TEST_F(CimScriptParserTest, CutsALineAt1024Bytes) {
    const std::string value(1018, 'x');
    EXPECT_EQ(title("[DEFAULT]\ntitle=" + value + "yyyy\n"), value);
    EXPECT_EQ(title("[DEFAULT]\ntitle=" + value + "\r\n"), value);
    EXPECT_EQ(classes("[DEFAULT]\ntitle=" + value + "yyyy\n[CIM]\nG[0]=A\n"), Texts{"A"});
}

TEST_F(CimScriptParserTest, StartsEachLineWithACleanBuffer) {
    EXPECT_EQ(title("[DEFAULT]\ntitle=A long title of the script\ntitle=B\n"), "B");
}

TEST_F(CimScriptParserTest, EndsALineAtANulByte) {
    EXPECT_EQ(title(std::string("[DEFAULT]\ntitle=A\0B\n", 20)), "A");
    EXPECT_EQ(title(std::string("[DEFAULT]\n\0title=A\n", 19)), "cpu");
}

TEST_F(CimScriptParserTest, ReadsUtf8) {
    EXPECT_EQ(title("[DEFAULT]\ntitle=Gr\xC3\xB6\xC3\x9F"
                    "e\n"),
              "Gr\xC3\xB6\xC3\x9F"
              "e");
}

TEST_F(CimScriptParserTest, RaisesOnALineThatIsNotUtf8) {
    EXPECT_THROW(script("[DEFAULT]\ntitle=Gr\xF6\xDF"
                        "e\n"),
                 Exception);
    EXPECT_THROW(script("\xFF\n[CIM]\nG[0]=A\n"), Exception);
    EXPECT_THROW(script("[DEFAULT]\ntitle=" + std::string(1017, 'x') + "\xC3\xB6\n"), Exception);
}

TEST_F(CimScriptParserTest, TakesTheTitleFromTheFileName) {
    const auto titleOf = [](const char* file) {
        return utf8(CimScriptParser(String(file)).getTitle());
    };
    EXPECT_EQ(titleOf("/opt/x/cpu.script.inv"), "cpu");
    EXPECT_EQ(titleOf("/opt/x/CPU.Script.Inv"), "CPU");
    EXPECT_EQ(titleOf("cpu.script.inv"), "cpu");
    EXPECT_EQ(titleOf("/opt/x/a.b.script.inv"), "a.b");
    EXPECT_EQ(titleOf("/opt/x/cpu.txt"), "/opt/x/cpu.txt");
    EXPECT_EQ(titleOf(".script.inv"), ".script.inv");
    EXPECT_EQ(titleOf("/.script.inv"), "");
    EXPECT_EQ(titleOf(""), "");
}

TEST_F(CimScriptParserTest, AnswersOutsideItsSlots) {
    const CimScriptParser& parser = script("[CIM]\nG[0]=A\nN[0]=root/a\nA[0]=P\n");
    EXPECT_EQ(utf8(parser.getClassName(1)), "");
    EXPECT_EQ(utf8(parser.getClassName(-1)), "");
    EXPECT_EQ(utf8(parser.getNamespace(1).getString()), "root/velmira");
    EXPECT_EQ(utf8(parser.getNamespace(-1).getString()), "root/velmira");
    EXPECT_TRUE(parser.getPropertyList(1).isNull());
    EXPECT_TRUE(parser.getPropertyList(-1).isNull());
}

TEST_F(CimScriptParserTest, FindsAClassIgnoringCase) {
    const CimScriptParser& parser =
        script("[CIM]\nG[0]=CIM_Card\nG[1]=CIM_Processor\nG[2]=cim_PROCESSOR\n");
    EXPECT_EQ(parser.getClassIndex("cim_processor"), 1);
    EXPECT_EQ(parser.getClassIndex("CIM_Card"), 0);
    EXPECT_EQ(parser.getClassIndex("CIM_Car"), -1);
    EXPECT_EQ(parser.getClassIndex(""), -1);
}

TEST_F(CimScriptParserTest, RaisesOnlyWhenANamespaceIsAskedFor) {
    const CimScriptParser& parser =
        script("[DEFAULT]\ndefaultnamespace=root/\n[CIM]\nG[0]=A\nN[0]=a-b\nG[1]=B\n");
    EXPECT_THROW(parser.getNamespace(0), InvalidNamespaceNameException);
    EXPECT_THROW(parser.getNamespace(1), InvalidNamespaceNameException);
}

TEST_F(CimScriptParserTest, DropsOneLeadingSlashOfANamespace) {
    EXPECT_EQ(spaceOf("[CIM]\nG[0]=A\nN[0]=/root/cimv2\n", 0), "root/cimv2");
}

TEST_F(CimScriptParserTest, SplitsPropertyListsAtCommasAndSpaces) {
    EXPECT_EQ(properties("DeviceID, Name"), (Texts{"DeviceID", "Name"}));
    EXPECT_EQ(properties("a b,c"), (Texts{"a", "b", "c"}));
    EXPECT_EQ(properties(" ,a,, b"), (Texts{"a", "b"}));
    EXPECT_EQ(properties("Name, "), Texts{"Name"});
    EXPECT_EQ(properties(","), Texts{});
    EXPECT_EQ(properties("Name[1]"), Texts{"Name"});
    // U+012C and U+0120 end in the bytes of the comma and the blank.
    EXPECT_EQ(properties("a\xC4\xAC"
                         "b\xC4\xA0"
                         "c"),
              (Texts{"a", "b", "c"}));
}

TEST_F(CimScriptParserTest, GivesAnEmptyListToAClassWithoutOne) {
    const CIMPropertyList list = script("[CIM]\nG[0]=A\n").getPropertyList(0);
    EXPECT_FALSE(list.isNull());
    EXPECT_EQ(list.size(), 0U);
}

TEST_F(CimScriptParserTest, RaisesOnAnIllegalPropertyName) {
    for (const char* list : {"DeviceID,Name,", "Name ", "1st", "a-b", "a,b;c"}) {
        EXPECT_THROW(properties(list), InvalidNameException) << list;
    }
}

TEST_F(CimScriptParserTest, ReadsASecondTimeOnTopOfTheCompactedSlots) {
    CimScriptParser& parser = script("[CIM]\nG[3]=X\n");
    EXPECT_THROW(parser.parse(), IndexOutOfBoundsException);
    CimScriptParser& first = script("[CIM]\nG[0]=X\n");
    first.parse();
    EXPECT_EQ(first.getNumberOfClasses(), 1U);
}

TEST_F(CimScriptParserTest, TakesEntriesOneByOne) {
    CimScriptParser parser(String("/nowhere/x.script.inv"));
    parser.parseDefault("title=By hand");
    parser.parseCim("G[4]=A");
    EXPECT_EQ(utf8(parser.getClassName(4)), "A");
    parser.fixUpArrays();
    EXPECT_EQ(parser.getNumberOfClasses(), 1U);
    EXPECT_EQ(utf8(parser.getClassName(0)), "A");
    EXPECT_EQ(utf8(parser.getTitle()), "By hand");
}

TEST(ParseTokens, LeavesOutEmptyTokens) {
    EXPECT_EQ(tokens("", "\t="), Texts{});
    EXPECT_EQ(tokens("abc", "\t="), Texts{"abc"});
    EXPECT_EQ(tokens("a", "\t="), Texts{"a"});
    EXPECT_EQ(tokens("==a==b", "\t="), (Texts{"a", "b"}));
    EXPECT_EQ(tokens("=", "\t="), Texts{});
    EXPECT_EQ(tokens("a=b", ""), Texts{"a=b"});
}

TEST(ParseTokens, KeepsASeparatorThatEndsTheText) {
    EXPECT_EQ(tokens("Name,", ", "), Texts{"Name,"});
    EXPECT_EQ(tokens("a=b=", "\t="), (Texts{"a", "b="}));
    EXPECT_EQ(tokens("a=", "\t="), Texts{"a="});
}

TEST(ParseTokens, DropsALoneSeparatorAtTheEnd) {
    EXPECT_EQ(tokens("a==", "\t="), Texts{"a"});
    EXPECT_EQ(tokens("a=\t", "\t="), Texts{"a"});
}

TEST(ParseTokens, ComparesTheLowByteOfACharacter) {
    // U+015B and U+013D end in the bytes of "[" and "=".
    EXPECT_EQ(tokens("G\xC5\x9B"
                     "0]\xC4\xBDX",
                     "\t[]="),
              (Texts{"G", "0", "X"}));
    EXPECT_EQ(tokens("a=\xC4\xBD", "\t="), Texts{"a"});
    EXPECT_EQ(tokens("a\xC4\xBD", "\t="), Texts{"a\xC4\xBD"});
}

TEST(ParseTokens, DoesNotTakeALowByteOfZeroForASeparator) {
    EXPECT_EQ(tokens("a\xC4\x80"
                     "b",
                     "\t="),
              Texts{"a\xC4\x80"
                    "b"});
    EXPECT_EQ(tokens("\xC4\x80", "\t="), Texts{"\xC4\x80"});
}

TEST(IsSeparator, KnowsTheBytesOfTheText) {
    EXPECT_EQ(CimScriptParser::isSeparator('=', "\t[]="), 1);
    EXPECT_EQ(CimScriptParser::isSeparator('\t', "\t[]="), 1);
    EXPECT_EQ(CimScriptParser::isSeparator(' ', "\t[]="), 0);
    EXPECT_EQ(CimScriptParser::isSeparator('\0', "\t[]="), 0);
    EXPECT_EQ(CimScriptParser::isSeparator('x', ""), 0);
    EXPECT_EQ(CimScriptParser::isSeparator('\xE9', "\xE9"), 1);
}

}  // namespace
