// The MIF document: component, group template, table, rows, and the numbering of all of them.

#include "SennetConverter/mif/SennetConverter.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "ConverterFixture.h"
#include "MifFixture.h"

namespace {

using namespace Pegasus;
using namespace generatortest;

constexpr const char* kFanScript = "[DEFAULT]\ntitle=Fan Data\n[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n";

/// An attribute as it stands in a group.
std::string attribute(const std::string& name, int id, const std::string& type,
                      const std::string& value) {
    return "\n      Start Attribute\n         Name = \"" + name +
           "\"\n         Id = " + std::to_string(id) + "\n         Type = " + type +
           "\n         Value = " + value + "\n      End Attribute\n";
}

/// The head of a group in the base dialect.
std::string groupHead(const std::string& name, const std::string& title) {
    return "\n   Start Group\n      Name = \"" + name +
           "\"\n      Class = \"Corvane-Velt|KWX MIF " + title +
           "|001\"\n      Key = 1\n      Start Attribute\n         Name = \"Index\"\n"
           "         Id = 1\n         Type = String(5)\n         Value = 1\n"
           "      End Attribute\n";
}

const std::string kComponent = "Start Component\n   Name = \"KW Services Inventory\"\n";

/// A table of the base dialect; each row without its outer blanks.
std::string table(const std::string& name, const std::string& title, int id,
                  const std::vector<std::string>& rows) {
    std::string result = "   End Group\n\n   Start Table\n      Name = \"" + name +
                         "\"\n      Class = \"Corvane-Velt|KWX MIF " + title +
                         "|001\"\n      Id = " + std::to_string(id) + "\n";
    for (const std::string& row : rows) {
        result += "      " + row + "\n";
    }
    return result + "\n   End Table\n";
}

const std::string kEnd = "End Component\n";

CIMInstance fan(const char* name) {
    return cimInstance("CIM_Fan", {property("Name", text(name))});
}

class SennetConverterTest : public MifFixture {
  protected:
    SennetConverterTest()
        : MifFixture({Mif::Tolerance::RawLineEnds, Mif::Tolerance::IntegersAsText}) {}

    std::string mif(const std::string& scriptText, const std::vector<Answer>& answers) {
        return convert<SennetConverter>(scriptText, answers);
    }
    /// The script of one class CIM_X with this property list, titled T.
    std::string scriptOf(const std::string& list) {
        return "[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=" + list + "\n";
    }
    /// Everything of a group and table titled T.
    std::string document(const std::string& attributes, const std::vector<std::string>& rows) {
        return crlf(kComponent + groupHead("T", "T") + attributes + table("T", "T", 2, rows) +
                    kEnd);
    }

    const CIMClass fanClass =
        cimClass("CIM_Fan", {property("Name", null(CIMTYPE_STRING), {maxLen(64)})});
};

TEST_F(SennetConverterTest, WritesOneInstanceToTheByte) {
    const CIMClass cpuClass =
        cimClass("CIM_Processor", {property("DeviceID", null(CIMTYPE_STRING), {maxLen(64)}),
                                   property("MaxClockSpeed", null(CIMTYPE_UINT32))});
    const CIMInstance cpu = cimInstance(
        "CIM_Processor",
        {property("DeviceID", text("CPU0")), property("MaxClockSpeed", CIMValue(Uint32(2400)))});
    EXPECT_EQ(mif("[DEFAULT]\ntitle=Processor Inventory\n[CIM]\nG[0]=CIM_Processor\n"
                  "A[0]=DeviceID, MaxClockSpeed\n",
                  {{cpuClass, {cpu}}}),
              "Start Component\r\n"
              "   Name = \"KW Services Inventory\"\r\n"
              "\r\n"
              "   Start Group\r\n"
              "      Name = \"Processor_Inventory\"\r\n"
              "      Class = \"Corvane-Velt|KWX MIF Processor Inventory|001\"\r\n"
              "      Key = 1\r\n"
              "      Start Attribute\r\n"
              "         Name = \"Index\"\r\n"
              "         Id = 1\r\n"
              "         Type = String(5)\r\n"
              "         Value = 1\r\n"
              "      End Attribute\r\n"
              "\r\n"
              "      Start Attribute\r\n"
              "         Name = \"DeviceID\"\r\n"
              "         Id = 2\r\n"
              "         Type = String(64)\r\n"
              "         Value = \"CPU0\"\r\n"
              "      End Attribute\r\n"
              "\r\n"
              "      Start Attribute\r\n"
              "         Name = \"MaxClockSpeed\"\r\n"
              "         Id = 3\r\n"
              "         Type = Integer\r\n"
              "         Value = 2400\r\n"
              "      End Attribute\r\n"
              "   End Group\r\n"
              "\r\n"
              "   Start Table\r\n"
              "      Name = \"Processor_Inventory\"\r\n"
              "      Class = \"Corvane-Velt|KWX MIF Processor Inventory|001\"\r\n"
              "      Id = 2\r\n"
              "      { 1, \"CPU0\",2400}\r\n"
              "\r\n"
              "   End Table\r\n"
              "End Component\r\n");
}

TEST_F(SennetConverterTest, WritesNothingWithoutInstances) {
    support::writeFile(path("out.mif"), "stale");
    Inventory inventory({{fanClass, {}}});
    {
        SennetConverter converter(outputName(), properties, 30);
        converter.printOutput(script(kFanScript), inventory.classes, inventory.lists);
        EXPECT_EQ(support::readFile(path("out.mif")), "stale");
    }
    EXPECT_FALSE(outputExists());
}

TEST_F(SennetConverterTest, WritesNothingWithoutClasses) {
    Inventory inventory({});
    Inventory other({{fanClass, {fan("A")}}});
    {
        SennetConverter converter(outputName(), properties, 30);
        converter.printOutput(script(kFanScript), inventory.classes, inventory.lists);
        converter.printOutput(script(kFanScript), inventory.classes, other.lists);
    }
    EXPECT_FALSE(outputExists());
}

TEST_F(SennetConverterTest, MakesATemplateOfSeveralInstances) {
    tolerate({Mif::Tolerance::EmptyDates});
    const CIMClass described = cimClass(
        "CIM_X",
        {property("Text", null(CIMTYPE_STRING)), property("Number", null(CIMTYPE_UINT32)),
         property("Mapped", null(CIMTYPE_UINT16), {textsQualifier("Values", {"Zero", "One"})}),
         property("List", nullArray(CIMTYPE_UINT16)), property("Flag", null(CIMTYPE_BOOLEAN)),
         property("When", null(CIMTYPE_DATETIME))});
    const auto instance = [](const char* name, Uint32 number) {
        return cimInstance(
            "CIM_X",
            {property("Text", text(name)), property("Number", CIMValue(number)),
             property("Mapped", CIMValue(Uint16(1))),
             property("List", CIMValue(arrayOf<Uint16>({4, 5}))), property("Flag", CIMValue(true)),
             property("When", CIMValue(CIMDateTime("20061231235959.000000+060")))});
    };
    EXPECT_EQ(
        mif(scriptOf("Text Number Mapped List Flag When"),
            {{described, {instance("a", 7), instance("b", 8)}}}),
        document(
            attribute("Text", 2, "String(255)", "\"\"") + attribute("Number", 3, "Integer", "0") +
                attribute("Mapped", 4, "String(255)", "\"\"") +
                attribute("List", 5, "String(255)", "\"\"") +
                attribute("Flag", 6, "String(32)", "\"\"") + attribute("When", 7, "Date", "\"\""),
            {"{ 1, \"a\",7,\"One\",\"4,5\",\"true\",\"20061231235959.000000+060\"}",
             "{ 2, \"b\",8,\"One\",\"4,5\",\"true\",\"20061231235959.000000+060\"}"}));
}

TEST_F(SennetConverterTest, BlanksEveryClassWhenOneHasSeveralInstances) {
    const CIMClass second =
        cimClass("CIM_Y", {property("Count", null(CIMTYPE_UINT8)),
                           property("Label", null(CIMTYPE_STRING), {maxLen(16)})});
    const CIMInstance lone = cimInstance(
        "CIM_Y", {property("Count", CIMValue(Uint8(3))), property("Label", text("only"))});
    EXPECT_EQ(mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Y\nA[0]=Count,Label\n"
                  "G[1]=CIM_Fan\nA[1]=Name\n",
                  {{second, {lone}}, {fanClass, {fan("a"), fan("b")}}}),
              document(attribute("Count", 2, "Integer", "0") +
                           attribute("Label", 3, "String(16)", "\"\"") +
                           attribute("Name", 4, "String(64)", "\"\""),
                       {"{ 1, 3,\"only\",\"a\"}", "{ 2, ,,\"b\"}"}));
}

TEST_F(SennetConverterTest, FillsRowsOfDifferentlyLongLists) {
    const CIMClass second =
        cimClass("CIM_Y", {property("P", null(CIMTYPE_UINT8)), property("Q", null(CIMTYPE_UINT8)),
                           property("R", null(CIMTYPE_UINT8))});
    const CIMClass third = cimClass("CIM_Z", {property("S", null(CIMTYPE_UINT8))});
    const CIMInstance y =
        cimInstance("CIM_Y", {property("P", CIMValue(Uint8(1))), property("Q", CIMValue(Uint8(2))),
                              property("R", CIMValue(Uint8(3)))});
    const auto z = [](Uint8 s) { return cimInstance("CIM_Z", {property("S", CIMValue(s))}); };
    EXPECT_EQ(
        mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n"
            "G[1]=CIM_Y\nA[1]=P Q R\nG[2]=CIM_Z\nA[2]=S\n",
            {{fanClass, {fan("a"), fan("b"), fan("c")}}, {second, {y}}, {third, {z(8), z(9)}}}),
        document(attribute("Name", 2, "String(64)", "\"\"") + attribute("P", 3, "Integer", "0") +
                     attribute("Q", 4, "Integer", "0") + attribute("R", 5, "Integer", "0") +
                     attribute("S", 6, "Integer", "0"),
                 {"{ 1, \"a\",1,2,3,8}", "{ 2, \"b\",,,,9}", "{ 3, \"c\",,,,}"}));
}

TEST_F(SennetConverterTest, WritesAsManyRowsAsTheLongestList) {
    const CIMClass second = cimClass("CIM_Y", {property("P", null(CIMTYPE_UINT8))});
    const auto y = [](Uint8 p) { return cimInstance("CIM_Y", {property("P", CIMValue(p))}); };
    EXPECT_EQ(
        mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Fan\nA[0]=Name\nG[1]=CIM_Y\nA[1]=P\n",
            {{fanClass, {fan("a")}}, {second, {y(1), y(2), y(3)}}}),
        document(attribute("Name", 2, "String(64)", "\"\"") + attribute("P", 3, "Integer", "0"),
                 {"{ 1, \"a\",1}", "{ 2, ,2}", "{ 3, ,3}"}));
}

TEST_F(SennetConverterTest, PairsTheClassWithTheListAtItsPlace) {
    // The first class returned no instance, so the only list stands at its place: its cells are
    // looked up in the second class's instances, and the second class has none left.
    const CIMClass first = cimClass(
        "CIM_A", {property("Name", text("default")), property("Only", CIMValue(Uint8(4)))});
    const CIMClass second = cimClass("CIM_B", {property("Name", text("none"))});
    const CIMInstance b = cimInstance("CIM_B", {property("Name", text("from b"))});
    EXPECT_EQ(mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_A\nA[0]=Name,Only\n"
                  "G[1]=CIM_B\nA[1]=Name\n",
                  {{first, {}}, {second, {b}}}),
              document(attribute("Name", 2, "String(255)", "\"from b\"") +
                           attribute("Only", 3, "Integer", "4") +
                           attribute("Name4", 4, "String(255)", "\"none\""),
                       {"{ 1, \"from b\",4,}"}));
}

TEST_F(SennetConverterTest, LooksPropertyNamesUpByTheClassNameOfTheServer) {
    // Slot 0 was refused by the server: class 0 is slot 1, in the server's own spelling.
    EXPECT_EQ(mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Gone\nA[0]=Lost\nG[1]=cim_FAN\nA[1]=Name\n",
                  {{fanClass, {fan("a")}}}),
              document(attribute("Name", 2, "String(64)", "\"a\""), {"{ 1, \"a\"}"}));
}

TEST_F(SennetConverterTest, GivesAClassNamedTwiceThePropertiesOfItsFirstSlot) {
    EXPECT_EQ(mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Fan\nA[0]=Name\nG[1]=CIM_Fan\nA[1]=Lost\n",
                  {{fanClass, {fan("a")}}, {fanClass, {fan("b")}}}),
              document(attribute("Name", 2, "String(64)", "\"a\"") +
                           attribute("Name3", 3, "String(64)", "\"b\""),
                       {"{ 1, \"a\",\"b\"}"}));
}

TEST_F(SennetConverterTest, WritesNoPropertiesOfAClassThatTheScriptDoesNotName) {
    // The class has its place in the rows all the same.
    expectUnreadable("20:12: row of more values than the 1 attributes of its group");
    EXPECT_EQ(
        mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Other\nA[0]=Name\n", {{fanClass, {fan("a")}}}),
        document("", {"{ 1, }"}));
}

TEST_F(SennetConverterTest, SkipsAClassWithoutPropertyNames) {
    // Its place in the rows stays, one value more than the group has attributes.
    expectUnreadable("27:13: row of more values than the 2 attributes of its group");
    const CIMClass bare = cimClass("CIM_Y", {property("P", null(CIMTYPE_UINT8))});
    const CIMInstance y = cimInstance("CIM_Y", {property("P", CIMValue(Uint8(1)))});
    EXPECT_EQ(
        mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Y\nG[1]=CIM_Fan\nA[1]=Name\n",
            {{bare, {y}}, {fanClass, {fan("a"), fan("b")}}}),
        document(attribute("Name", 2, "String(64)", "\"\""), {"{ 1, ,\"a\"}", "{ 2, ,\"b\"}"}));
    expectUnreadable("20:12: row of more values than the 1 attributes of its group");
    EXPECT_EQ(mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Y\nA[0]=,\n", {{bare, {y}}}),
              document("", {"{ 1, }"}));
}

TEST_F(SennetConverterTest, TakesWhatTheInstanceLacksFromTheClass) {
    const CIMClass described = cimClass(
        "CIM_X",
        {property("Default", CIMValue(Uint16(1)), {textsQualifier("Values", {"No", "Yes"})}),
         property("List", CIMValue(strings({"x", "y"})))});
    const CIMInstance empty = cimInstance("CIM_X", {});
    EXPECT_EQ(mif(scriptOf("Default,List"), {{described, {empty}}}),
              document(attribute("Default", 2, "String(255)", "\"Yes\"") +
                           attribute("List", 3, "String(255)", "\"x,y\""),
                       {"{ 1, \"Yes\",\"x,y\"}"}));
}

TEST_F(SennetConverterTest, WritesAnUnknownPropertyAsANullString) {
    EXPECT_EQ(mif(scriptOf("Missing"), {{cimClass("CIM_X", {}), {cimInstance("CIM_X", {})}}}),
              document(attribute("Missing", 2, "String(255)", "\"\""), {"{ 1, \"\"}"}));
}

TEST_F(SennetConverterTest, BlanksAnUnknownPropertyAsText) {
    const CIMInstance empty = cimInstance("CIM_X", {});
    EXPECT_EQ(
        mif(scriptOf("Missing"), {{cimClass("CIM_X", {}), {empty, empty}}}),
        document(attribute("Missing", 2, "String(255)", "\"\""), {"{ 1, \"\"}", "{ 2, \"\"}"}));
}

TEST_F(SennetConverterTest, TakesQualifiersFromTheClass) {
    const CIMClass described = cimClass(
        "CIM_X",
        {property("P", null(CIMTYPE_UINT16), {textsQualifier("Values", {"Class 0", "Class 1"})})});
    const CIMInstance instance =
        cimInstance("CIM_X", {property("P", CIMValue(Uint16(1)),
                                       {textsQualifier("Values", {"Instance 0", "Instance 1"})})});
    EXPECT_EQ(mif(scriptOf("P"), {{described, {instance}}}),
              document(attribute("P", 2, "String(255)", "\"Class 1\""), {"{ 1, \"Class 1\"}"}));
}

TEST_F(SennetConverterTest, KeepsTheQualifiersOfAPropertyThatOnlyTheInstanceHas) {
    tolerate({Mif::Tolerance::TextAsIntegers});
    const CIMInstance instance = cimInstance(
        "CIM_X", {property("P", CIMValue(Uint16(1)), {textsQualifier("Values", {"Zero", "One"})})});
    EXPECT_EQ(mif(scriptOf("P"), {{cimClass("CIM_X", {}), {instance}}}),
              document(attribute("P", 2, "Integer", "\"One\""), {"{ 1, \"One\"}"}));
}

TEST_F(SennetConverterTest, BlanksAnEnumeratedPropertyThatOnlyTheInstanceHas) {
    tolerate({Mif::Tolerance::TextAsIntegers});
    const CIMInstance instance = cimInstance(
        "CIM_X", {property("P", CIMValue(Uint16(1)), {textsQualifier("Values", {"Zero", "One"})})});
    EXPECT_EQ(mif(scriptOf("P"), {{cimClass("CIM_X", {}), {instance, instance}}}),
              document(attribute("P", 2, "Integer", "\"\""), {"{ 1, \"One\"}", "{ 2, \"One\"}"}));
}

TEST_F(SennetConverterTest, TakesTheTypeFromTheInstance) {
    const CIMClass described = cimClass("CIM_X", {property("P", null(CIMTYPE_UINT16))});
    const CIMInstance instance = cimInstance("CIM_X", {property("P", text("seven"))});
    EXPECT_EQ(mif(scriptOf("P"), {{described, {instance}}}),
              document(attribute("P", 2, "String(20)", "\"seven\""), {"{ 1, \"seven\"}"}));
}

TEST_F(SennetConverterTest, FindsPropertiesIgnoringCase) {
    EXPECT_EQ(mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Fan\nA[0]=nAME\n", {{fanClass, {fan("a")}}}),
              document(attribute("nAME", 2, "String(64)", "\"a\""), {"{ 1, \"a\"}"}));
}

TEST_F(SennetConverterTest, AppendsTheIdToARepeatedName) {
    properties.set("CIM_X.B", "Name");
    properties.set("CIM_X.C", "Name");
    properties.set("CIM_X.D", "name");
    properties.set("CIM_X.E", "Name3");
    const CIMInstance empty = cimInstance("CIM_X", {});
    EXPECT_EQ(mif(scriptOf("Name,B,C,D,E"), {{cimClass("CIM_X", {}), {empty}}}),
              document(attribute("Name", 2, "String(255)", "\"\"") +
                           attribute("Name3", 3, "String(255)", "\"\"") +
                           attribute("Name4", 4, "String(255)", "\"\"") +
                           attribute("name", 5, "String(255)", "\"\"") +
                           attribute("Name36", 6, "String(255)", "\"\""),
                       {"{ 1, \"\",\"\",\"\",\"\",\"\"}"}));
}

TEST_F(SennetConverterTest, DoesNotCompareAnExtendedNameAgain) {
    tolerate({Mif::Tolerance::RepeatedNames});
    properties.set("CIM_X.A", "Name4");
    properties.set("CIM_X.C", "Name");
    const CIMInstance empty = cimInstance("CIM_X", {});
    EXPECT_EQ(mif(scriptOf("A,Name,C"), {{cimClass("CIM_X", {}), {empty}}}),
              document(attribute("Name4", 2, "String(255)", "\"\"") +
                           attribute("Name", 3, "String(255)", "\"\"") +
                           attribute("Name4", 4, "String(255)", "\"\""),
                       {"{ 1, \"\",\"\",\"\"}"}));
}

TEST_F(SennetConverterTest, NumbersAttributesAcrossClassesAndSeesRepeatedNamesThere) {
    const CIMClass second =
        cimClass("CIM_Y", {property("Name", null(CIMTYPE_STRING), {maxLen(8)})});
    const CIMInstance y = cimInstance("CIM_Y", {property("Name", text("y"))});
    EXPECT_EQ(mif("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Fan\nA[0]=Name\nG[1]=CIM_Y\nA[1]=Name\n",
                  {{fanClass, {fan("x")}}, {second, {y}}}),
              document(attribute("Name", 2, "String(64)", "\"x\"") +
                           attribute("Name3", 3, "String(8)", "\"y\""),
                       {"{ 1, \"x\",\"y\"}"}));
}

TEST_F(SennetConverterTest, TranslatesTitleAndNames) {
    properties.set("title.Fan_Data", "  Cooling devices \t");
    properties.set("CIM_Fan.Name", " Device name\r\n");
    EXPECT_EQ(mif(kFanScript, {{fanClass, {fan("a")}}}),
              crlf(kComponent + groupHead("Cooling devices", "Fan Data") +
                   attribute("Device name", 2, "String(64)", "\"a\"") +
                   table("Cooling devices", "Fan Data", 2, {"{ 1, \"a\"}"}) + kEnd));
}

TEST_F(SennetConverterTest, NumbersTablesThroughTheWholeFile) {
    Inventory none({{fanClass, {}}});
    Inventory one({{fanClass, {fan("a")}}});
    Inventory two({{fanClass, {fan("b"), fan("c")}}});
    {
        SennetConverter converter(outputName(), properties, 30);
        converter.printOutput(script(kFanScript, "none"), none.classes, none.lists);
        converter.printOutput(script(kFanScript, "one"), one.classes, one.lists);
        converter.printOutput(script(kFanScript, "again"), none.classes, none.lists);
        converter.printOutput(script("[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n", "two"), two.classes,
                              two.lists);
    }
    EXPECT_EQ(output(), crlf(kComponent + groupHead("Fan_Data", "Fan Data") +
                             attribute("Name", 2, "String(64)", "\"a\"") +
                             table("Fan_Data", "Fan Data", 2, {"{ 1, \"a\"}"}) +
                             groupHead("two", "two") + attribute("Name", 2, "String(64)", "\"\"") +
                             table("two", "two", 3, {"{ 1, \"b\"}", "{ 2, \"c\"}"}) + kEnd));
}

TEST_F(SennetConverterTest, WritesTheComponentAgainAfterAnAbandonedFirstGroup) {
    expectUnreadable("14:7: expected 'attribute', found 'component'");
    Inventory one({{fanClass, {fan("a")}}});
    {
        SennetConverter converter(outputName(), properties, 30);
        CimScriptParser& faulty =
            script("[DEFAULT]\ntitle=Bad\n[CIM]\nG[0]=CIM_Fan\nA[0]=Name,\n", "bad");
        EXPECT_THROW(converter.printOutput(faulty, one.classes, one.lists), InvalidNameException);
        converter.printOutput(script(kFanScript, "good"), one.classes, one.lists);
    }
    EXPECT_EQ(output(),
              crlf(kComponent + groupHead("Bad", "Bad") + kComponent +
                   groupHead("Fan_Data", "Fan Data") + attribute("Name", 2, "String(64)", "\"a\"") +
                   table("Fan_Data", "Fan Data", 2, {"{ 1, \"a\"}"}) + kEnd));
}

TEST_F(SennetConverterTest, WritesTheClassesBeforeAFaultyOne) {
    expectUnreadable("21:5: expected 'group', found 'component'");
    const CIMClass second = cimClass("CIM_Y", {});
    Inventory inventory({{fanClass, {fan("a")}}, {second, {cimInstance("CIM_Y", {})}}});
    {
        SennetConverter converter(outputName(), properties, 30);
        CimScriptParser& faulty =
            script("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_Fan\nA[0]=Name\nG[1]=CIM_Y\nA[1]=1st\n");
        EXPECT_THROW(converter.printOutput(faulty, inventory.classes, inventory.lists),
                     InvalidNameException);
    }
    EXPECT_EQ(output(), crlf(kComponent + groupHead("T", "T") +
                             attribute("Name", 2, "String(64)", "\"a\"") + kEnd));
}

TEST_F(SennetConverterTest, GivesAGroupHeaderForAnyInstance) {
    SennetConverter converter(outputName(), properties, 30);
    CimScriptParser& parser = script(kFanScript);
    EXPECT_EQ(utf8(converter.mifClassHeader(parser, 0)),
              crlf(kComponent + groupHead("Fan_Data", "Fan Data")));
    std::string later = crlf(groupHead("Fan_Data", "Fan Data"));
    later.replace(later.find("Value = 1"), 9, "Value = 12");
    EXPECT_EQ(utf8(converter.mifClassHeader(parser, 11)), later);
}

TEST_F(SennetConverterTest, PrintsNoClassWithoutInstances) {
    Inventory none({{fanClass, {}}});
    SennetConverter converter(outputName(), properties, 30);
    converter.openFileIfNeeded();
    converter.printClass(script(kFanScript), none.classes, none.lists, 0);
    converter.closeFile();
    EXPECT_FALSE(outputExists());
}

TEST_F(SennetConverterTest, DoesNotReadThePropertiesWhenDestroyed) {
    auto ownProperties = std::make_unique<Velm::Properties>();
    Inventory one({{fanClass, {fan("a")}}});
    {
        SennetConverter converter(outputName(), *ownProperties, 30);
        converter.printOutput(script(kFanScript), one.classes, one.lists);
        ownProperties.reset();
    }
    EXPECT_EQ(output(), crlf(kComponent + groupHead("Fan_Data", "Fan Data") +
                             attribute("Name", 2, "String(64)", "\"a\"") +
                             table("Fan_Data", "Fan Data", 2, {"{ 1, \"a\"}"}) + kEnd));
}

TEST_F(SennetConverterTest, LeavesNamesUnformatted) {
    SennetConverter converter(outputName(), properties, 4);
    EXPECT_EQ(utf8(converter.formatProperty("Size (MB)")), "Size (MB)");
}

}  // namespace
