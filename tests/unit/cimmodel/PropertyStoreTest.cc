// An instance whose properties are packed behaves as any other.

#include "model/PropertyStore.h"

#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObject.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "model/InstanceBody.h"

namespace Pegasus {
namespace {

// T_Thing with A="a", B=7 and C, a null array of texts.
CIMInstance packedInstance() {
    PropertyDeclaration a;
    a.name = "A";
    PropertyDeclaration b;
    b.name = "B";
    b.type = CIMTYPE_UINT16;
    PropertyDeclaration c;
    c.name = "C";
    c.isArray = true;
    PropertyPacker packer;
    packer.start();
    packer.beginScalar();
    packer.putText("a");
    packer.beginScalar();
    packer.put(Uint16(7));
    packer.beginNull();
    auto body = std::make_unique<InstanceBody>(CIMName("T_Thing"));
    body->properties =
        PropertyStore(packer.finish(std::make_shared<InstanceShape>(std::vector{a, b, c})));
    return makeInstance(std::move(body));
}

// Read through a handle that cannot change anything.
String shown(const CIMConstInstance& instance, const char* name) {
    const Uint32 position = instance.findProperty(name);
    if (position == PEG_NOT_FOUND) {
        return "none";
    }
    const CIMValue value = instance.getProperty(position).getValue();
    return value.isNull() ? String("null") : value.toString();
}

TEST(PropertyStore, GivesWhatWasPacked) {
    const CIMInstance instance = packedInstance();
    EXPECT_EQ(instance.getPropertyCount(), 3U);
    EXPECT_EQ(instance.findProperty("b"), 1U);
    EXPECT_EQ(instance.findProperty("D"), PEG_NOT_FOUND);
    EXPECT_EQ(shown(instance, "A"), "a");
    EXPECT_EQ(shown(instance, "B"), "7");
    EXPECT_EQ(shown(instance, "C"), "null");
    const CIMConstProperty last = instance.getProperty(2);
    EXPECT_EQ(last.getType(), CIMTYPE_STRING);
    EXPECT_TRUE(last.isArray());
    EXPECT_TRUE(last.getValue().isArray());
    EXPECT_TRUE(last.getReferenceClassName().isNull());
    EXPECT_EQ(last.getQualifierCount(), 0U);
    EXPECT_EQ(last.findQualifier("Key"), PEG_NOT_FOUND);
    EXPECT_THROW(last.getQualifier(0), IndexOutOfBoundsException);
    EXPECT_THROW(instance.getProperty(3), IndexOutOfBoundsException);
}

TEST(PropertyStore, LetsPropertiesBeChanged) {
    CIMInstance instance = packedInstance();
    const CIMInstance sharing = instance;
    const CIMObject object(instance);
    CIMProperty property = instance.getProperty(1);
    property.setValue(CIMValue(Uint16(8)));
    EXPECT_EQ(shown(instance, "B"), "8");
    EXPECT_EQ(shown(sharing, "B"), "8");
    EXPECT_EQ(object.getProperty(1).getValue().toString(), "8");
    EXPECT_THROW(property.setValue(CIMValue(Uint32(9))), TypeMismatchException);
    property.addQualifier(CIMQualifier("Key", CIMValue(true)));
    EXPECT_EQ(sharing.getProperty(1).getQualifierCount(), 1U);
    EXPECT_EQ(shown(instance, "A"), "a");
    EXPECT_EQ(shown(instance, "C"), "null");
    EXPECT_THROW(instance.getProperty(3), IndexOutOfBoundsException);
}

TEST(PropertyStore, TakesFurtherProperties) {
    CIMInstance instance = packedInstance();
    instance.addProperty(CIMProperty("D", CIMValue(String("d"))));
    EXPECT_EQ(instance.getPropertyCount(), 4U);
    EXPECT_EQ(instance.findProperty("d"), 3U);
    EXPECT_EQ(shown(instance, "D"), "d");
    EXPECT_EQ(shown(instance, "A"), "a");
    EXPECT_THROW(instance.addProperty(CIMProperty("a", CIMValue(Uint8(1)))),
                 AlreadyExistsException);
    EXPECT_EQ(instance.getPropertyCount(), 4U);
}

TEST(PropertyStore, RefusesANameThatIsPacked) {
    CIMInstance instance = packedInstance();
    EXPECT_THROW(instance.addProperty(CIMProperty("c", CIMValue(Uint8(1)))),
                 AlreadyExistsException);
    EXPECT_EQ(instance.getPropertyCount(), 3U);
    EXPECT_EQ(shown(instance, "C"), "null");
}

TEST(PropertyStore, HasClonesOfTheirOwn) {
    CIMInstance instance = packedInstance();
    CIMInstance before = instance.clone();
    instance.getProperty(0).setValue(CIMValue(String("changed")));
    const CIMInstance after = instance.clone();
    before.addProperty(CIMProperty("D", CIMValue(Uint8(1))));
    instance.getProperty(0).setValue(CIMValue(String("again")));
    EXPECT_EQ(shown(before, "A"), "a");
    EXPECT_EQ(shown(before, "D"), "1");
    EXPECT_EQ(shown(after, "A"), "changed");
    EXPECT_EQ(shown(after, "D"), "none");
    EXPECT_EQ(shown(instance, "A"), "again");
}

TEST(PropertyStore, IsTheSameThroughAnObject) {
    const CIMObject object(packedInstance());
    EXPECT_EQ(object.getPropertyCount(), 3U);
    EXPECT_EQ(object.findProperty("a"), 0U);
    EXPECT_EQ(object.getProperty(0).getValue().toString(), "a");
    CIMInstance again(object);
    again.getProperty(0).setValue(CIMValue(String("b")));
    EXPECT_EQ(object.getProperty(0).getValue().toString(), "b");
    EXPECT_EQ(object.clone().getProperty(0).getValue().toString(), "b");
}

TEST(PropertyStore, GivesPropertiesThatOutliveIt) {
    CIMConstProperty property;
    CIMProperty copy;
    {
        CIMInstance instance = packedInstance();
        property = std::as_const(instance).getProperty(1);
        copy = property.clone();
        instance.getProperty(1).setValue(CIMValue(Uint16(8)));
    }
    EXPECT_EQ(property.getName().getString(), "B");
    EXPECT_EQ(property.getValue().toString(), "7");
    copy.setValue(CIMValue(Uint16(9)));
    EXPECT_EQ(copy.getValue().toString(), "9");
    EXPECT_EQ(property.getValue().toString(), "7");
    const CIMConstProperty moved = std::move(property);
    EXPECT_EQ(moved.getValue().toString(), "7");
    property = CIMConstProperty();
    EXPECT_TRUE(property.isUninitialized());
    EXPECT_THROW(property.getName(), UninitializedObjectException);
    property = copy;
    EXPECT_EQ(property.getValue().toString(), "9");
}

TEST(PropertyStore, IsSharedByTheElementsOfCopiedArrays) {
    Array<CIMInstance> instances(2, packedInstance());
    Array<CIMInstance> copies = instances;
    copies[0].getProperty(0).setValue(CIMValue(String("b")));
    copies[1] = packedInstance();
    EXPECT_EQ(shown(instances[0], "A"), "b");
    EXPECT_EQ(shown(instances[1], "A"), "b");
    EXPECT_EQ(shown(copies[1], "A"), "a");
}

TEST(PropertyStore, IsReadFromSeveralThreadsAtATime) {
    const CIMInstance instance = packedInstance();
    std::vector<int> right(4, 0);
    std::vector<std::thread> readers;
    for (int& count : right) {
        readers.emplace_back([&count, &instance] {
            for (int i = 0; i < 500; ++i) {
                const CIMConstInstance own = instance;
                count += shown(own, "A") == String("a") && shown(own, "B") == String("7") ? 1 : 0;
            }
        });
    }
    for (std::thread& reader : readers) {
        reader.join();
    }
    EXPECT_EQ(right, (std::vector<int>{500, 500, 500, 500}));
}

}  // namespace
}  // namespace Pegasus
