// Whole files: what is read from good ones, and where exactly bad ones are refused.

#include "mifreader/MifReader.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using namespace Mif;

std::string refusal(const std::string& text, Tolerances tolerances = {}) {
    try {
        MifReader(tolerances).read(text);
    } catch (const Error& error) {
        return error.what();
    }
    return "accepted";
}

TEST(MifReaderTest, ReadsATemplateAndItsTable) {
    const Component component = MifReader().read(
        "Start Component\r\n"
        "   Name = \"Machine\"\r\n"
        "   Start Group\r\n"
        "      Name = \"Disk\"\r\n"
        "      Class = \"Maker|Disk|001\"\r\n"
        "      Key = 1\r\n"
        "      Start Attribute\r\n"
        "         Name = \"Model\"\r\n"
        "         Id = 3\r\n"
        "         Type = String(20)\r\n"
        "         Value = \"none\"\r\n"
        "      End Attribute\r\n"
        "      Start Attribute\r\n"
        "         Name = \"Index\"\r\n"
        "         Id = 1\r\n"
        "         Type = Integer\r\n"
        "      End Attribute\r\n"
        "   End Group\r\n"
        "   Start Table\r\n"
        "      Name = \"Disk\"\r\n"
        "      Class = \"Maker|Disk|001\"\r\n"
        "      Id = 7\r\n"
        "      { 1, \"a \" \"b\" }\r\n"
        "      { -2 }\r\n"
        "      { 3, }\r\n"
        "   End Table\r\n"
        "End Component\r\n");
    EXPECT_EQ(component.name, "Machine");
    ASSERT_EQ(component.groups.size(), 1U);
    const Group& group = component.groups[0];
    EXPECT_EQ(group.name, "Disk");
    EXPECT_EQ(group.className, "Maker|Disk|001");
    EXPECT_FALSE(group.id.has_value());
    EXPECT_EQ(group.key, std::vector<std::uint64_t>{1});
    ASSERT_EQ(group.attributes.size(), 2U);
    EXPECT_EQ(group.attributes[0].name, "Index");
    EXPECT_EQ(group.attributes[0].id, 1U);
    EXPECT_EQ(group.attributes[0].type, (Type{Type::Base::Integer, 0}));
    EXPECT_FALSE(group.attributes[0].value.has_value());
    EXPECT_EQ(group.attributes[1].name, "Model");
    EXPECT_EQ(group.attributes[1].id, 3U);
    EXPECT_EQ(group.attributes[1].type, (Type{Type::Base::String, 20}));
    EXPECT_EQ(group.attributes[1].value->text, "none");
    ASSERT_EQ(component.tables.size(), 1U);
    const Table& table = component.tables[0];
    EXPECT_EQ(table.name, "Disk");
    EXPECT_EQ(table.id, 7U);
    EXPECT_EQ(table.group, 0U);
    ASSERT_EQ(table.rows.size(), 3U);
    EXPECT_EQ(table.rows[0].at(group, 0).magnitude, 1U);
    EXPECT_EQ(table.rows[0].at(group, 1).text, "a b");
    EXPECT_EQ(table.rows[1].at(group, 0).magnitude, 2U);
    EXPECT_TRUE(table.rows[1].at(group, 0).negative);
    EXPECT_EQ(table.rows[1].at(group, 1).text, "none");
    EXPECT_EQ(table.rows[2].at(group, 1).text, "none");
}

TEST(MifReaderTest, ReadsPathsEnumsAndScalarGroups) {
    const Component component = MifReader().read(
        "Start Component Name = \"C\" Description = \"d\" Pragma = \"p\"\n"
        "Start Path Name = \"Agent\" Unix = \"/bin/agent\" WinNT = Direct-Interface End Path\n"
        "Start Enum Name = \"Answer\" Type = Integer 0 = \"No\" 0x1 = \"Yes\" -2 = \"?\" End Enum\n"
        "Start Group Name = \"G\" Class = \"M|G|1\" ID = 010 Description = \"gd\" Pragma = \"gp\"\n"
        "Start Attribute Name = \"A\" Id = 1 Type = INT Description = \"ad\" Access = Read-Write\n"
        "Storage = Common Value = * \"Agent\" Start Enum 5 = \"five\" End Enum End Attribute\n"
        "Start Attribute Name = \"B\" Id = 2 Type = OctetString(2) Value = unsupported\n"
        "End Attribute End Group End Component");
    EXPECT_EQ(component.description, "d");
    EXPECT_EQ(component.pragma, "p");
    ASSERT_EQ(component.paths.size(), 1U);
    EXPECT_EQ(component.paths[0].name, "Agent");
    ASSERT_EQ(component.paths[0].programs.size(), 2U);
    EXPECT_EQ(component.paths[0].programs[0].first, "unix");
    EXPECT_EQ(component.paths[0].programs[0].second, "/bin/agent");
    EXPECT_EQ(component.paths[0].programs[1].second, "direct-interface");
    ASSERT_EQ(component.enumerations.size(), 1U);
    EXPECT_EQ(component.enumerations[0].name, "Answer");
    ASSERT_EQ(component.enumerations[0].entries.size(), 3U);
    EXPECT_EQ(component.enumerations[0].entries[1].number, 1);
    EXPECT_EQ(component.enumerations[0].entries[1].text, "Yes");
    EXPECT_EQ(component.enumerations[0].entries[2].number, -2);
    const Group& group = component.groups.at(0);
    EXPECT_EQ(group.id, 8U);
    EXPECT_FALSE(group.isTemplate());
    EXPECT_EQ(group.description, "gd");
    EXPECT_EQ(group.pragma, "gp");
    const Attribute& attribute = group.attributes.at(0);
    EXPECT_EQ(attribute.description, "ad");
    EXPECT_EQ(attribute.access, "read-write");
    EXPECT_EQ(attribute.storage, "common");
    EXPECT_EQ(attribute.value->kind, Value::Kind::FromPath);
    EXPECT_EQ(attribute.value->text, "Agent");
    EXPECT_EQ(attribute.enumeration->entries.at(0).number, 5);
    EXPECT_EQ(group.attributes.at(1).value->kind, Value::Kind::Unsupported);
    EXPECT_EQ(group.attributes.at(1).access, "read-only");
}

/// A file and what the reader says to it; each line of the file counts from 1.
struct Refused {
    const char* text;
    const char* message;
};

class MifReaderRefusals : public ::testing::TestWithParam<Refused> {};

TEST_P(MifReaderRefusals, NamesThePlace) {
    EXPECT_EQ(refusal(GetParam().text), GetParam().message);
}

constexpr const char* kNoComponent = "1:1: expected 'start', found the end of the file";

INSTANTIATE_TEST_SUITE_P(
    Component, MifReaderRefusals,
    ::testing::Values(
        Refused{"", kNoComponent}, Refused{"End Component", "1:1: expected 'start', found 'end'"},
        Refused{"Start Group", "1:7: expected 'component', found 'group'"},
        Refused{"Start Component\nEnd Component", "1:1: Component without 'name'"},
        Refused{"Start Component\nName = \"a\"",
                "2:11: expected a statement, found the end of the file"},
        Refused{"Start Component\nName = \"a\"\nEnd Group",
                "3:5: expected 'component', found 'group'"},
        Refused{"Start Component\nName = \"a\"\nEnd Component\nStart Component",
                "4:1: nothing may follow the component"},
        Refused{"Start Component\nName = \"a\"\n  Name = \"b\"\nEnd Component",
                "3:3: second statement 'name' in this Component"},
        Refused{"Start Component\nClass = \"a\"\nEnd Component",
                "2:1: no statement of this Component: 'class'"},
        Refused{"Start Component\nName \"a\"\nEnd Component", "2:6: expected '=', found a literal"},
        Refused{"Start Component\nName = a\nEnd Component", "2:8: expected a literal, found 'a'"},
        Refused{"Start Component\nStart Attribute\nEnd Attribute\nEnd Component",
                "2:7: 'attribute' is no block of a Component"},
        Refused{"Start Component Name = \"a\"\nStart 5\nEnd Component",
                "2:7: 5 is no block of a Component"}));

INSTANTIATE_TEST_SUITE_P(
    PathAndEnum, MifReaderRefusals,
    ::testing::Values(
        Refused{"Start Component Name = \"a\"\nStart Path Unix = \"x\" End Path\nEnd Component",
                "2:1: Path without 'name'"},
        Refused{"Start Component Name = \"a\"\nStart Path Linux = \"x\" End Path\nEnd Component",
                "2:12: no statement of this Path: 'linux'"},
        Refused{"Start Component Name = \"a\"\nStart Path Name = \"x\" End Path\n"
                "Start Path Name = \"x\" End Path\nEnd Component",
                "3:1: second Path of this name"},
        Refused{"Start Component Name = \"a\"\nStart Path Name = \"x\" Unix = 5\nEnd Component",
                "2:30: expected a literal, found 5"},
        Refused{"Start Component Name = \"a\"\nStart Enum 1 = \"x\" End Enum\nEnd Component",
                "2:1: named Enum without 'name'"},
        Refused{"Start Component Name = \"a\"\nStart Enum Name = \"x\"\n1 = \"x\"\n01 = \"y\"\n"
                "End Enum\nEnd Component",
                "4:1: second statement '1' in this named Enum"},
        Refused{"Start Component Name = \"a\"\nStart Enum Type = Gauge End Enum\nEnd Component",
                "2:19: 'gauge' is not allowed here"},
        Refused{"Start Component Name = \"a\"\nStart Enum 2147483648 = \"x\" End Enum\n",
                "2:12: integer beyond the type Integer, 32 bits with sign"},
        Refused{"Start Component Name = \"a\"\nStart Enum Id = 1 End Enum\n",
                "2:12: no statement of this named Enum: 'id'"}));

/// A component with this on its lines 2 and on; the attribute on line 3 when it is `ok`.
std::string inGroup(const std::string& lines) {
    return "Start Component Name = \"a\"\n" + lines + "\nEnd Component\n";
}

const std::string kAttribute = "Start Attribute Name = \"A\" Id = 1 Type = Integer End Attribute";
const std::string kHead = "Start Group Name = \"g\" Class = \"c\" Key = 1\n";

struct RefusedLines {
    std::string lines;
    const char* message;
};

class MifReaderGroupRefusals : public ::testing::TestWithParam<RefusedLines> {};

TEST_P(MifReaderGroupRefusals, NamesThePlace) {
    EXPECT_EQ(refusal(inGroup(GetParam().lines)), GetParam().message);
}

INSTANTIATE_TEST_SUITE_P(
    Group, MifReaderGroupRefusals,
    ::testing::Values(
        RefusedLines{"Start Group Class = \"c\" Key = 1\n" + kAttribute + "\nEnd Group",
                     "2:1: Group without 'name'"},
        RefusedLines{"Start Group Name = \"g\" Key = 1\n" + kAttribute + "\nEnd Group",
                     "2:1: Group without 'class'"},
        RefusedLines{"Start Group Name = \"g\" Class = \"c\"\n" + kAttribute + "\nEnd Group",
                     "2:1: Group with neither 'id' nor 'key'"},
        RefusedLines{kHead + "End Group", "2:1: Group without attributes"},
        RefusedLines{
            "Start Group Name = \"g\" Class = \"c\" Key = 2\n" + kAttribute + "\nEnd Group",
            "2:42: no attribute of the group has the Id 2"},
        RefusedLines{
            "Start Group Name = \"g\" Class = \"c\" Key = 1,1\n" + kAttribute + "\nEnd Group",
            "2:44: the key names an attribute twice"},
        RefusedLines{"Start Group Name = \"g\" Class = \"c\" Id = 0\n",
                     "2:41: expected an Id of 1 or greater, found 0"},
        RefusedLines{"Start Group Name = \"g\" Class = \"c\" Id = -1\n",
                     "2:41: expected an Id of 1 or greater, found -1"},
        RefusedLines{"Start Group Name = \"g\" Class = \"c\" Type = 1\n",
                     "2:36: no statement of this Group: 'type'"},
        RefusedLines{kHead + "Start Table", "3:7: expected 'attribute', found 'table'"},
        RefusedLines{kHead + kAttribute +
                         "\nStart Attribute Name = \"B\" Id = 1 Type = Integer "
                         "End Attribute\nEnd Group",
                     "4:33: second attribute of this Id in the group"},
        RefusedLines{kHead + kAttribute +
                         "\nStart Attribute Name = \"A\" Id = 2 Type = Integer "
                         "End Attribute\nEnd Group",
                     "4:24: second attribute of this name in the group"},
        RefusedLines{"Start Group Name = \"g\" Class = \"c\" Id = 3\n" + kAttribute +
                         "\nEnd Group\nStart Group Name = \"h\" Class = \"d\" Id = 3\n" +
                         kAttribute + "\nEnd Group",
                     "5:41: second group or table of this Id"},
        RefusedLines{"Start Group Name = \"g\" Class = \"c\" Id = 3\n" + kAttribute +
                         "\nEnd Group\nStart Group Name = \"h\" Class = \"c\" Id = 4\n"
                         "Start Attribute Name = \"A\" Id = 1 Type = Gauge End Attribute\n"
                         "End Group",
                     "5:1: Group unlike the earlier one of its class"}));

INSTANTIATE_TEST_SUITE_P(
    Attribute, MifReaderGroupRefusals,
    ::testing::Values(
        RefusedLines{kHead + "Start Attribute Id = 1 Type = Integer End Attribute",
                     "3:1: Attribute without 'name'"},
        RefusedLines{kHead + "Start Attribute Name = \"A\" Type = Integer End Attribute",
                     "3:1: Attribute without 'id'"},
        RefusedLines{kHead + "Start Attribute Name = \"A\" Id = 1 End Attribute",
                     "3:1: Attribute without 'type'"},
        RefusedLines{kHead + "Start Attribute Name = \"A\" Id = 0",
                     "3:33: expected an Id of 1 or greater, found 0"},
        RefusedLines{kHead + "Start Attribute Type = Text", "3:24: 'text' is no type"},
        RefusedLines{kHead + "Start Attribute Type = String", "4:1: expected '(', found 'end'"},
        RefusedLines{kHead + "Start Attribute Type = String(0)",
                     "3:31: expected a length of 1 or greater, found 0"},
        RefusedLines{kHead + "Start Attribute Type = String(-1)",
                     "3:31: expected a length of 1 or greater, found -1"},
        RefusedLines{kHead + "Start Attribute Type = String(8", "4:1: expected ')', found 'end'"},
        RefusedLines{kHead + "Start Attribute Type = Integer(8)",
                     "3:31: expected a statement, found '('"},
        RefusedLines{kHead + "Start Attribute Access = Common",
                     "3:26: 'common' is not allowed here"},
        RefusedLines{kHead + "Start Attribute Storage = 5", "3:27: 5 is not allowed here"},
        RefusedLines{kHead + "Start Attribute Key = 1",
                     "3:17: no statement of this Attribute: 'key'"},
        RefusedLines{kHead + "Start Attribute Value = none",
                     "3:25: expected a value, found 'none'"},
        RefusedLines{kHead + "Start Attribute Value = * \"P\"",
                     "3:27: no Path of this name before"},
        RefusedLines{kHead + "Start Attribute Start Enum End Enum Start Enum End Enum",
                     "3:37: second Enum in this Attribute"},
        RefusedLines{kHead + "Start Attribute Start Enum Name = \"e\" End Enum",
                     "3:28: no statement of this Enum of an attribute: 'name'"},
        RefusedLines{
            kHead +
                "Start Attribute Name = \"A\" Id = 1 Value = \"x\" Type = Integer End Attribute",
            "3:43: literal where the type is an integer"}));

/// A template of an Integer without default, a String(2) with one, and an Integer with one.
const std::string kTemplate =
    "Start Group Name = \"g\" Class = \"c\" Key = 1\n"
    "Start Attribute Name = \"A\" Id = 1 Type = Integer End Attribute\n"
    "Start Attribute Name = \"B\" Id = 2 Type = String(2) Value = \"\" End Attribute\n"
    "Start Attribute Name = \"C\" Id = 3 Type = Integer Value = 9 End Attribute\n"
    "End Group\n";

INSTANTIATE_TEST_SUITE_P(
    Table, MifReaderGroupRefusals,
    ::testing::Values(
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 1 Class = \"c\"\n{}\nEnd Table",
                     "8:2: no value, and no default, for the attribute 1"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 1 Class = \"c\"\n{ , \"x\"}",
                     "8:3: no value, and no default, for the attribute 1"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 1 Class = \"c\"\n{1,\"x\",2,3}",
                     "8:10: row of more values than the 3 attributes of its group"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 1 Class = \"c\"\n{1,\"x\",2,}",
                     "8:10: row of more values than the 3 attributes of its group"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 1 Class = \"c\"\n{1,\"x\",\"2\"}",
                     "8:8: literal where the type is an integer"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 1 Class = \"c\"\n{1,2}",
                     "8:4: integer where the type is a string"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 1 Class = \"c\"\n{1,\"xyz\"}",
                     "8:4: literal of 3 octets where the type allows 2"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 1 Class = \"c\"\n{1 2}",
                     "8:4: expected '}', found 2"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 1 Class = \"d\"",
                     "7:39: no group of this class before"},
        RefusedLines{kTemplate + "Start Table Name = \"t\"\n{1}",
                     "8:1: row before the table's class"},
        RefusedLines{kTemplate + "Start Table Id = 1 Class = \"c\" End Table",
                     "7:1: Table without 'name'"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Class = \"c\" End Table",
                     "7:1: Table without 'id'"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 1 End Table",
                     "7:1: Table without 'class'"},
        RefusedLines{kTemplate + "Start Table Name = \"t\" Id = 4 Class = \"c\" End Table\n"
                                 "Start Table Name = \"u\" Id = 4 Class = \"c\" End Table",
                     "8:29: second group or table of this Id"},
        RefusedLines{kTemplate + "Start Table Key = 1", "7:13: no statement of this Table: 'key'"},
        RefusedLines{"Start Group Name = \"g\" Class = \"c\" Id = 1\n" + kAttribute +
                         "\nEnd Group\nStart Table Name = \"t\" Id = 2 Class = \"c\"",
                     "5:39: the group of this class is no template"}));

TEST(MifReaderTest, AcceptsWhatTheGroupRefusalsAreBuiltFrom) {
    EXPECT_EQ(refusal(inGroup(kHead + kAttribute + "\nEnd Group")), "accepted");
    EXPECT_EQ(
        refusal(inGroup(kTemplate + "Start Table Name = \"t\" Id = 1 Class = \"c\"\n{1,\"x\",2}\n"
                                    "{1}\n{1,}\n{1,,}\n{1,,2}\nEnd Table")),
        "accepted");
}

TEST(MifReaderTest, AcceptsGroupsOfOneClassThatAreAlike) {
    const std::string group = "Class = \"c\" Key = 1\n" + kAttribute + "\nEnd Group\n";
    EXPECT_EQ(refusal(inGroup("Start Group Name = \"g\" ID = 2 " + group +
                              "Start Group Name = \"g\" ID = 3 " + group)),
              "accepted");
}

TEST(MifReaderTest, AcceptsRepeatedNamesWhenTold) {
    const std::string text =
        inGroup(kHead + kAttribute +
                "\nStart Attribute Name = \"A\" Id = 2 Type = Integer End Attribute\nEnd Group");
    EXPECT_EQ(refusal(text, {Tolerance::RepeatedNames}), "accepted");
}

TEST(MifReaderTest, ReadsManyAttributesAndShortRowsInLinearTime) {
    std::string text = "Start Component Name = \"a\"\n" + kHead;
    for (int i = 20000; i > 0; --i) {
        const std::string id = std::to_string(i);
        text += "Start Attribute Name = \"A" + id + "\" Id = " + id +
                " Type = Integer Value = 1 End Attribute\n";
    }
    text += "End Group\nStart Table Name = \"t\" Id = 1 Class = \"c\"\n";
    for (int i = 0; i < 100000; ++i) {
        text += "{}\n";
    }
    const Component component = MifReader().read(text + "End Table\nEnd Component\n");
    EXPECT_EQ(component.groups.at(0).attributes.at(19999).name, "A20000");
    EXPECT_EQ(component.tables.at(0).rows.size(), 100000U);
}

TEST(MifReaderTest, RefusesMoreValuesThanItHolds) {
    const std::string start = "Start Component Name = \"a\"\n" + kHead + kAttribute +
                              "\nEnd Group\nStart Table Name = \"t\" Id = 1 Class = \"c\"\n";
    std::string commas(4194304, ',');
    EXPECT_EQ(refusal(start + "{" + commas), "6:4194306: more than 4194304 values in rows");
}

}  // namespace
