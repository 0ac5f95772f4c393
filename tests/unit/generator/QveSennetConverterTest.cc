// The QVE dialect: quoted row numbers, String everywhere, short names, American dates.

#include "SennetConverter/mif/QveSennetConverter.h"

#include <gtest/gtest.h>

#include <string>

#include "ConverterFixture.h"
#include "MifFixture.h"
#include "SennetConverter/mif/QveLumoSennetConverter.h"
#include "support/mif/Dialect.h"

namespace {

using namespace Pegasus;
using namespace generatortest;

class QveSennetConverterTest : public MifFixture {
  protected:
    QveSennetConverterTest() : MifFixture(Mif::kQveDialect) {}

    std::string value(const CIMProperty& rendered) {
        return utf8(converter.getValueString(rendered.getValue(), rendered.getType(), rendered));
    }
    std::string value(const CIMValue& rendered) { return value(property("P", rendered)); }
    std::string array(const CIMValue& rendered) {
        const CIMProperty p = property("P", rendered);
        return utf8(converter.formatArray(rendered, rendered.getType(), p));
    }
    std::string type(const CIMProperty& described) {
        return utf8(
            converter.getTypeString(cimClass("CIM_X", {described}), "P", described.getType()));
    }
    std::string line(const CIMProperty& rendered, int blankValues) {
        return utf8(converter.getPropertyValueForClass(rendered, rendered.getType(),
                                                       rendered.getValue(), blankValues));
    }
    std::string date(const char* written) { return value(CIMValue(CIMDateTime(written))); }

    QveSennetConverter converter{outputName(), properties, 30};
};

const CIMClass& diskClass() {
    static const CIMClass described =
        cimClass("CIM_Disk", {property("Size", null(CIMTYPE_UINT32)),
                              property("Model", null(CIMTYPE_STRING), {maxLen(1024)}),
                              property("Made", null(CIMTYPE_DATETIME))});
    return described;
}

CIMInstance disk(Uint32 size, const char* model) {
    return cimInstance("CIM_Disk",
                       {property("Size", CIMValue(size)), property("Model", text(model)),
                        property("Made", CIMValue(CIMDateTime("20070105120000.000000+000")))});
}

constexpr const char* kDiskScript =
    "[DEFAULT]\ntitle=Disk Drive\n[CIM]\nG[0]=CIM_Disk\nA[0]=Size Model Made\n";

TEST_F(QveSennetConverterTest, WritesOneInstanceToTheByte) {
    EXPECT_EQ(convert<QveSennetConverter>(kDiskScript, {{diskClass(), {disk(40, "a \"b\"")}}}),
              crlf("Start Component\n"
                   "   Name = \"KW Services Inventory\"\n"
                   "\n"
                   "   Start Group\n"
                   "      Name = \"KWX_Disk_Drive\"\n"
                   "      Class = \"Corvane-Velt|KWX MIF Disk Drive|001\"\n"
                   "      Key = 1\n"
                   "      Start Attribute\n"
                   "         Name = \"Row_Index\"\n"
                   "         Id = 1\n"
                   "         Type = String(5)\n"
                   "         Value = \"1    \"\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"siz_\"\n"
                   "         Id = 2\n"
                   "         Type = String(20)\n"
                   "         Value = \"40\"\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"Model\"\n"
                   "         Id = 3\n"
                   "         Type = String(255)\n"
                   "         Value = \"a 'b'\"\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"Made\"\n"
                   "         Id = 4\n"
                   "         Type = String(25)\n"
                   "         Value = \"1/5/07\"\n"
                   "      End Attribute\n"
                   "   End Group\n"
                   "\n"
                   "   Start Table\n"
                   "      Name = \"KWX_Disk_Drive\"\n"
                   "      Class = \"Corvane-Velt|KWX MIF Disk Drive|001\"\n"
                   "      Id = 2\n"
                   "      { \"1    \", \"40\",\"a 'b'\",\"1/5/07\"}\n"
                   "\n"
                   "   End Table\n"
                   "End Component\n"));
}

TEST_F(QveSennetConverterTest, BlanksEveryAttributeOfSeveralInstances) {
    EXPECT_EQ(convert<QveSennetConverter>(
                  kDiskScript, {{diskClass(), {disk(1, "a"), disk(2, "b"), disk(3, "c")}}}),
              crlf("Start Component\n"
                   "   Name = \"KW Services Inventory\"\n"
                   "\n"
                   "   Start Group\n"
                   "      Name = \"KWX_Disk_Drive\"\n"
                   "      Class = \"Corvane-Velt|KWX MIF Disk Drive|001\"\n"
                   "      Key = 1\n"
                   "      Start Attribute\n"
                   "         Name = \"Row_Index\"\n"
                   "         Id = 1\n"
                   "         Type = String(5)\n"
                   "         Value = \"1    \"\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"siz_\"\n"
                   "         Id = 2\n"
                   "         Type = String(20)\n"
                   "         Value = \"\"\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"Model\"\n"
                   "         Id = 3\n"
                   "         Type = String(255)\n"
                   "         Value = \"\"\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"Made\"\n"
                   "         Id = 4\n"
                   "         Type = String(25)\n"
                   "         Value = \"\"\n"
                   "      End Attribute\n"
                   "   End Group\n"
                   "\n"
                   "   Start Table\n"
                   "      Name = \"KWX_Disk_Drive\"\n"
                   "      Class = \"Corvane-Velt|KWX MIF Disk Drive|001\"\n"
                   "      Id = 2\n"
                   "      { \"1    \", \"1\",\"a\",\"1/5/07\"}\n"
                   "      { \"2    \", \"2\",\"b\",\"1/5/07\"}\n"
                   "      { \"3    \", \"3\",\"c\",\"1/5/07\"}\n"
                   "\n"
                   "   End Table\n"
                   "End Component\n"));
}

TEST_F(QveSennetConverterTest, KeepsRowNumbersFiveWide) {
    std::vector<CIMInstance> disks(12, disk(1, "a"));
    const std::string mif = convert<QveSennetConverter>(kDiskScript, {{diskClass(), disks}});
    EXPECT_NE(mif.find("\r\n      { \"9    \", \"1\","), std::string::npos);
    EXPECT_NE(mif.find("\r\n      { \"10   \", \"1\","), std::string::npos);
    EXPECT_NE(mif.find("\r\n      { \"12   \", \"1\","), std::string::npos);
    EXPECT_EQ(mif.find("\"13"), std::string::npos);
}

TEST_F(QveSennetConverterTest, PadsTheKeyWithFourBlanksAlways) {
    const std::string header = utf8(converter.mifClassHeader(script(kDiskScript), 11));
    EXPECT_EQ(header, crlf("\n"
                           "   Start Group\n"
                           "      Name = \"KWX_Disk_Drive\"\n"
                           "      Class = \"Corvane-Velt|KWX MIF Disk Drive|001\"\n"
                           "      Key = 1\n"
                           "      Start Attribute\n"
                           "         Name = \"Row_Index\"\n"
                           "         Id = 1\n"
                           "         Type = String(5)\n"
                           "         Value = \"12    \"\n"
                           "      End Attribute\n"));
}

TEST_F(QveSennetConverterTest, ShortensTitlesBehindThePrefix) {
    // 26 characters are over 25: the first 22 and the hash, 35 + 26 = 61 = 1*36 + 25.
    const std::string header =
        utf8(converter.mifClassHeader(script("[DEFAULT]\ntitle=0000000000000000000000000z\n"), 1));
    EXPECT_NE(header.find("      Name = \"KWX_00000000000000000000001p\"\r\n"), std::string::npos);
    EXPECT_NE(header.find("MIF 0000000000000000000000000z|001\"\r\n"), std::string::npos);
}

TEST_F(QveSennetConverterTest, ShortensWithItsLimit) {
    EXPECT_EQ(utf8(converter.hashString("InstalledSoftwareProduct")), "InstalledSoftwareProduct");
    EXPECT_EQ(utf8(converter.substituteValues("Volume_Drive")), "Volume_Drive");
    EXPECT_EQ(utf8(converter.formatProperty("Size")), "siz_");
    EXPECT_EQ(utf8(converter.formatProperty("Speed (MHz)")), "Speed__MHz_");
    EXPECT_EQ(utf8(converter.formatProperty("A name of more than thirty characters")),
              "A_name_of_more_than_thirty_cha");
}

TEST_F(QveSennetConverterTest, EscapesText) {
    const auto escaped = [this](const char* raw) { return utf8(converter.formatString(raw)); };
    EXPECT_EQ(escaped("say \"x\""), "say 'x'");
    EXPECT_EQ(escaped("C:\\dir"), "C:\\\\dir");
    EXPECT_EQ(escaped("a\rb\nc"), "a\\\rb\\\nc");
    EXPECT_EQ(escaped("a\tb\x7F\xC3\xB6~"), "a b  ~");
}

TEST_F(QveSennetConverterTest, DeclaresStringsOnly) {
    EXPECT_EQ(type(property("P", null(CIMTYPE_UINT16))), "         Type = String(20)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_UINT16), {textsQualifier("Values", {"A"})})),
              "         Type = String(255)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_DATETIME))), "         Type = String(25)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_BOOLEAN))), "         Type = String(32)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_STRING), {maxLen(64)})),
              "         Type = String(64)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_STRING), {maxLen(255)})),
              "         Type = String(255)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_STRING), {maxLen(256)})),
              "         Type = String(255)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_STRING), {maxLen(1024)})),
              "         Type = String(255)");
}

TEST_F(QveSennetConverterTest, LimitsTheLengthOfStringsOnly) {
    properties.set("CIM_X.P.Size", "1000");
    EXPECT_EQ(type(property("P", null(CIMTYPE_STRING))), "         Type = String(255)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_UINT16))), "         Type = String(1000)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_DATETIME))), "         Type = String(1000)");
    properties.set("CIM_X.P.Size", "99999999999999999999");
    EXPECT_EQ(type(property("P", null(CIMTYPE_STRING))), "         Type = String(255)");
}

TEST_F(QveSennetConverterTest, QuotesIntegers) {
    EXPECT_EQ(value(CIMValue(Uint16(5))), "\"5\"");
    EXPECT_EQ(value(CIMValue(Sint32(-5))), "\"-5\"");
    EXPECT_EQ(value(CIMValue(Uint64(8589934592U))), "\"0\"");
    EXPECT_EQ(value(null(CIMTYPE_UINT16)), "\"null\"");
    EXPECT_EQ(array(CIMValue(arrayOf<Uint16>({1, 2}))), "\"1,2\"");
}

TEST_F(QveSennetConverterTest, MapsIntegers) {
    EXPECT_EQ(value(property("P", CIMValue(Uint16(1)), {textsQualifier("Values", {"A", "\"B\""})})),
              "\"'B'\"");
    EXPECT_EQ(value(property("P", CIMValue(Uint16(2)), {textsQualifier("Values", {"A", "B"})})),
              "\"2\"");
    EXPECT_EQ(value(property("P", null(CIMTYPE_UINT16), {textsQualifier("Values", {"A"})})),
              "\"null\"");
}

TEST_F(QveSennetConverterTest, WritesDatesMonthFirst) {
    EXPECT_EQ(date("20061231235959.000000+060"), "\"12/31/06\"");
    EXPECT_EQ(date("20070105000000.000000+000"), "\"1/5/07\"");
    EXPECT_EQ(date("19991020000000.000000+000"), "\"10/20/99\"");
    EXPECT_EQ(date("20000229000000.000000+000"), "\"2/29/00\"");
}

TEST_F(QveSennetConverterTest, WritesNothingForAnInvalidDate) {
    EXPECT_EQ(date("00000001000000.000000:000"), "\"\"");
    EXPECT_EQ(date("21000101000000.000000+000"), "\"\"");
    EXPECT_EQ(value(null(CIMTYPE_DATETIME)), "\"\"");
}

TEST_F(QveSennetConverterTest, ReadsAnIntervalThatBeginsLikeAYear) {
    EXPECT_EQ(date("20061231000000.000000:000"), "\"12/31/06\"");
    EXPECT_EQ(date("20000000000000.000000:000"), "\"0/0/00\"");
}

TEST_F(QveSennetConverterTest, WritesOtherValuesAsTheBaseDoes) {
    EXPECT_EQ(value(text("it \"is\"")), "\"it 'is'\"");
    EXPECT_EQ(value(CIMValue(true)), "\"true\"");
    EXPECT_EQ(value(null(CIMTYPE_STRING)), "\"\"");
    EXPECT_EQ(array(CIMValue(strings({"\"a\"", "b"}))), "\"'a',b\"");
    // An apostrophe takes one place where an escaped quote took two: the cut falls later.
    EXPECT_EQ(value(CIMValue(CIMObjectPath("CIM_Disk.DeviceID=\"0123456789abc\""))),
              "\"CIM_Disk.DeviceID='0123456789abc\"");
}

TEST_F(QveSennetConverterTest, WritesTheValueLine) {
    const std::string head = "\r\n         Value = ";
    EXPECT_EQ(line(property("P", CIMValue(Uint16(5))), 0), head + "\"5\"");
    EXPECT_EQ(line(property("P", CIMValue(arrayOf<Uint16>({5}))), 0), head + "\"5\"");
    EXPECT_EQ(line(property("P", CIMValue(Uint16(5))), 1), head + "\"\"");
    EXPECT_EQ(line(property("P", text("x")), 1), head + "\"\"");
}

TEST_F(QveSennetConverterTest, ReplacesHalfACharacterLeftByACut) {
    // U+1F600 takes two units, and the second is beyond the thirtieth.
    const std::string kept(29, 'x');
    properties.set("CIM_X.P", kept + "\xF0\x9F\x98\x80");
    const std::string mif = convert<QveSennetConverter>(
        "[CIM]\nG[0]=CIM_X\nA[0]=P\n",
        {{cimClass("CIM_X", {}), {cimInstance("CIM_X", {property("P", text("v"))})}}});
    EXPECT_NE(mif.find("         Name = \"" + kept + "\xEF\xBF\xBD\"\r\n"), std::string::npos);
}

class QveLumoSennetConverterTest : public MifFixture {
  protected:
    QveLumoSennetConverterTest() : MifFixture(Mif::kQveDialect) {}

    QveLumoSennetConverter converter{outputName(), properties, 18};
};

TEST_F(QveLumoSennetConverterTest, AbbreviatesGroupTableAndAttributeNames) {
    const CIMClass described =
        cimClass("CIM_Disk", {property("Size", CIMValue(Uint32(4))),
                              property("Serial_Number", text("S1"), {maxLen(30)}),
                              property("FileSystemSizeTotalBytes", CIMValue(Uint8(5)))});
    EXPECT_EQ(convert<QveLumoSennetConverter>("[DEFAULT]\ntitle=Disk Drive\n[CIM]\nG[0]=CIM_Disk\n"
                                              "A[0]=Size,Serial_Number,FileSystemSizeTotalBytes\n",
                                              {{described, {cimInstance("CIM_Disk", {})}}}, 18),
              crlf("Start Component\n"
                   "   Name = \"KW Services Inventory\"\n"
                   "\n"
                   "   Start Group\n"
                   "      Name = \"KWX_Disk_DRV\"\n"
                   "      Class = \"Corvane-Velt|KWX MIF Disk Drive|001\"\n"
                   "      Key = 1\n"
                   "      Start Attribute\n"
                   "         Name = \"Row_Index\"\n"
                   "         Id = 1\n"
                   "         Type = String(5)\n"
                   "         Value = \"1    \"\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"siz\"\n"
                   "         Id = 2\n"
                   "         Type = String(20)\n"
                   "         Value = \"4\"\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"SER_NUM\"\n"
                   "         Id = 3\n"
                   "         Type = String(30)\n"
                   "         Value = \"S1\"\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"FILESYS\"\n"
                   "         Id = 4\n"
                   "         Type = String(20)\n"
                   "         Value = \"5\"\n"
                   "      End Attribute\n"
                   "   End Group\n"
                   "\n"
                   "   Start Table\n"
                   "      Name = \"KWX_Disk_DRV\"\n"
                   "      Class = \"Corvane-Velt|KWX MIF Disk Drive|001\"\n"
                   "      Id = 2\n"
                   "      { \"1    \", \"4\",\"S1\",\"5\"}\n"
                   "\n"
                   "   End Table\n"
                   "End Component\n"));
}

TEST_F(QveLumoSennetConverterTest, ComparesNamesBeforeAbbreviatingThem) {
    tolerate({Mif::Tolerance::RepeatedNames});
    const CIMClass described = cimClass(
        "CIM_X", {property("Drive", CIMValue(Uint8(1))), property("Driver", CIMValue(Uint8(2)))});
    const std::string mif = convert<QveLumoSennetConverter>(
        "[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=Drive Driver\n",
        {{described, {cimInstance("CIM_X", {})}}}, 18);
    EXPECT_NE(mif.find("Name = \"DRV\"\r\n         Id = 2\r\n"), std::string::npos);
    EXPECT_NE(mif.find("Name = \"DRV\"\r\n         Id = 3\r\n"), std::string::npos);
}

TEST_F(QveLumoSennetConverterTest, CutsNamesBeforeAbbreviatingThem) {
    // Both cut to the same 18 characters, so the second gets its Id behind them.
    const CIMClass described =
        cimClass("CIM_X", {property("MaximumNumberOfRows1", CIMValue(Uint8(1))),
                           property("MaximumNumberOfRows2", CIMValue(Uint8(2)))});
    const std::string mif = convert<QveLumoSennetConverter>(
        "[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=MaximumNumberOfRows1 MaximumNumberOfRows2\n",
        {{described, {cimInstance("CIM_X", {})}}}, 18);
    EXPECT_NE(mif.find("Name = \"MaximumNumberOfRow\"\r\n         Id = 2\r\n"), std::string::npos);
    EXPECT_NE(mif.find("Name = \"MaximumNumberOfRow3\"\r\n         Id = 3\r\n"), std::string::npos);
}

TEST_F(QveLumoSennetConverterTest, ShortensAndAbbreviates) {
    EXPECT_EQ(utf8(converter.substituteValues("Volume_Drive")), "VOL_DRV");
    EXPECT_EQ(utf8(converter.hashString("InstalledSoftwareProduct")), "InstalledSbij");
    EXPECT_EQ(utf8(converter.formatProperty("Speed (MHz) of the bus")), "Speed__MHz__of_the");
}

}  // namespace
