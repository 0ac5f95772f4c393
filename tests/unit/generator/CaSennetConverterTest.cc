// The CA dialect: one group per instance, no tables.

#include "SennetConverter/mif/CaSennetConverter.h"

#include <gtest/gtest.h>

#include <string>

#include "ConverterFixture.h"
#include "MifFixture.h"
#include "support/mif/Dialect.h"

namespace {

using namespace Pegasus;
using namespace generatortest;

const std::string kComponent = "Start Component\n   Name = \"KW Services Inventory\"\n";

std::string groupHead(const std::string& title, int groupId, int index) {
    return "\n   Start Group\n      Name = \"" + title +
           "\"\n      Class = \"Corvane-Velt|KWX MIF " + title +
           "|001\"\n      ID = " + std::to_string(groupId) +
           "\n      Key = 1\n      Start Attribute\n         Name = \"Index\"\n         Id = 1\n"
           "         Type = Integer\n         Value = " +
           std::to_string(index) + "\n      End Attribute\n";
}

std::string attribute(const std::string& name, int id, const std::string& type,
                      const std::string& value) {
    return "\n      Start Attribute\n         Name = \"" + name +
           "\"\n         Id = " + std::to_string(id) + "\n         Type = " + type +
           "\n         Value = " + value + "\n      End Attribute\n";
}

class CaSennetConverterTest : public MifFixture {
  protected:
    CaSennetConverterTest() : MifFixture(Mif::kCaDialect) {}

    const CIMClass fanClass = cimClass(
        "CIM_Fan",
        {property("Name", text("spare"), {maxLen(64)}), property("Speed", null(CIMTYPE_UINT16)),
         property("State", null(CIMTYPE_UINT16), {textsQualifier("Values", {"Off", "On"})})});
    const CIMClass portClass = cimClass("CIM_Port", {property("Mac", null(CIMTYPE_STRING))});

    static CIMInstance fan(const char* name, Uint16 speed) {
        return cimInstance("CIM_Fan",
                           {property("Name", text(name)), property("Speed", CIMValue(speed)),
                            property("State", CIMValue(Uint16(1)))});
    }
    static CIMInstance port(const char* mac) {
        return cimInstance("CIM_Port", {property("Mac", text(mac))});
    }
};

constexpr const char* kScript =
    "[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Fan\nA[0]=Name Speed State\nG[1]=CIM_Port\nA[1]=Mac\n";

TEST_F(CaSennetConverterTest, WritesAGroupPerInstanceAndNoTable) {
    tolerate({Mif::Tolerance::IntegersAsText});
    EXPECT_EQ(convert<CaSennetConverter>(kScript, {{fanClass, {fan("a", 1), fan("b", 2)}},
                                                   {portClass, {port("x"), port("y"), port("z")}}}),
              crlf(kComponent +                                                      //
                   groupHead("T", 2, 1) +                                            //
                   attribute("Name", 2, "String(64)", "\"a\"") +                     //
                   attribute("Speed", 3, "Integer", "1") +                           //
                   attribute("State", 4, "String(255)", "\"On\"") +                  //
                   attribute("Mac", 5, "String(255)", "\"x\"") + "   End Group\n" +  //
                   groupHead("T", 3, 2) +                                            //
                   attribute("Name", 2, "String(64)", "\"b\"") +                     //
                   attribute("Speed", 3, "Integer", "2") +                           //
                   attribute("State", 4, "String(255)", "\"On\"") +                  //
                   attribute("Mac", 5, "String(255)", "\"y\"") + "   End Group\n" +  //
                   groupHead("T", 4, 3) +                                            //
                   attribute("Name", 2, "String(64)", "\"spare\"") +                 //
                   attribute("Speed", 3, "Integer", "0") +                           //
                   attribute("State", 4, "String(255)", "0") +                       //
                   attribute("Mac", 5, "String(255)", "\"z\"") + "   End Group\n" +  //
                   "End Component\n"));
}

TEST_F(CaSennetConverterTest, NumbersGroupsThroughTheWholeFile) {
    Inventory none({{portClass, {}}});
    Inventory two({{portClass, {port("a"), port("b")}}});
    Inventory one({{portClass, {port("c")}}});
    const std::string lines = "[CIM]\nG[0]=CIM_Port\nA[0]=Mac\n";
    {
        CaSennetConverter converter(outputName(), properties, 30);
        converter.printOutput(script(lines, "none"), none.classes, none.lists);
        converter.printOutput(script(lines, "two"), two.classes, two.lists);
        converter.printOutput(script(lines, "one"), one.classes, one.lists);
    }
    EXPECT_EQ(output(), crlf(kComponent + groupHead("two", 2, 1) +
                             attribute("Mac", 2, "String(255)", "\"a\"") + "   End Group\n" +
                             groupHead("two", 3, 2) + attribute("Mac", 2, "String(255)", "\"b\"") +
                             "   End Group\n" + groupHead("one", 4, 1) +
                             attribute("Mac", 2, "String(255)", "\"c\"") + "   End Group\n" +
                             "End Component\n"));
}

// The groups of a script have their attributes in common but for what the instances decide.
TEST_F(CaSennetConverterTest, TypesEachGroupByItsOwnInstance) {
    expectUnreadable("24:4: Group unlike the earlier one of its class");
    const CIMClass described = cimClass("CIM_X", {property("P", null(CIMTYPE_UINT16))});
    const auto having = [](const CIMValue& value) {
        return cimInstance("CIM_X", {property("P", value)});
    };
    const Answer answer{described,
                        {having(CIMValue(Uint16(5))), having(text("word")),
                         having(CIMValue(arrayOf<Uint16>({1, 2}))), having(CIMValue(Uint16(6))),
                         cimInstance("CIM_X", {}), having(CIMValue(arrayOf<Uint16>({3})))}};
    EXPECT_EQ(
        convert<CaSennetConverter>("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=P\n", {answer}),
        crlf(kComponent +  //
             groupHead("T", 2, 1) + attribute("P", 2, "Integer", "5") + "   End Group\n" +
             groupHead("T", 3, 2) + attribute("P", 2, "String(20)", "\"word\"") + "   End Group\n" +
             groupHead("T", 4, 3) + attribute("P", 2, "String(255)", "\"1,2\"") + "   End Group\n" +
             groupHead("T", 5, 4) + attribute("P", 2, "Integer", "6") + "   End Group\n" +
             groupHead("T", 6, 5) + attribute("P", 2, "Integer", "0") + "   End Group\n" +
             groupHead("T", 7, 6) + attribute("P", 2, "String(255)", "\"3\"") + "   End Group\n" +
             "End Component\n"));
}

TEST_F(CaSennetConverterTest, WritesNothingWithoutInstances) {
    support::writeFile(path("out.mif"), "stale");
    Inventory none({{fanClass, {}}, {portClass, {}}});
    {
        CaSennetConverter converter(outputName(), properties, 30);
        converter.printOutput(script(kScript), none.classes, none.lists);
    }
    EXPECT_FALSE(outputExists());
}

TEST_F(CaSennetConverterTest, WritesTheComponentAgainAfterAnAbandonedFirstGroup) {
    expectUnreadable("15:7: expected 'attribute', found 'component'");
    Inventory one({{portClass, {port("a")}}});
    {
        CaSennetConverter converter(outputName(), properties, 30);
        CimScriptParser& faulty = script("[CIM]\nG[0]=CIM_Port\nA[0]=Mac,\n", "bad");
        EXPECT_THROW(converter.printOutput(faulty, one.classes, one.lists), InvalidNameException);
        converter.printOutput(script("[CIM]\nG[0]=CIM_Port\nA[0]=Mac\n", "good"), one.classes,
                              one.lists);
    }
    EXPECT_EQ(output(), crlf(kComponent + groupHead("bad", 2, 1) + kComponent +
                             groupHead("good", 2, 1) + attribute("Mac", 2, "String(255)", "\"a\"") +
                             "   End Group\n" + "End Component\n"));
}

TEST_F(CaSennetConverterTest, IgnoresTheBlankFlag) {
    CaSennetConverter converter(outputName(), properties, 30);
    const CIMProperty number = property("P", CIMValue(Uint16(5)));
    EXPECT_EQ(
        utf8(converter.getPropertyValueForClass(number, CIMTYPE_UINT16, CIMValue(Uint16(5)), 1)),
        "\r\n         Value = 5");
    const CIMValue list(arrayOf<Uint16>({5, 6}));
    EXPECT_EQ(
        utf8(converter.getPropertyValueForClass(property("P", list), CIMTYPE_UINT16, list, 1)),
        "\r\n         Value = \"5,6\"");
}

TEST_F(CaSennetConverterTest, KeepsBackslashes) {
    CaSennetConverter converter(outputName(), properties, 30);
    const auto escaped = [&converter](const char* raw) {
        return utf8(converter.formatString(raw));
    };
    EXPECT_EQ(escaped("C:\\dir"), "C:\\dir");
    EXPECT_EQ(escaped("say \"x\""), "say \\\"x\\\"");
    EXPECT_EQ(escaped("a\rb\nc"), "a\\\rb\\\nc");
    EXPECT_EQ(escaped("a\tb\x7F\xC3\xB6~"), "a b  ~");
}

TEST_F(CaSennetConverterTest, KeepsNamesWhole) {
    CaSennetConverter converter(outputName(), properties, 6);
    EXPECT_EQ(utf8(converter.hashString("Installed Drive")), "Installed Drive");
    EXPECT_EQ(utf8(converter.substituteValues("Installed_Drive")), "Installed_Drive");
    EXPECT_EQ(utf8(converter.formatProperty("Size")), "Size");
}

}  // namespace
