// What values of type object and instance show of the classes and instances in them.
#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMValue.h>
#include <gtest/gtest.h>

namespace Pegasus {
namespace {

String textOf(const CIMProperty& property) {
    CIMInstance instance("C");
    instance.addProperty(property);
    const String text = CIMValue(instance).toString();
    const String before("<INSTANCE CLASSNAME=\"C\">");
    const String after("</INSTANCE>");
    EXPECT_EQ(text.find(before), 0U);
    return text.subString(before.size(), text.size() - before.size() - after.size());
}

TEST(EmbeddedXmlTest, WritesScalars) {
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(String("x")))),
              "<PROPERTY NAME=\"P\" TYPE=\"string\"><VALUE>x</VALUE></PROPERTY>");
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(true))),
              "<PROPERTY NAME=\"P\" TYPE=\"boolean\"><VALUE>TRUE</VALUE></PROPERTY>");
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(Sint16(-3)))),
              "<PROPERTY NAME=\"P\" TYPE=\"sint16\"><VALUE>-3</VALUE></PROPERTY>");
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(Char16(0xE9)))),
              "<PROPERTY NAME=\"P\" TYPE=\"char16\"><VALUE>\xC3\xA9</VALUE></PROPERTY>");
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(CIMTYPE_DATETIME, false))),
              "<PROPERTY NAME=\"P\" TYPE=\"datetime\"></PROPERTY>");
}

TEST(EmbeddedXmlTest, WritesArrays) {
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(Array<Uint8>(2, 7)), 2)),
              "<PROPERTY.ARRAY NAME=\"P\" TYPE=\"uint8\" ARRAYSIZE=\"2\">"
              "<VALUE.ARRAY><VALUE>7</VALUE><VALUE>7</VALUE></VALUE.ARRAY></PROPERTY.ARRAY>");
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(Array<String>()))),
              "<PROPERTY.ARRAY NAME=\"P\" TYPE=\"string\"><VALUE.ARRAY></VALUE.ARRAY>"
              "</PROPERTY.ARRAY>");
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(CIMTYPE_STRING, true))),
              "<PROPERTY.ARRAY NAME=\"P\" TYPE=\"string\"></PROPERTY.ARRAY>");
}

TEST(EmbeddedXmlTest, EscapesWhatXmlCannotCarry) {
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(String("<&>\"'\t\n\r\x01")))),
              "<PROPERTY NAME=\"P\" TYPE=\"string\"><VALUE>&lt;&amp;&gt;&quot;&apos;"
              "&#9;&#10;&#13;\xEF\xBF\xBD</VALUE></PROPERTY>");
}

TEST(EmbeddedXmlTest, WritesInstancesInInstances) {
    CIMInstance inner("I");
    inner.addProperty(CIMProperty("Q", CIMValue(String("&"))));
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(inner))),
              "<PROPERTY NAME=\"P\" TYPE=\"string\" EmbeddedObject=\"instance\"><VALUE>"
              "&lt;INSTANCE CLASSNAME=&quot;I&quot;&gt;"
              "&lt;PROPERTY NAME=&quot;Q&quot; TYPE=&quot;string&quot;&gt;"
              "&lt;VALUE&gt;&amp;amp;&lt;/VALUE&gt;&lt;/PROPERTY&gt;&lt;/INSTANCE&gt;"
              "</VALUE></PROPERTY>");
    EXPECT_EQ(textOf(CIMProperty("P", CIMValue(Array<CIMObject>(1, CIMObject(CIMInstance("I")))))),
              "<PROPERTY.ARRAY NAME=\"P\" TYPE=\"string\" EmbeddedObject=\"object\">"
              "<VALUE.ARRAY><VALUE>&lt;INSTANCE CLASSNAME=&quot;I&quot;&gt;&lt;/INSTANCE&gt;"
              "</VALUE></VALUE.ARRAY></PROPERTY.ARRAY>");
}

TEST(EmbeddedXmlTest, WritesReferences) {
    const auto valueOf = [](const CIMObjectPath& path) {
        const String text = textOf(CIMProperty("R", CIMValue(path), 0, "T"));
        const String before(
            "<PROPERTY.REFERENCE NAME=\"R\" REFERENCECLASS=\"T\"><VALUE.REFERENCE>");
        const String after("</VALUE.REFERENCE></PROPERTY.REFERENCE>");
        EXPECT_EQ(text.find(before), 0U);
        return text.subString(before.size(), text.size() - before.size() - after.size());
    };
    EXPECT_EQ(valueOf(CIMObjectPath("T")), "<CLASSNAME NAME=\"T\"/>");
    EXPECT_EQ(valueOf(CIMObjectPath("T.a=1,b=TRUE,c=\"x\"")),
              "<INSTANCENAME CLASSNAME=\"T\">"
              "<KEYBINDING NAME=\"a\"><KEYVALUE VALUETYPE=\"numeric\">1</KEYVALUE></KEYBINDING>"
              "<KEYBINDING NAME=\"b\"><KEYVALUE VALUETYPE=\"boolean\">TRUE</KEYVALUE></KEYBINDING>"
              "<KEYBINDING NAME=\"c\"><KEYVALUE VALUETYPE=\"string\">x</KEYVALUE></KEYBINDING>"
              "</INSTANCENAME>");
    EXPECT_EQ(valueOf(CIMObjectPath("root/x:T")),
              "<LOCALCLASSPATH><LOCALNAMESPACEPATH><NAMESPACE NAME=\"root\"/>"
              "<NAMESPACE NAME=\"x\"/></LOCALNAMESPACEPATH><CLASSNAME NAME=\"T\"/>"
              "</LOCALCLASSPATH>");
    EXPECT_EQ(valueOf(CIMObjectPath("root:T.a=1")),
              "<LOCALINSTANCEPATH><LOCALNAMESPACEPATH><NAMESPACE NAME=\"root\"/>"
              "</LOCALNAMESPACEPATH><INSTANCENAME CLASSNAME=\"T\"><KEYBINDING NAME=\"a\">"
              "<KEYVALUE VALUETYPE=\"numeric\">1</KEYVALUE></KEYBINDING></INSTANCENAME>"
              "</LOCALINSTANCEPATH>");
    EXPECT_EQ(valueOf(CIMObjectPath("//h/root:T")),
              "<CLASSPATH><NAMESPACEPATH><HOST>h</HOST><LOCALNAMESPACEPATH>"
              "<NAMESPACE NAME=\"root\"/></LOCALNAMESPACEPATH></NAMESPACEPATH>"
              "<CLASSNAME NAME=\"T\"/></CLASSPATH>");
}

TEST(EmbeddedXmlTest, WritesKeysThatAreReferences) {
    const auto textWithKey = [](const char* value) {
        const CIMObjectPath path(
            "", CIMNamespaceName(), "T",
            Array<CIMKeyBinding>(1, CIMKeyBinding("k", value, CIMKeyBinding::REFERENCE)));
        return textOf(CIMProperty("R", CIMValue(Array<CIMObjectPath>(1, path))));
    };
    EXPECT_EQ(textWithKey("U"),
              "<PROPERTY.REFARRAY NAME=\"R\"><VALUE.REFARRAY><VALUE.REFERENCE>"
              "<INSTANCENAME CLASSNAME=\"T\"><KEYBINDING NAME=\"k\"><VALUE.REFERENCE>"
              "<CLASSNAME NAME=\"U\"/></VALUE.REFERENCE></KEYBINDING></INSTANCENAME>"
              "</VALUE.REFERENCE></VALUE.REFARRAY></PROPERTY.REFARRAY>");
    EXPECT_EQ(textWithKey("no path"),
              "<PROPERTY.REFARRAY NAME=\"R\"><VALUE.REFARRAY><VALUE.REFERENCE>"
              "<INSTANCENAME CLASSNAME=\"T\"><KEYBINDING NAME=\"k\">"
              "<KEYVALUE VALUETYPE=\"string\">no path</KEYVALUE></KEYBINDING></INSTANCENAME>"
              "</VALUE.REFERENCE></VALUE.REFARRAY></PROPERTY.REFARRAY>");
}

TEST(EmbeddedXmlTest, WritesClassesWithQualifiersAndOrigins) {
    CIMFlavor flavor;
    flavor.set(CIMFlavor::OVERRIDABLE, false);
    flavor.set(CIMFlavor::TOSUBCLASS, false);
    flavor.set(CIMFlavor::TOINSTANCE, true);
    flavor.set(CIMFlavor::TRANSLATABLE, true);
    CIMProperty property("P", CIMValue(CIMTYPE_UINT8, false), 0, CIMName(), "S", true);
    property.addQualifier(CIMQualifier("Key", CIMValue(true), flavor, true));
    CIMClass cimClass("C", "S");
    cimClass.addQualifier(CIMQualifier("Q", CIMValue(Array<String>(1, "v")))).addProperty(property);
    EXPECT_EQ(CIMValue(CIMObject(cimClass)).toString(),
              "<CLASS NAME=\"C\" SUPERCLASS=\"S\">"
              "<QUALIFIER NAME=\"Q\" TYPE=\"string\"><VALUE.ARRAY><VALUE>v</VALUE></VALUE.ARRAY>"
              "</QUALIFIER>"
              "<PROPERTY NAME=\"P\" TYPE=\"uint8\" CLASSORIGIN=\"S\" PROPAGATED=\"true\">"
              "<QUALIFIER NAME=\"Key\" TYPE=\"boolean\" PROPAGATED=\"true\" OVERRIDABLE=\"false\""
              " TOSUBCLASS=\"false\" TOINSTANCE=\"true\" TRANSLATABLE=\"true\">"
              "<VALUE>TRUE</VALUE></QUALIFIER></PROPERTY></CLASS>");
}

}  // namespace
}  // namespace Pegasus
