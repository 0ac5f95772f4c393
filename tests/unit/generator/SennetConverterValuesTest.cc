// MIF types and values as the base dialect renders them.

#include <gtest/gtest.h>

#include <string>

#include "ConverterFixture.h"
#include "SennetConverter/mif/SennetConverter.h"

namespace {

using namespace Pegasus;
using namespace generatortest;

std::string quoted(const std::string& text) {
    return "\"" + text + "\"";
}

class SennetConverterValuesTest : public ConverterFixture {
  protected:
    std::string value(const CIMProperty& rendered) {
        return utf8(converter.getValueString(rendered.getValue(), rendered.getType(), rendered));
    }
    std::string value(const CIMValue& rendered) { return value(property("P", rendered)); }
    std::string array(const CIMProperty& rendered) {
        return utf8(converter.formatArray(rendered.getValue(), rendered.getType(), rendered));
    }
    std::string array(const CIMValue& rendered) { return array(property("P", rendered)); }
    std::string type(const CIMProperty& described) {
        return utf8(
            converter.getTypeString(cimClass("CIM_X", {described}), "P", described.getType()));
    }
    std::string typeOf(CIMType scalar) { return type(property("P", null(scalar))); }
    std::string escaped(const String& raw) { return utf8(converter.formatString(raw)); }
    std::string line(const CIMProperty& rendered, int blankValues) {
        return utf8(converter.getPropertyValueForClass(rendered, rendered.getType(),
                                                       rendered.getValue(), blankValues));
    }

    SennetConverter converter{outputName(), properties, 30};
};

TEST_F(SennetConverterValuesTest, DeclaresTypes) {
    for (CIMType integer : {CIMTYPE_UINT8, CIMTYPE_SINT8, CIMTYPE_UINT16, CIMTYPE_SINT16,
                            CIMTYPE_UINT32, CIMTYPE_SINT32, CIMTYPE_UINT64, CIMTYPE_SINT64}) {
        EXPECT_EQ(typeOf(integer), "         Type = Integer") << integer;
    }
    EXPECT_EQ(typeOf(CIMTYPE_DATETIME), "         Type = Date");
    EXPECT_EQ(typeOf(CIMTYPE_STRING), "         Type = String(255)");
    EXPECT_EQ(typeOf(CIMTYPE_BOOLEAN), "         Type = String(32)");
    EXPECT_EQ(typeOf(CIMTYPE_REAL32), "         Type = String(32)");
    EXPECT_EQ(typeOf(CIMTYPE_REAL64), "         Type = String(32)");
    EXPECT_EQ(typeOf(CIMTYPE_CHAR16), "         Type = String(32)");
    EXPECT_EQ(typeOf(CIMTYPE_REFERENCE), "         Type = String(32)");
}

TEST_F(SennetConverterValuesTest, DeclaresLengths) {
    EXPECT_EQ(type(property("P", null(CIMTYPE_STRING), {maxLen(1024)})),
              "         Type = String(1024)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_UINT16), {textsQualifier("Values", {"A"})})),
              "         Type = String(255)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_UINT16), {textsQualifier("ValueMap", {"1"})})),
              "         Type = Integer");
    properties.set("CIM_X.P.Size", "40");
    EXPECT_EQ(typeOf(CIMTYPE_BOOLEAN), "         Type = String(40)");
    EXPECT_EQ(typeOf(CIMTYPE_UINT32), "         Type = Integer");
    EXPECT_EQ(typeOf(CIMTYPE_DATETIME), "         Type = Date");
}

TEST_F(SennetConverterValuesTest, EscapesText) {
    EXPECT_EQ(escaped("a\rb\nc"), "a\\\rb\\\nc");
    EXPECT_EQ(escaped("say \"x\""), "say \\\"x\\\"");
    EXPECT_EQ(escaped("C:\\dir"), "C:\\\\dir");
    EXPECT_EQ(escaped("a\tb\x01"
                      "c\x1F"),
              "a b c ");
    EXPECT_EQ(escaped(" ~\x7F"), " ~ ");
    EXPECT_EQ(escaped("it's"), "it's");
    EXPECT_EQ(escaped(""), "");
}

TEST_F(SennetConverterValuesTest, BlanksEveryUnitBeyondAscii) {
    EXPECT_EQ(escaped("Gr\xC3\xB6\xC3\x9F"
                      "e"),
              "Gr  e");
    // U+0141 ends in the byte of "A"; U+1F600 takes two units.
    EXPECT_EQ(escaped("\xC5\x81"), " ");
    EXPECT_EQ(escaped("\xF0\x9F\x98\x80"), "  ");
    String nul("ab");
    nul[1] = Char16(0);
    EXPECT_EQ(escaped(nul), "a ");
}

TEST_F(SennetConverterValuesTest, EscapesTextMadeOnlyOfEscapedCharacters) {
    const std::string quotes(3000, '"');
    std::string expected;
    for (int i = 0; i < 3000; ++i) {
        expected += "\\\"";
    }
    EXPECT_EQ(escaped(String(quotes.c_str())), expected);
}

TEST_F(SennetConverterValuesTest, WritesIntegersUnquoted) {
    EXPECT_EQ(value(CIMValue(Uint16(5))), "5");
    EXPECT_EQ(value(CIMValue(Sint32(-5))), "-5");
    EXPECT_EQ(value(CIMValue(Uint32(4294967295U))), "-1");
    EXPECT_EQ(value(CIMValue(Uint64(8589934592U))), "0");
}

TEST_F(SennetConverterValuesTest, WritesANullIntegerAsZero) {
    EXPECT_EQ(value(null(CIMTYPE_UINT16)), "0");
    EXPECT_EQ(value(property("P", null(CIMTYPE_UINT16), {textsQualifier("Values", {"A"})})), "0");
}

TEST_F(SennetConverterValuesTest, MapsByPosition) {
    const auto mapped = [this](const CIMValue& number) {
        return value(property("P", number, {textsQualifier("Values", {"Unknown", "Other"})}));
    };
    EXPECT_EQ(mapped(CIMValue(Uint16(0))), "\"Unknown\"");
    EXPECT_EQ(mapped(CIMValue(Uint16(1))), "\"Other\"");
    EXPECT_EQ(mapped(CIMValue(Uint16(2))), "\"2\"");
    EXPECT_EQ(mapped(CIMValue(Uint16(5))), "\"5\"");
    EXPECT_EQ(mapped(CIMValue(Sint16(-1))), "\"Unknown\"");
    EXPECT_EQ(mapped(CIMValue(Uint64(18446744073709551615U))), "\"18446744073709551615\"");
    EXPECT_EQ(mapped(CIMValue(Uint64(4294967297U))), "\"4294967297\"");
}

TEST_F(SennetConverterValuesTest, MapsThroughTheValueMap) {
    const auto mapped = [this](const CIMValue& number) {
        return value(property("P", number,
                              {textsQualifier("valuemap", {"1", "3", "03", "3", "9", "..", "7"}),
                               textsQualifier("VALUES", {"A", "B", "C", "D", "E"})}));
    };
    EXPECT_EQ(mapped(CIMValue(Uint16(1))), "\"A\"");
    EXPECT_EQ(mapped(CIMValue(Uint16(3))), "\"B\"");
    EXPECT_EQ(mapped(CIMValue(Uint16(2))), "\"2\"");
    EXPECT_EQ(mapped(CIMValue(Uint16(0))), "\"0\"");
    EXPECT_EQ(mapped(CIMValue(Uint16(9))), "\"E\"");
    EXPECT_EQ(mapped(CIMValue(Uint16(7))), "\"7\"");
    EXPECT_EQ(mapped(CIMValue(Sint16(-1))), "\"0\"");
}

TEST_F(SennetConverterValuesTest, HasNoEntriesInAFaultyValuesQualifier) {
    const auto mapped = [this](const CIMValue& values) {
        return value(property("P", CIMValue(Uint16(0)), {CIMQualifier(CIMName("Values"), values)}));
    };
    EXPECT_EQ(mapped(nullArray(CIMTYPE_STRING)), "\"0\"");
    EXPECT_EQ(mapped(text("Zero")), "\"0\"");
    EXPECT_EQ(mapped(null(CIMTYPE_STRING)), "\"0\"");
    EXPECT_EQ(mapped(CIMValue(arrayOf<Uint16>({7}))), "\"0\"");
    EXPECT_EQ(mapped(CIMValue(strings({}))), "\"0\"");
}

TEST_F(SennetConverterValuesTest, IgnoresAValueMapThatIsNotOfStrings) {
    EXPECT_EQ(
        value(property("P", CIMValue(Uint16(1)),
                       {textsQualifier("Values", {"A", "B"}),
                        CIMQualifier(CIMName("ValueMap"), CIMValue(arrayOf<Uint16>({1, 0})))})),
        "\"B\"");
}

TEST_F(SennetConverterValuesTest, TakesANullOrScalarValueMapAsEmpty) {
    for (const CIMValue& map : {nullArray(CIMTYPE_STRING), null(CIMTYPE_STRING), text("1")}) {
        EXPECT_EQ(value(property("P", CIMValue(Uint16(1)),
                                 {textsQualifier("Values", {"A", "B"}),
                                  CIMQualifier(CIMName("ValueMap"), map)})),
                  "\"1\"");
    }
}

TEST_F(SennetConverterValuesTest, EscapesAndCutsMappedTexts) {
    EXPECT_EQ(
        value(property("P", CIMValue(Uint16(0)), {textsQualifier("Values", {"a\"b\\c\xC3\xB6"})})),
        "\"a\\\"b\\\\c \"");
    const std::string longText = std::string(254, 'x') + "\"yz";
    EXPECT_EQ(
        value(property("P", CIMValue(Uint16(0)), {textsQualifier("Values", {longText.c_str()})})),
        quoted(std::string(254, 'x') + "\\\""));
}

TEST_F(SennetConverterValuesTest, WritesIntegerArraysJoinedAndQuoted) {
    EXPECT_EQ(array(CIMValue(arrayOf<Uint16>({1, 2, 3}))), "\"1,2,3\"");
    EXPECT_EQ(array(CIMValue(arrayOf<Uint8>({255}))), "\"255\"");
    EXPECT_EQ(array(CIMValue(arrayOf<Sint8>({-1, 1}))), "\"-1,1\"");
    EXPECT_EQ(array(CIMValue(arrayOf<Sint16>({-300}))), "\"-300\"");
    EXPECT_EQ(array(CIMValue(arrayOf<Sint32>({-70000}))), "\"-70000\"");
    EXPECT_EQ(array(CIMValue(arrayOf<Uint32>({4294967295U, 1}))), "\"-1,1\"");
}

TEST_F(SennetConverterValuesTest, CutsArraysWithinAnElementAndBehindAComma) {
    const auto cut = [&](int length, const char* second) {
        const std::string first(static_cast<std::size_t>(length), 'a');
        return array(CIMValue(strings({first.c_str(), second, "z"})));
    };
    EXPECT_EQ(cut(250, "b"), quoted(std::string(250, 'a') + ",b,z"));
    EXPECT_EQ(cut(252, "bcd"), quoted(std::string(252, 'a') + ",bc"));
    EXPECT_EQ(cut(254, "bcd"), quoted(std::string(254, 'a') + ","));
    EXPECT_EQ(cut(255, "bcd"), quoted(std::string(255, 'a')));
    EXPECT_EQ(cut(256, "bcd"), quoted(std::string(255, 'a')));
}

// All of it would be 2 GiB of text.
TEST_F(SennetConverterValuesTest, MakesNoMoreOfAnArrayThanItWrites) {
    const std::string name(std::size_t{1} << 20, 'x');
    const Array<Uint16> numbers(2000, Uint16(0));
    EXPECT_EQ(array(property("P", CIMValue(numbers), {textsQualifier("Values", {name.c_str()})})),
              quoted(std::string(255, 'x')));
}

TEST_F(SennetConverterValuesTest, Writes64BitArrayElementsWhole) {
    EXPECT_EQ(array(CIMValue(arrayOf<Uint64>({5000000000U, 18446744073709551615U}))),
              "\"5000000000,18446744073709551615\"");
    EXPECT_EQ(array(CIMValue(arrayOf<Sint64>({-5000000000, 9223372036854775807}))),
              "\"-5000000000,9223372036854775807\"");
}

TEST_F(SennetConverterValuesTest, WritesEmptyAndNullArrays) {
    EXPECT_EQ(array(CIMValue(arrayOf<Uint16>({}))), "\"\"");
    EXPECT_EQ(array(nullArray(CIMTYPE_UINT16)), "\"\"");
    EXPECT_EQ(array(nullArray(CIMTYPE_STRING)), "\"\"");
    EXPECT_EQ(array(nullArray(CIMTYPE_BOOLEAN)), "\"\"");
    EXPECT_EQ(array(nullArray(CIMTYPE_DATETIME)), "\"\"");
    EXPECT_EQ(array(nullArray(CIMTYPE_REFERENCE)), "\"\"");
    EXPECT_EQ(array(property("P", nullArray(CIMTYPE_UINT16), {textsQualifier("Values", {"A"})})),
              "\"\"");
}

TEST_F(SennetConverterValuesTest, MapsArraysElementByElement) {
    EXPECT_EQ(array(property("P", CIMValue(arrayOf<Uint16>({0, 1, 9})),
                             {textsQualifier("Values", {"A", "B"})})),
              "\"A,B,9\"");
    EXPECT_EQ(array(property("P", CIMValue(arrayOf<Sint16>({3, -1, 2})),
                             {textsQualifier("ValueMap", {"2", "3"}),
                              textsQualifier("Values", {"Two", "Three"})})),
              "\"Three,0,Two\"");
}

TEST_F(SennetConverterValuesTest, CutsLongIntegerArrays) {
    Array<Uint8> hundreds;
    for (int i = 0; i < 100; ++i) {
        hundreds.append(Uint8(100));
    }
    std::string expected;
    for (int i = 0; i < 63; ++i) {
        expected += "100,";
    }
    EXPECT_EQ(array(CIMValue(hundreds)), quoted(expected + "100"));
}

TEST_F(SennetConverterValuesTest, FormatsIntegerArraysUnquoted) {
    EXPECT_EQ(utf8(converter.formatIntegerArray(CIMValue(arrayOf<Uint16>({1, 2})), CIMTYPE_UINT16)),
              "1,2");
    EXPECT_EQ(utf8(converter.formatIntegerArray(CIMValue(strings({"1"})), CIMTYPE_STRING)), "");
}

TEST_F(SennetConverterValuesTest, WritesOtherArrays) {
    EXPECT_EQ(array(CIMValue(arrayOf<Boolean>({true, false, true}))), "\"1,0,1\"");
    EXPECT_EQ(array(CIMValue(arrayOf<Real64>({1.5, -0.25}))), "\"1.500000,-0.250000\"");
    EXPECT_EQ(array(CIMValue(arrayOf<Real32>({0.5F}))), "\"0.500000\"");
    EXPECT_EQ(array(CIMValue(strings({"a", "", "b \"c\""}))), "\"a,,b \\\"c\\\"\"");
    EXPECT_EQ(array(CIMValue(arrayOf<CIMDateTime>({CIMDateTime("20061231235959.000000+060"),
                                                   CIMDateTime("00000001000000.000000:000")}))),
              "\"20061231235959.000000+060,00000001000000.000000:000\"");
    EXPECT_EQ(array(CIMValue(arrayOf<CIMObjectPath>({CIMObjectPath("root/x:B.k=\"v\"")}))),
              "\"root/x:B.k=\\\"v\\\"\"");
}

TEST_F(SennetConverterValuesTest, WritesTheLowByteOfChar16Elements) {
    // U+0141 gives "A"; low bytes of 0 and above 126 are one blank.
    EXPECT_EQ(array(CIMValue(
                  arrayOf<Char16>({Char16('x'), Char16(0x0141), Char16(0x0100), Char16(0),
                                   Char16(0x20AC), Char16(0x00E9), Char16(0x007F), Char16('"')}))),
              "\"x,A, , , , , ,\\\"\"");
}

TEST_F(SennetConverterValuesTest, CutsJoinedTextBeforeEscaping) {
    const std::string hundred(100, 'a');
    const std::string quotes(100, '"');
    const std::string joined = hundred + "," + hundred + ",";
    std::string escapedQuotes;
    for (int i = 0; i < 53; ++i) {
        escapedQuotes += "\\\"";
    }
    EXPECT_EQ(array(CIMValue(strings({hundred.c_str(), hundred.c_str(), quotes.c_str()}))),
              quoted(joined + escapedQuotes));
}

TEST_F(SennetConverterValuesTest, CutsHugeReals) {
    const std::string written = array(CIMValue(arrayOf<Real64>({1e300, 1e300})));
    EXPECT_EQ(written.size(), 257U);
    EXPECT_EQ(written.substr(0, 18), "\"10000000000000000");
}

TEST_F(SennetConverterValuesTest, WritesStrings) {
    EXPECT_EQ(value(text("a\"b")), "\"a\\\"b\"");
    EXPECT_EQ(value(text("")), "\"\"");
    EXPECT_EQ(value(null(CIMTYPE_STRING)), "\"\"");
}

TEST_F(SennetConverterValuesTest, CutsStringsBeforeEscaping) {
    const std::string kept(254, 'x');
    EXPECT_EQ(value(text((kept + "\"z").c_str())), quoted(kept + "\\\""));
    EXPECT_EQ(value(text((kept + "y").c_str())), quoted(kept + "y"));
}

TEST_F(SennetConverterValuesTest, WritesOtherScalars) {
    EXPECT_EQ(value(CIMValue(true)), "\"true\"");
    EXPECT_EQ(value(CIMValue(false)), "\"false\"");
    EXPECT_EQ(value(CIMValue(Real64(1.5))), "\"1.5000000000000000e+00\"");
    EXPECT_EQ(value(CIMValue(Real32(0.1F))), "\"1.0000000149011612e-01\"");
    EXPECT_EQ(value(CIMValue(Char16('A'))), "\"A\"");
    EXPECT_EQ(value(CIMValue(Char16('"'))), "\"\\\"\"");
    EXPECT_EQ(value(CIMValue(Char16(0x20AC))), "\"\\\\x20AC\"");
    EXPECT_EQ(value(null(CIMTYPE_BOOLEAN)), "\"\"");
    EXPECT_EQ(value(null(CIMTYPE_REAL64)), "\"\"");
    EXPECT_EQ(value(null(CIMTYPE_CHAR16)), "\"\"");
    EXPECT_EQ(value(null(CIMTYPE_REFERENCE)), "\"\"");
}

TEST_F(SennetConverterValuesTest, CutsOtherScalarsAfterEscaping) {
    EXPECT_EQ(value(CIMValue(CIMObjectPath("CIM_Disk.DeviceID=\"0123456789abc\""))),
              "\"CIM_Disk.DeviceID=\\\"0123456789ab\"");
    // The cut may fall between a backslash and the quote that it stands for.
    EXPECT_EQ(value(CIMValue(CIMObjectPath("CIM_Disk.DeviceID=\"0123456789a\""))),
              "\"CIM_Disk.DeviceID=\\\"0123456789a\\\"");
}

TEST_F(SennetConverterValuesTest, WritesValidDates) {
    const auto date = [this](const char* written) { return value(CIMValue(CIMDateTime(written))); };
    EXPECT_EQ(date("20061231235959.000000+060"), "\"20061231235959.000000+060\"");
    EXPECT_EQ(date("19000101000000.123456-300"), "\"19000101000000.123456-300\"");
    EXPECT_EQ(date("20991231000000.12****+000"), "\"20991231000000.12****+000\"");
}

TEST_F(SennetConverterValuesTest, WritesAFixedDateForOthers) {
    const std::string fixed = "\"19800101000000.000000+000\"";
    EXPECT_EQ(value(CIMValue(CIMDateTime("00000001020304.000000:000"))), fixed);
    EXPECT_EQ(value(CIMValue(CIMDateTime("18991231235959.000000+000"))), fixed);
    EXPECT_EQ(value(CIMValue(CIMDateTime("21000101000000.000000+000"))), fixed);
    EXPECT_EQ(value(CIMValue(CIMDateTime())), fixed);
    EXPECT_EQ(value(null(CIMTYPE_DATETIME)), fixed);
}

TEST_F(SennetConverterValuesTest, PassesIntervalsThatBeginLikeAYear) {
    EXPECT_EQ(value(CIMValue(CIMDateTime("19000101000000.000000:000"))),
              "\"19000101000000.000000:000\"");
    EXPECT_EQ(value(CIMValue(CIMDateTime("20000000000000.000000:000"))),
              "\"20000000000000.000000:000\"");
}

TEST_F(SennetConverterValuesTest, WritesTheValueLine) {
    const std::string head = "\r\n         Value = ";
    EXPECT_EQ(line(property("P", CIMValue(Uint16(5))), 0), head + "5");
    EXPECT_EQ(line(property("P", text("x")), 0), head + "\"x\"");
    EXPECT_EQ(line(property("P", CIMValue(arrayOf<Uint16>({1, 2}))), 0), head + "\"1,2\"");
}

TEST_F(SennetConverterValuesTest, BlanksTheValueLine) {
    const std::string head = "\r\n         Value = ";
    EXPECT_EQ(line(property("P", CIMValue(Uint16(5))), 1), head + "0");
    EXPECT_EQ(line(property("P", CIMValue(Uint16(5)), {textsQualifier("vaLues", {"A"})}), 1),
              head + "\"\"");
    EXPECT_EQ(line(property("P", CIMValue(Uint16(5)), {textsQualifier("ValueMap", {"5"})}), 1),
              head + "0");
    EXPECT_EQ(line(property("P", CIMValue(arrayOf<Uint16>({1}))), 1), head + "\"\"");
    EXPECT_EQ(line(property("P", text("x")), 1), head + "\"\"");
    EXPECT_EQ(line(property("P", CIMValue(true)), 1), head + "\"\"");
}

}  // namespace
