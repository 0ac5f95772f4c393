#include "model/InstanceWriter.h"

#include <gtest/gtest.h>

#include "model/InstancePacker.h"

namespace Pegasus {
namespace {

CIMProperty property(const char* name, const CIMValue& value, const char* origin,
                     Boolean propagated) {
    return CIMProperty(CIMName(name), value, 0, CIMName(), CIMName(origin), propagated);
}

CIMInstance disk(const char* id, Uint32 size) {
    CIMInstance instance(CIMName("T_Disk"));
    instance.addProperty(property("Id", CIMValue(String(id)), "T_Thing", true));
    instance.addProperty(property("Size", CIMValue(size), "T_Disk", false));
    return instance;
}

std::string written(InstanceWriter& writer, const CIMConstInstance& instance) {
    std::string xml;
    writer.append(xml, instance);
    return xml;
}

/// Packed and not, which must make no difference.
void expectWritten(const CIMInstance& instance, const std::string& expected,
                   const ObjectXmlOptions& options = {}) {
    InstanceWriter writer(options);
    InstancePacker packer;
    EXPECT_EQ(written(writer, instance), expected);
    EXPECT_EQ(written(writer, packer.packed(instance)), expected);
}

TEST(InstanceWriterTest, WritesScalars) {
    CIMInstance instance(CIMName("C"));
    instance.addProperty(CIMProperty("S", CIMValue(String("<\xC3\xA9>"))));
    instance.addProperty(CIMProperty("B", CIMValue(true)));
    instance.addProperty(CIMProperty("U8", CIMValue(Uint8(200))));
    instance.addProperty(CIMProperty("S64", CIMValue(Sint64(-9000000000))));
    instance.addProperty(CIMProperty("R", CIMValue(Real32(1.5))));
    instance.addProperty(CIMProperty("H", CIMValue(Char16('&'))));
    instance.addProperty(
        CIMProperty("D", CIMValue(CIMDateTime(String("20240102030405.000000+060")))));
    instance.addProperty(CIMProperty("I", CIMValue(CIMDateTime())));
    expectWritten(instance,
                  "<INSTANCE CLASSNAME=\"C\">"
                  "<PROPERTY NAME=\"S\" TYPE=\"string\"><VALUE>&lt;\xC3\xA9&gt;</VALUE></PROPERTY>"
                  "<PROPERTY NAME=\"B\" TYPE=\"boolean\"><VALUE>TRUE</VALUE></PROPERTY>"
                  "<PROPERTY NAME=\"U8\" TYPE=\"uint8\"><VALUE>200</VALUE></PROPERTY>"
                  "<PROPERTY NAME=\"S64\" TYPE=\"sint64\"><VALUE>-9000000000</VALUE></PROPERTY>"
                  "<PROPERTY NAME=\"R\" TYPE=\"real32\"><VALUE>1.50000000e+00</VALUE></PROPERTY>"
                  "<PROPERTY NAME=\"H\" TYPE=\"char16\"><VALUE>&amp;</VALUE></PROPERTY>"
                  "<PROPERTY NAME=\"D\" TYPE=\"datetime\"><VALUE>20240102030405.000000+060</VALUE>"
                  "</PROPERTY>"
                  "<PROPERTY NAME=\"I\" TYPE=\"datetime\"><VALUE>00000000000000.000000:000</VALUE>"
                  "</PROPERTY></INSTANCE>");
}

TEST(InstanceWriterTest, WritesArraysAndNulls) {
    Array<String> texts;
    texts.append("");
    texts.append("b");
    CIMInstance instance(CIMName("C"));
    instance.addProperty(CIMProperty("A", CIMValue(texts), 2));
    instance.addProperty(CIMProperty("E", CIMValue(Array<Uint16>())));
    instance.addProperty(CIMProperty("N", CIMValue(CIMTYPE_STRING, false)));
    instance.addProperty(CIMProperty("M", CIMValue(CIMTYPE_UINT16, true)));
    expectWritten(instance,
                  "<INSTANCE CLASSNAME=\"C\">"
                  "<PROPERTY.ARRAY NAME=\"A\" TYPE=\"string\" ARRAYSIZE=\"2\"><VALUE.ARRAY>"
                  "<VALUE></VALUE><VALUE>b</VALUE></VALUE.ARRAY></PROPERTY.ARRAY>"
                  "<PROPERTY.ARRAY NAME=\"E\" TYPE=\"uint16\"><VALUE.ARRAY></VALUE.ARRAY>"
                  "</PROPERTY.ARRAY>"
                  "<PROPERTY NAME=\"N\" TYPE=\"string\"></PROPERTY>"
                  "<PROPERTY.ARRAY NAME=\"M\" TYPE=\"uint16\"></PROPERTY.ARRAY></INSTANCE>");
}

TEST(InstanceWriterTest, TellsOrigins) {
    expectWritten(disk("sda", 7),
                  "<INSTANCE CLASSNAME=\"T_Disk\"><PROPERTY NAME=\"Id\" TYPE=\"string\" "
                  "CLASSORIGIN=\"T_Thing\" PROPAGATED=\"true\"><VALUE>sda</VALUE></PROPERTY>"
                  "<PROPERTY NAME=\"Size\" TYPE=\"uint32\" CLASSORIGIN=\"T_Disk\">"
                  "<VALUE>7</VALUE></PROPERTY></INSTANCE>");
}

TEST(InstanceWriterTest, WritesNoMoreThanWanted) {
    ObjectXmlOptions options;
    options.includeClassOrigin = false;
    options.localOnly = true;
    expectWritten(disk("sda", 7),
                  "<INSTANCE CLASSNAME=\"T_Disk\"><PROPERTY NAME=\"Size\" TYPE=\"uint32\">"
                  "<VALUE>7</VALUE></PROPERTY></INSTANCE>",
                  options);
    Array<CIMName> names;
    names.append(CIMName("ID"));
    options.localOnly = false;
    options.propertyList = CIMPropertyList(names);
    expectWritten(disk("sda", 7),
                  "<INSTANCE CLASSNAME=\"T_Disk\"><PROPERTY NAME=\"Id\" TYPE=\"string\" "
                  "PROPAGATED=\"true\"><VALUE>sda</VALUE></PROPERTY></INSTANCE>",
                  options);
}

TEST(InstanceWriterTest, WritesOneInstanceAfterTheOther) {
    ObjectXmlOptions options;
    options.includeClassOrigin = false;
    InstanceWriter writer(options);
    InstancePacker packer;
    CIMInstance fan(CIMName("T_Fan"));
    fan.addProperty(CIMProperty("Speed", CIMValue(Uint16(9))));
    const std::string begin =
        "<INSTANCE CLASSNAME=\"T_Disk\"><PROPERTY NAME=\"Id\" TYPE=\"string\" PROPAGATED=\"true\">"
        "<VALUE>";
    const std::string middle = "</VALUE></PROPERTY><PROPERTY NAME=\"Size\" TYPE=\"uint32\"><VALUE>";
    const std::string end = "</VALUE></PROPERTY></INSTANCE>";
    EXPECT_EQ(written(writer, packer.packed(disk("sda", 7))), begin + "sda" + middle + "7" + end);
    EXPECT_EQ(written(writer, packer.packed(disk("sdb", 8))), begin + "sdb" + middle + "8" + end);
    EXPECT_EQ(written(writer, packer.packed(fan)),
              "<INSTANCE CLASSNAME=\"T_Fan\"><PROPERTY NAME=\"Speed\" TYPE=\"uint16\">"
              "<VALUE>9</VALUE></PROPERTY></INSTANCE>");
    EXPECT_EQ(written(writer, packer.packed(disk("sdc", 9))), begin + "sdc" + middle + "9" + end);
}

}  // namespace
}  // namespace Pegasus
