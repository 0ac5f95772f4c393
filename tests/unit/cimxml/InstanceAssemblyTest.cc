// Instances as they are put together while they are read.

#include "xml/InstanceAssembly.h"

#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <deque>
#include <string>

namespace Pegasus {
namespace {

const CIMName kThing("T_Thing");

CIMProperty text(const char* name, const char* value) {
    return CIMProperty(name, CIMValue(String(value)));
}

std::string spelled(const std::string& name) {
    return "<P N=\"" + name + "\"><VALUE>x</VALUE></P>";
}

// "A=1 B=null", in the order of the instance.
std::string described(const CIMConstInstance& instance) {
    std::string out;
    for (Uint32 i = 0; i < instance.getPropertyCount(); ++i) {
        const CIMConstProperty property = instance.getProperty(i);
        const CIMValue value = property.getValue();
        const CString name = property.getName().getString().getCString();
        const CString shown =
            value.isNull() ? String("null").getCString() : value.toString().getCString();
        out += (i == 0 ? "" : " ") + std::string(name) + "=" + std::string(shown);
    }
    return out;
}

void addTexts(InstanceAssembly& assembly, std::initializer_list<const char*> names) {
    for (const char* name : names) {
        assembly.addProperty(text(name, name), spelled(name));
    }
}

void takeText(InstanceAssembly& assembly, std::size_t ahead, const char* value) {
    assembly.packer().beginScalar();
    assembly.packer().putText(value);
    assembly.tookExpected(ahead);
}

TEST(InstanceAssembly, ExpectsThePropertiesOfEarlierInstances) {
    InstanceAssembly assembly;
    assembly.start(kThing, true);
    EXPECT_EQ(assembly.expected(0), nullptr);
    addTexts(assembly, {"A", "B", "C"});
    EXPECT_EQ(described(assembly.finish()), "A=A B=B C=C");

    assembly.start(kThing, true);
    ASSERT_NE(assembly.expected(0), nullptr);
    EXPECT_EQ(assembly.declaration(*assembly.expected(0)).name.getString(), "A");
    ASSERT_NE(assembly.expected(1), nullptr);
    EXPECT_EQ(assembly.declaration(*assembly.expected(1)).name.getString(), "B");
    EXPECT_EQ(assembly.expected(3), nullptr);
    takeText(assembly, 1, "two");
    ASSERT_NE(assembly.expected(0), nullptr);
    EXPECT_EQ(assembly.declaration(*assembly.expected(0)).name.getString(), "C");
    assembly.packer().beginNull();
    assembly.tookExpected(0);
    EXPECT_EQ(assembly.expected(0), nullptr);
    EXPECT_EQ(described(assembly.finish()), "B=two C=null");
}

TEST(InstanceAssembly, ExpectsNothingWithoutLearning) {
    InstanceAssembly assembly;
    for (const bool learning : {true, false, false}) {
        assembly.start(kThing, learning);
        EXPECT_EQ(assembly.expected(0), nullptr);
        addTexts(assembly, {"A"});
        EXPECT_EQ(described(assembly.finish()), "A=A");
    }
}

TEST(InstanceAssembly, ExpectsOfAClassWhatThatHad) {
    const CIMName other("T_Other");
    InstanceAssembly assembly;
    assembly.start(kThing, true);
    addTexts(assembly, {"A"});
    assembly.finish();
    assembly.start(other, true);
    EXPECT_EQ(assembly.expected(0), nullptr);
    addTexts(assembly, {"B"});
    const CIMInstance second = assembly.finish();
    EXPECT_EQ(second.getClassName().getString(), "T_Other");
    assembly.start(kThing, true);
    EXPECT_EQ(assembly.declaration(*assembly.expected(0)).name.getString(), "A");
}

TEST(InstanceAssembly, RemembersNoMoreThan64Classes) {
    std::deque<CIMName> names;
    InstanceAssembly assembly;
    for (int i = 0; i < 64; ++i) {
        names.emplace_back(("T_" + std::to_string(i)).c_str());
        assembly.start(names.back(), true);
        addTexts(assembly, {"A"});
        assembly.finish();
    }
    assembly.start(names.front(), true);
    EXPECT_NE(assembly.expected(0), nullptr);
    assembly.start(kThing, true);
    addTexts(assembly, {"A"});
    EXPECT_EQ(described(assembly.finish()), "A=A");
    assembly.start(names.front(), true);
    EXPECT_EQ(assembly.expected(0), nullptr);
}

TEST(InstanceAssembly, TakesPropertiesInAnyOrder) {
    InstanceAssembly assembly;
    assembly.start(kThing, true);
    addTexts(assembly, {"A", "B"});
    assembly.finish();
    assembly.start(kThing, true);
    takeText(assembly, 1, "b");
    assembly.addProperty(text("A", "a"), spelled("A"));
    EXPECT_EQ(assembly.expected(0), nullptr);
    assembly.addProperty(text("New", "n"), spelled("New"));
    EXPECT_EQ(described(assembly.finish()), "B=b A=a New=n");
}

TEST(InstanceAssembly, RefusesAPropertyThatItHas) {
    InstanceAssembly assembly;
    assembly.start(kThing, true);
    addTexts(assembly, {"A", "B"});
    EXPECT_THROW(assembly.addProperty(text("a", "again"), ""), AlreadyExistsException);
    assembly.start(kThing, true);
    takeText(assembly, 0, "a");
    EXPECT_THROW(assembly.addProperty(CIMProperty("A", CIMValue(Uint8(1))), ""),
                 AlreadyExistsException);
    // What was left in the middle leaves no trace.
    assembly.start(kThing, true);
    takeText(assembly, 1, "b");
    EXPECT_EQ(described(assembly.finish()), "B=b");
}

TEST(InstanceAssembly, GoesOnUnpackedWhereThatIsNeeded) {
    CIMProperty qualified = text("Q", "q");
    qualified.addQualifier(CIMQualifier("Key", CIMValue(true)));
    const CIMProperty reference("R", CIMValue(CIMObjectPath(String(), CIMNamespaceName(), "T_X")),
                                0, "T_X");
    for (const CIMProperty& special : {qualified, reference}) {
        InstanceAssembly assembly;
        for (int round = 0; round < 2; ++round) {
            assembly.start(kThing, true);
            addTexts(assembly, {"A"});
            assembly.addProperty(special, "");
            EXPECT_EQ(assembly.expected(0), nullptr);
            addTexts(assembly, {"Z"});
            EXPECT_THROW(assembly.addProperty(text("a", "again"), ""), AlreadyExistsException);
            const CIMInstance instance = assembly.finish();
            ASSERT_EQ(instance.getPropertyCount(), 3U);
            const CIMConstInstance& read = instance;
            EXPECT_EQ(read.getProperty(1).getQualifierCount(), special.getQualifierCount());
            EXPECT_EQ(read.getProperty(1).getReferenceClassName(), special.getReferenceClassName());
            EXPECT_EQ(read.findProperty("z"), 2U);
        }
    }
}

TEST(InstanceAssembly, HoldsMorePropertiesThanItRemembers) {
    InstanceAssembly assembly;
    for (int round = 0; round < 2; ++round) {
        assembly.start(kThing, true);
        for (int i = 0; i < 600; ++i) {
            assembly.addProperty(text(("P" + std::to_string(i)).c_str(), "x"), "");
        }
        const CIMInstance instance = assembly.finish();
        EXPECT_EQ(instance.getPropertyCount(), 600U);
        EXPECT_EQ(instance.findProperty("p599"), 599U);
        EXPECT_EQ(instance.findProperty("P0"), 0U);
    }
}

TEST(InstanceAssembly, KeepsQualifiersOfTheInstance) {
    InstanceAssembly assembly;
    assembly.start(kThing, true);
    assembly.addQualifier(CIMQualifier("Abstract", CIMValue(true)));
    EXPECT_THROW(assembly.addQualifier(CIMQualifier("ABSTRACT", CIMValue(true))),
                 AlreadyExistsException);
    addTexts(assembly, {"A"});
    const CIMInstance instance = assembly.finish();
    EXPECT_EQ(instance.getQualifierCount(), 1U);
    EXPECT_EQ(described(instance), "A=A");
}

TEST(InstanceAssembly, MakesInstancesThatOutliveIt) {
    CIMInstance instance;
    {
        InstanceAssembly assembly;
        assembly.start(kThing, true);
        addTexts(assembly, {"A"});
        instance = assembly.finish();
        assembly.start(kThing, true);
        takeText(assembly, 0, "other");
        assembly.finish();
    }
    EXPECT_EQ(described(instance), "A=A");
}

}  // namespace
}  // namespace Pegasus
