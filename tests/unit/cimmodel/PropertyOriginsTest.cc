#include "model/PropertyOrigins.h"

#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include "model/InstanceBody.h"
#include "model/PackedProperties.h"

namespace Pegasus {
namespace {

CIMClass diskClass() {
    CIMClass out(CIMName("T_Disk"), CIMName("T_Thing"));
    out.addProperty(
        CIMProperty("Id", CIMValue(CIMTYPE_STRING, false), 0, CIMName(), CIMName("T_Thing"), true));
    out.addProperty(CIMProperty("Size", CIMValue(CIMTYPE_UINT32, false), 0, CIMName(),
                                CIMName("T_Disk"), false));
    return out;
}

CIMInstance packedDisk(const char* name) {
    PropertyDeclaration declaration;
    declaration.name = CIMName(name);
    declaration.type = CIMTYPE_UINT32;
    PropertyPacker packer;
    packer.beginScalar();
    packer.put(Uint32(5));
    return makeInstance(
        CIMName("T_Disk"),
        packer.finish(std::make_shared<const InstanceShape>(std::vector{declaration})));
}

void expectOrigin(const CIMConstProperty& property, const char* origin, Boolean propagated) {
    EXPECT_EQ(property.getClassOrigin(), CIMName(origin));
    EXPECT_EQ(property.getPropagated(), propagated);
}

TEST(PropertyOriginsTest, TakesThemFromTheClass) {
    PropertyOrigins origins(diskClass());
    CIMInstance instance(CIMName("T_Disk"));
    instance.addProperty(CIMProperty("SIZE", CIMValue(Uint32(1))));
    instance.addProperty(CIMProperty("Id", CIMValue(String("a"))));
    origins.set(instance);
    expectOrigin(instance.getProperty(0), "T_Disk", false);
    expectOrigin(instance.getProperty(1), "T_Thing", true);
}

TEST(PropertyOriginsTest, SetsThoseOfPackedInstances) {
    PropertyOrigins origins(diskClass());
    for (const auto& [name, origin] :
         {std::pair("Size", "T_Disk"), std::pair("ID", "T_Thing"), std::pair("Size", "T_Disk")}) {
        CIMInstance instance = packedDisk(name);
        origins.set(instance);
        const CIMConstInstance& read = instance;
        expectOrigin(read.getProperty(0), origin, std::string(name) == "ID");
        EXPECT_EQ(read.getProperty(0).getValue().toString(), String("5"));
    }
}

TEST(PropertyOriginsTest, RefusesPropertiesThatTheClassDoesNotHave) {
    PropertyOrigins origins(diskClass());
    CIMInstance packed = packedDisk("Speed");
    EXPECT_THROW(origins.set(packed), Exception);
    CIMInstance instance(CIMName("T_Disk"));
    instance.addProperty(CIMProperty("Speed", CIMValue(Uint32(1))));
    EXPECT_THROW(origins.set(instance), Exception);
}

}  // namespace
}  // namespace Pegasus
