// The SMS dialect: a component called Machine, an Integer key, row 1 last.

#include "SennetConverter/mif/SmsSennetConverter.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "ConverterFixture.h"
#include "MifFixture.h"
#include "support/mif/Dialect.h"

namespace {

using namespace Pegasus;
using namespace generatortest;

class SmsSennetConverterTest : public MifFixture {
  protected:
    SmsSennetConverterTest() : MifFixture(Mif::kSmsDialect) {}

    const CIMClass fanClass =
        cimClass("CIM_Fan", {property("Speed", null(CIMTYPE_UINT16)),
                             property("Name", null(CIMTYPE_STRING), {maxLen(64)})});

    static CIMInstance fan(Uint16 speed) {
        return cimInstance("CIM_Fan",
                           {property("Speed", CIMValue(speed)), property("Name", text("f"))});
    }
    static std::vector<CIMInstance> fans(Uint16 count) {
        std::vector<CIMInstance> result;
        for (Uint16 i = 1; i <= count; ++i) {
            result.push_back(fan(Uint16(i * 100)));
        }
        return result;
    }
    /// The document of fans with these rows, the template showing the first instance.
    static std::string document(const std::vector<std::string>& rows) {
        std::string result =
            "Start Component\n"
            "   Name = \"Machine\"\n"
            "\n"
            "   Start Group\n"
            "      Name = \"Fan_Data\"\n"
            "      Class = \"Corvane-Velt|KWX MIF Fan Data|001\"\n"
            "      Key = 1\n"
            "      Start Attribute\n"
            "         Name = \"Index\"\n"
            "         Id = 1\n"
            "         Type = Integer\n"
            "         Value = 1\n"
            "      End Attribute\n"
            "\n"
            "      Start Attribute\n"
            "         Name = \"Speed\"\n"
            "         Id = 2\n"
            "         Type = Integer\n"
            "         Value = 100\n"
            "      End Attribute\n"
            "\n"
            "      Start Attribute\n"
            "         Name = \"Name\"\n"
            "         Id = 3\n"
            "         Type = String(64)\n"
            "         Value = \"f\"\n"
            "      End Attribute\n"
            "   End Group\n"
            "\n"
            "   Start Table\n"
            "      Name = \"Fan_Data\"\n"
            "      Class = \"Corvane-Velt|KWX MIF Fan Data|001\"\n"
            "      Id = 2\n";
        for (const std::string& row : rows) {
            result += "      " + row + "\n";
        }
        return crlf(result + "\n   End Table\nEnd Component\n");
    }
};

constexpr const char* kScript = "[DEFAULT]\ntitle=Fan Data\n[CIM]\nG[0]=CIM_Fan\nA[0]=Speed Name\n";

TEST_F(SmsSennetConverterTest, WritesOneInstance) {
    EXPECT_EQ(convert<SmsSennetConverter>(kScript, {{fanClass, fans(1)}}),
              document({"{ 1, 100,\"f\"}"}));
}

TEST_F(SmsSennetConverterTest, WritesTheFirstRowLast) {
    EXPECT_EQ(convert<SmsSennetConverter>(kScript, {{fanClass, fans(3)}}),
              document({"{ 2, 200,\"f\"}", "{ 3, 300,\"f\"}", "{ 1, 100,\"f\"}"}));
    EXPECT_EQ(
        convert<SmsSennetConverter>(kScript, {{fanClass, fans(4)}}),
        document({"{ 2, 200,\"f\"}", "{ 3, 300,\"f\"}", "{ 4, 400,\"f\"}", "{ 1, 100,\"f\"}"}));
}

TEST_F(SmsSennetConverterTest, FollowsTheLongestList) {
    const CIMClass portClass = cimClass("CIM_Port", {property("Mac", null(CIMTYPE_STRING))});
    const auto port = [](const char* mac) {
        return cimInstance("CIM_Port", {property("Mac", text(mac))});
    };
    const std::string mif = convert<SmsSennetConverter>(
        std::string(kScript) + "G[1]=CIM_Port\nA[1]=Mac\n",
        {{fanClass, fans(2)}, {portClass, {port("x"), port("y"), port("z")}}});
    EXPECT_EQ(mif.substr(mif.find("      { ")), crlf("      { 2, 200,\"f\",\"y\"}\n"
                                                     "      { 3, ,,\"z\"}\n"
                                                     "      { 1, 100,\"f\",\"x\"}\n"
                                                     "\n"
                                                     "   End Table\n"
                                                     "End Component\n"));
}

TEST_F(SmsSennetConverterTest, NumbersTablesAndWritesTheComponentOnce) {
    Inventory one({{fanClass, fans(1)}});
    {
        SmsSennetConverter converter(outputName(), properties, 30);
        converter.printOutput(script(kScript), one.classes, one.lists);
        converter.printOutput(script(kScript), one.classes, one.lists);
    }
    const std::string mif = output();
    EXPECT_EQ(mif.find("Start Component"), 0U);
    EXPECT_EQ(mif.find("Start Component", 1), std::string::npos);
    EXPECT_NE(mif.find("|001\"\r\n      Id = 2\r\n"), std::string::npos);
    EXPECT_NE(mif.find("|001\"\r\n      Id = 3\r\n"), std::string::npos);
}

TEST_F(SmsSennetConverterTest, IgnoresTheBlankFlag) {
    SmsSennetConverter converter(outputName(), properties, 30);
    const CIMProperty number = property("P", CIMValue(Uint16(5)));
    EXPECT_EQ(
        utf8(converter.getPropertyValueForClass(number, CIMTYPE_UINT16, CIMValue(Uint16(5)), 1)),
        "\r\n         Value = 5");
    const CIMValue list(strings({"a", "b"}));
    EXPECT_EQ(
        utf8(converter.getPropertyValueForClass(property("P", list), CIMTYPE_STRING, list, 1)),
        "\r\n         Value = \"a,b\"");
}

TEST_F(SmsSennetConverterTest, NumbersTheKeyUnquoted) {
    SmsSennetConverter converter(outputName(), properties, 30);
    EXPECT_EQ(utf8(converter.mifClassHeader(script(kScript), 11)),
              crlf("\n"
                   "   Start Group\n"
                   "      Name = \"Fan_Data\"\n"
                   "      Class = \"Corvane-Velt|KWX MIF Fan Data|001\"\n"
                   "      Key = 1\n"
                   "      Start Attribute\n"
                   "         Name = \"Index\"\n"
                   "         Id = 1\n"
                   "         Type = Integer\n"
                   "         Value = 12\n"
                   "      End Attribute\n"));
}

}  // namespace
