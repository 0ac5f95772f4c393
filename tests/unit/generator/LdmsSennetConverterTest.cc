// The LANDesk dialect: integers are declared as strings and written as numbers.

#include "SennetConverter/mif/LdmsSennetConverter.h"

#include <gtest/gtest.h>

#include <string>

#include "ConverterFixture.h"
#include "MifFixture.h"
#include "support/mif/Dialect.h"

namespace {

using namespace Pegasus;
using namespace generatortest;

class LdmsSennetConverterTest : public MifFixture {
  protected:
    LdmsSennetConverterTest() : MifFixture(Mif::kLanDeskDialect) {}

    std::string type(const CIMProperty& described) {
        return utf8(
            converter.getTypeString(cimClass("CIM_X", {described}), "P", described.getType()));
    }
    LdmsSennetConverter converter{outputName(), properties, 30};
};

TEST_F(LdmsSennetConverterTest, DeclaresIntegersAsStrings) {
    for (CIMType integer : {CIMTYPE_UINT8, CIMTYPE_SINT8, CIMTYPE_UINT16, CIMTYPE_SINT16,
                            CIMTYPE_UINT32, CIMTYPE_SINT32, CIMTYPE_UINT64, CIMTYPE_SINT64}) {
        EXPECT_EQ(type(property("P", null(integer))), "         Type = String(20)") << integer;
    }
    EXPECT_EQ(type(property("P", null(CIMTYPE_UINT16), {textsQualifier("Values", {"A"})})),
              "         Type = String(255)");
    properties.set("CIM_X.P.Size", "11");
    EXPECT_EQ(type(property("P", null(CIMTYPE_UINT32))), "         Type = String(11)");
}

TEST_F(LdmsSennetConverterTest, DeclaresOtherTypesAsTheBaseDoes) {
    EXPECT_EQ(type(property("P", null(CIMTYPE_DATETIME))), "         Type = Date");
    EXPECT_EQ(type(property("P", null(CIMTYPE_BOOLEAN))), "         Type = String(32)");
    EXPECT_EQ(type(property("P", null(CIMTYPE_STRING), {maxLen(1024)})),
              "         Type = String(1024)");
}

TEST_F(LdmsSennetConverterTest, WritesAWholeFile) {
    const CIMClass described =
        cimClass("CIM_X", {property("Size", null(CIMTYPE_UINT32)),
                           property("Path", null(CIMTYPE_STRING), {maxLen(80)})});
    const CIMInstance instance = cimInstance(
        "CIM_X", {property("Size", CIMValue(Uint32(7))), property("Path", text("C:\\"))});
    EXPECT_EQ(convert<LdmsSennetConverter>(
                  "[DEFAULT]\ntitle=Big Disk\n[CIM]\nG[0]=CIM_X\nA[0]=Size Path\n",
                  {{described, {instance}}}),
              crlf("Start Component\n"
                   "   Name = \"KW Services Inventory\"\n"
                   "\n"
                   "   Start Group\n"
                   "      Name = \"Big_Disk\"\n"
                   "      Class = \"Corvane-Velt|KWX MIF Big Disk|001\"\n"
                   "      Key = 1\n"
                   "      Start Attribute\n"
                   "         Name = \"Index\"\n"
                   "         Id = 1\n"
                   "         Type = String(5)\n"
                   "         Value = 1\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"Size\"\n"
                   "         Id = 2\n"
                   "         Type = String(20)\n"
                   "         Value = 7\n"
                   "      End Attribute\n"
                   "\n"
                   "      Start Attribute\n"
                   "         Name = \"Path\"\n"
                   "         Id = 3\n"
                   "         Type = String(80)\n"
                   "         Value = \"C:\\\\\"\n"
                   "      End Attribute\n"
                   "   End Group\n"
                   "\n"
                   "   Start Table\n"
                   "      Name = \"Big_Disk\"\n"
                   "      Class = \"Corvane-Velt|KWX MIF Big Disk|001\"\n"
                   "      Id = 2\n"
                   "      { 1, 7,\"C:\\\\\"}\n"
                   "\n"
                   "   End Table\n"
                   "End Component\n"));
}

}  // namespace
