// The run driver's small functions; the run itself is tested as a whole program.

#include "Sennet/Driver.h"

#include <gtest/gtest.h>

#include "ConverterFixture.h"

namespace {

using namespace Pegasus;
using namespace generatortest;

TEST(IsValidMIFType, KnowsFourTypesExactly) {
    for (const char* type : {"/SMS", "/CA", "/QVE", "/LD"}) {
        EXPECT_TRUE(isValidMIFType(type)) << type;
    }
    for (const char* type :
         {"", "/sms", "/Ca", "/qve", "/ld", "SMS", "/SMS ", " /SMS", "/LDMS", "-SMS", "/"}) {
        EXPECT_FALSE(isValidMIFType(type)) << type;
    }
}

TEST(SomethingToPrintOut, NeedsAClassAndAnInstance) {
    const CIMClass fanClass = cimClass("CIM_Fan", {});
    const CIMInstance fan = cimInstance("CIM_Fan", {});
    const Inventory nothing({});
    const Inventory noInstance({{fanClass, {}}, {fanClass, {}}});
    const Inventory lateInstance({{fanClass, {}}, {fanClass, {fan}}});
    EXPECT_FALSE(somethingToPrintOut(nothing.classes, nothing.lists));
    EXPECT_FALSE(somethingToPrintOut(noInstance.classes, noInstance.lists));
    EXPECT_TRUE(somethingToPrintOut(lateInstance.classes, lateInstance.lists));
    EXPECT_FALSE(somethingToPrintOut(nothing.classes, lateInstance.lists));
}

TEST(GetTranslatedString, GivesTheValueOrTheKey) {
    Velm::Properties properties;
    properties.set("title.Fan", "Cooling");
    EXPECT_STREQ(getTranslatedString("title.Fan", properties), "Cooling");
    EXPECT_STREQ(getTranslatedString("title.Disk", properties), "title.Disk");
}

}  // namespace
