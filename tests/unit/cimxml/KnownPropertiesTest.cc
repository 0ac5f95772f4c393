// What is remembered of the properties of a class, and that it stays bounded.

#include "xml/KnownProperties.h"

#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace Pegasus {
namespace {

PropertyDeclaration declared(const std::string& name, CIMType type = CIMTYPE_STRING) {
    PropertyDeclaration declaration;
    declaration.name = CIMName(name.c_str());
    declaration.type = type;
    return declaration;
}

std::string spelled(const std::string& name, const std::string& value) {
    return "<P N=\"" + name + "\"><VALUE>" + value + "</VALUE></P>";
}

// The names in the order that is expected of the next instance.
std::vector<std::string> namesIn(const KnownProperties& known) {
    std::vector<std::string> names;
    for (std::size_t i = 0; i < known.size(); ++i) {
        names.emplace_back(known.declaration(known.at(i).id).name.getString().getCString());
    }
    return names;
}

using Names = std::vector<std::string>;

TEST(KnownProperties, KeepTheOrderOfTheServer) {
    KnownProperties known;
    EXPECT_EQ(known.note(declared("A"), 0, spelled("A", "1"), false), 0U);
    EXPECT_EQ(known.note(declared("C"), 1, spelled("C", "1"), false), 1U);
    EXPECT_EQ(known.note(declared("B"), 1, spelled("B", "1"), false), 1U);
    EXPECT_EQ(namesIn(known), (Names{"A", "B", "C"}));
    EXPECT_EQ(known.note(declared("A"), 2, spelled("A", "1"), false), 0U);
    EXPECT_EQ(namesIn(known), (Names{"A", "B", "C"}));
}

TEST(KnownProperties, KnowTheMarkupWithAndWithoutAValue) {
    KnownProperties known;
    known.note(declared("A"), 0, spelled("A", "1"), false);
    ASSERT_TRUE(known.at(0).withValue);
    EXPECT_EQ(known.at(0).withValue->before, "<P N=\"A\"><VALUE>");
    EXPECT_FALSE(known.at(0).withoutValue);
    known.note(declared("A"), 0, "<P N=\"A\"/>", true);
    ASSERT_TRUE(known.at(0).withoutValue);
    EXPECT_EQ(known.at(0).withoutValue->before, "<P N=\"A\"/>");
    EXPECT_TRUE(known.at(0).withValue);
}

TEST(KnownProperties, KnowNoMarkupWhereItsOctetsAreNotAtHand) {
    KnownProperties known;
    EXPECT_EQ(known.note(declared("A"), 0, "", false), 0U);
    EXPECT_EQ(known.note(declared("A"), 0, "", true), 0U);
    EXPECT_FALSE(known.at(0).withValue);
    EXPECT_FALSE(known.at(0).withoutValue);
}

TEST(KnownProperties, DoNotForgetWhatStandsBetweenValues) {
    KnownProperties known;
    known.note(declared("A"), 0, "<P><VALUE>1</VALUE> <VALUE>2</VALUE></P>", false);
    known.note(declared("A"), 0, "<P><VALUE>1</VALUE></P>", false);
    EXPECT_EQ(known.at(0).withValue->between, "</VALUE> <VALUE>");
    known.note(declared("A"), 0, "<Q><VALUE>1</VALUE></Q>", false);
    EXPECT_EQ(known.at(0).withValue->between, "");
}

TEST(KnownProperties, ForgetTheMarkupOfAnotherDeclaration) {
    KnownProperties known;
    known.note(declared("A"), 0, spelled("A", "1"), false);
    known.note(declared("A"), 0, "<P N=\"A\"/>", true);
    const Uint32 id = known.at(0).id;
    known.note(declared("A", CIMTYPE_UINT8), 0, "", false);
    EXPECT_NE(known.at(0).id, id);
    EXPECT_EQ(known.declaration(known.at(0).id).type, CIMTYPE_UINT8);
    EXPECT_EQ(known.declaration(id).type, CIMTYPE_STRING);
    EXPECT_FALSE(known.at(0).withValue);
    EXPECT_FALSE(known.at(0).withoutValue);
    EXPECT_EQ(known.size(), 1U);
}

TEST(KnownProperties, FindNamesIgnoringCaseButKeepTheirSpelling) {
    KnownProperties known;
    known.note(declared("Name"), 0, "", false);
    EXPECT_EQ(known.note(declared("NAME"), 1, "", false), 0U);
    EXPECT_EQ(namesIn(known), (Names{"NAME"}));
}

TEST(KnownProperties, AreNoMoreThan512) {
    KnownProperties known;
    for (int i = 0; i < 512; ++i) {
        ASSERT_TRUE(known.note(declared("P" + std::to_string(i)), known.size(), "", true));
    }
    EXPECT_FALSE(known.note(declared("P512"), known.size(), "", true));
    EXPECT_EQ(known.size(), 512U);
}

TEST(KnownProperties, AreDeclaredNoMoreThan4096Times) {
    KnownProperties known;
    for (int i = 0; i < 4096; ++i) {
        ASSERT_TRUE(
            known.note(declared("P", i % 2 == 0 ? CIMTYPE_STRING : CIMTYPE_UINT8), 0, "", true));
    }
    EXPECT_FALSE(known.note(declared("P"), 0, "", true));
}

TEST(KnownProperties, ShareTheShapeOfTheSameProperties) {
    KnownProperties known;
    known.note(declared("A"), 0, "", false);
    known.note(declared("B"), 1, "", false);
    const Uint32 a = known.at(0).id;
    const Uint32 b = known.at(1).id;
    const std::shared_ptr<const InstanceShape> both = known.shapeOf({a, b});
    const std::shared_ptr<const InstanceShape> reversed = known.shapeOf({b, a});
    EXPECT_EQ(known.shapeOf({a, b}), both);
    EXPECT_EQ(known.shapeOf({b, a}), reversed);
    EXPECT_NE(both, reversed);
    EXPECT_EQ(both->size(), 2U);
    EXPECT_EQ(both->find(CIMName("b")), 1U);
    EXPECT_EQ(reversed->find(CIMName("b")), 0U);
    EXPECT_EQ(both->find(CIMName("C")), PEG_NOT_FOUND);
    EXPECT_EQ(known.shapeOf({})->size(), 0U);
}

// Of the 300 subsets that come in turn some are forgotten; those handed out stay what they are.
TEST(KnownProperties, HandOutShapesThatOutliveThem) {
    std::vector<std::shared_ptr<const InstanceShape>> shapes;
    {
        KnownProperties known;
        for (std::size_t i = 0; i < 300; ++i) {
            known.note(declared("P" + std::to_string(i)), i, "", false);
        }
        for (std::size_t i = 0; i < 300; ++i) {
            shapes.push_back(known.shapeOf({known.at(i).id}));
        }
    }
    EXPECT_EQ(shapes[0]->at(0).name.getString(), "P0");
    EXPECT_EQ(shapes[299]->at(0).name.getString(), "P299");
}

}  // namespace
}  // namespace Pegasus
