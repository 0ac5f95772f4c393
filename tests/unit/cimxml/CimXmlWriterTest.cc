// What the writer makes of values, classes, instances and requests, to the byte.

#include "xml/CimXmlWriter.h"

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMFlavor.h>
#include <Pegasus/Common/CIMInstance.h>
#include <gtest/gtest.h>

#include <limits>
#include <string>

#include "ResponseText.h"
#include "xml/CimXmlReader.h"
#include "xml/MemorySource.h"

namespace Pegasus {
namespace {

std::string utf8(const String& text) {
    return std::string(text.getCString());
}

std::string valueXml(const CIMValue& value) {
    std::string xml;
    appendValue(xml, value);
    return xml;
}

TEST(CimXmlWriter, ScalarValues) {
    EXPECT_EQ(valueXml(CIMValue(Boolean(true))), "<VALUE>TRUE</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(Boolean(false))), "<VALUE>FALSE</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(Uint8(255))), "<VALUE>255</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(Sint8(-128))), "<VALUE>-128</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(Uint64(18446744073709551615U))),
              "<VALUE>18446744073709551615</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(std::numeric_limits<Sint64>::min())),
              "<VALUE>-9223372036854775808</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(Char16('<'))), "<VALUE>&lt;</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(Char16(0x20AC))), "<VALUE>\xE2\x82\xAC</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(String("a b"))), "<VALUE>a b</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(String())), "<VALUE></VALUE>");
    EXPECT_EQ(valueXml(CIMValue(CIMDateTime())), "<VALUE>00000000000000.000000:000</VALUE>");
}

TEST(CimXmlWriter, RealsKeepEveryBit) {
    EXPECT_EQ(valueXml(CIMValue(Real64(0.1))), "<VALUE>1.0000000000000001e-01</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(Real64(-1.5))), "<VALUE>-1.5000000000000000e+00</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(Real32(0.1F))), "<VALUE>1.00000001e-01</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(std::numeric_limits<Real64>::infinity())), "<VALUE>INF</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(-std::numeric_limits<Real64>::infinity())), "<VALUE>-INF</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(std::numeric_limits<Real64>::quiet_NaN())), "<VALUE>NaN</VALUE>");
}

TEST(CimXmlWriter, NullValuesAreNothing) {
    EXPECT_EQ(valueXml(CIMValue(CIMTYPE_UINT16, false)), "");
    EXPECT_EQ(valueXml(CIMValue(CIMTYPE_STRING, true)), "");
    EXPECT_EQ(valueXml(CIMValue(CIMTYPE_REFERENCE, false)), "");
}

TEST(CimXmlWriter, ArrayValues) {
    Array<Uint16> numbers;
    EXPECT_EQ(valueXml(CIMValue(numbers)), "<VALUE.ARRAY></VALUE.ARRAY>");
    numbers.append(1);
    numbers.append(2);
    EXPECT_EQ(valueXml(CIMValue(numbers)),
              "<VALUE.ARRAY><VALUE>1</VALUE><VALUE>2</VALUE></VALUE.ARRAY>");
    EXPECT_EQ(valueXml(CIMValue(Array<Boolean>(1, true))),
              "<VALUE.ARRAY><VALUE>TRUE</VALUE></VALUE.ARRAY>");
    EXPECT_EQ(valueXml(CIMValue(Array<CIMObjectPath>(1, CIMObjectPath("C.k=1")))),
              "<VALUE.REFARRAY><VALUE.REFERENCE><INSTANCENAME CLASSNAME=\"C\"><KEYBINDING "
              "NAME=\"k\"><KEYVALUE VALUETYPE=\"numeric\">1</KEYVALUE></KEYBINDING></INSTANCENAME>"
              "</VALUE.REFERENCE></VALUE.REFARRAY>");
}

TEST(CimXmlWriter, TextsAreEscaped) {
    EXPECT_EQ(valueXml(CIMValue(String("<a href=\"x\">'&'</a>"))),
              "<VALUE>&lt;a href=&quot;x&quot;&gt;&apos;&amp;&apos;&lt;/a&gt;</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(String("1\t2\n3\r4"))), "<VALUE>1&#9;2&#10;3&#13;4</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(String("\x01\x1F"))), "<VALUE>\xEF\xBF\xBD\xEF\xBF\xBD</VALUE>");
    EXPECT_EQ(valueXml(CIMValue(String("\x7F\xC3\xA9\xE2\x82\xAC\xF0\x90\x8D\x88"))),
              "<VALUE>\x7F\xC3\xA9\xE2\x82\xAC\xF0\x90\x8D\x88</VALUE>");
}

TEST(CimXmlWriter, UnpairedSurrogatesAndNonCharactersAreReplaced) {
    const Char16 units[] = {0xD800, 'a', 0xDC00, 0xD800, 0xD801, 0xDC37, 0xFFFE, 0xFFFF, 0xDBFF};
    EXPECT_EQ(
        valueXml(CIMValue(String(units, 9))),
        "<VALUE>\xEF\xBF\xBD"
        "a\xEF\xBF\xBD\xEF\xBF\xBD\xF0\x90\x90\xB7\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD</VALUE>");
}

TEST(CimXmlWriter, EmbeddedObjectsAreEscapedOnceMore) {
    CIMInstance inner(CIMName("T_In"));
    inner.addProperty(CIMProperty(CIMName("A"), CIMValue(String("x & y"))));
    CIMInstance outer(CIMName("T_Out"));
    outer.addProperty(CIMProperty(CIMName("P"), CIMValue(inner)));
    std::string xml;
    appendInstance(xml, outer);
    EXPECT_EQ(xml,
              "<INSTANCE CLASSNAME=\"T_Out\"><PROPERTY NAME=\"P\" TYPE=\"string\" "
              "EmbeddedObject=\"instance\"><VALUE>&lt;INSTANCE CLASSNAME=&quot;T_In&quot;&gt;&lt;"
              "PROPERTY NAME=&quot;A&quot; TYPE=&quot;string&quot;&gt;&lt;VALUE&gt;x &amp;amp; "
              "y&lt;/VALUE&gt;&lt;/PROPERTY&gt;&lt;/INSTANCE&gt;</VALUE></PROPERTY></INSTANCE>");
}

std::string referenceXml(const char* path) {
    std::string xml;
    appendReference(xml, CIMObjectPath(path));
    return xml;
}

TEST(CimXmlWriter, References) {
    const std::string name =
        "<INSTANCENAME CLASSNAME=\"C\"><KEYBINDING NAME=\"k\"><KEYVALUE "
        "VALUETYPE=\"string\">a&quot;</KEYVALUE></KEYBINDING></INSTANCENAME>";
    const std::string nameSpace =
        "<LOCALNAMESPACEPATH><NAMESPACE NAME=\"root\"/><NAMESPACE NAME=\"x\"/>"
        "</LOCALNAMESPACEPATH>";
    EXPECT_EQ(referenceXml("C.k=\"a\\\"\""), "<VALUE.REFERENCE>" + name + "</VALUE.REFERENCE>");
    EXPECT_EQ(referenceXml("root/x:C.k=\"a\\\"\""), "<VALUE.REFERENCE><LOCALINSTANCEPATH>" +
                                                        nameSpace + name +
                                                        "</LOCALINSTANCEPATH></VALUE.REFERENCE>");
    EXPECT_EQ(referenceXml("//h/root/x:C.k=\"a\\\"\""),
              "<VALUE.REFERENCE><INSTANCEPATH><NAMESPACEPATH><HOST>h</HOST>" + nameSpace +
                  "</NAMESPACEPATH>" + name + "</INSTANCEPATH></VALUE.REFERENCE>");
    EXPECT_EQ(referenceXml("C"), "<VALUE.REFERENCE><CLASSNAME NAME=\"C\"/></VALUE.REFERENCE>");
    EXPECT_EQ(referenceXml("root/x:C"), "<VALUE.REFERENCE><LOCALCLASSPATH>" + nameSpace +
                                            "<CLASSNAME NAME=\"C\"/></LOCALCLASSPATH>"
                                            "</VALUE.REFERENCE>");
    EXPECT_EQ(referenceXml("//h/root/x:C"),
              "<VALUE.REFERENCE><CLASSPATH><NAMESPACEPATH><HOST>h</HOST>" + nameSpace +
                  "</NAMESPACEPATH><CLASSNAME NAME=\"C\"/></CLASSPATH></VALUE.REFERENCE>");
}

TEST(CimXmlWriter, KeysOfEveryType) {
    Array<CIMKeyBinding> keys;
    keys.append(CIMKeyBinding("b", "TRUE", CIMKeyBinding::BOOLEAN));
    keys.append(CIMKeyBinding("n", "-5", CIMKeyBinding::NUMERIC));
    keys.append(CIMKeyBinding("r", "D.k=1", CIMKeyBinding::REFERENCE));
    keys.append(CIMKeyBinding("s", " <", CIMKeyBinding::STRING));
    std::string xml;
    appendInstanceName(xml, CIMObjectPath("host", "root/x", "C", keys));
    EXPECT_EQ(xml,
              "<INSTANCENAME CLASSNAME=\"C\">"
              "<KEYBINDING NAME=\"b\"><KEYVALUE VALUETYPE=\"boolean\">TRUE</KEYVALUE></KEYBINDING>"
              "<KEYBINDING NAME=\"n\"><KEYVALUE VALUETYPE=\"numeric\">-5</KEYVALUE></KEYBINDING>"
              "<KEYBINDING NAME=\"r\"><VALUE.REFERENCE><INSTANCENAME CLASSNAME=\"D\"><KEYBINDING "
              "NAME=\"k\"><KEYVALUE VALUETYPE=\"numeric\">1</KEYVALUE></KEYBINDING></INSTANCENAME>"
              "</VALUE.REFERENCE></KEYBINDING>"
              "<KEYBINDING NAME=\"s\"><KEYVALUE VALUETYPE=\"string\"> &lt;</KEYVALUE></KEYBINDING>"
              "</INSTANCENAME>");
}

TEST(CimXmlWriter, AKeyWithoutNameHasNoBinding) {
    std::string xml;
    appendInstanceName(
        xml, CIMObjectPath(
                 String(), CIMNamespaceName(), "C",
                 Array<CIMKeyBinding>(1, CIMKeyBinding(CIMName(), "v", CIMKeyBinding::STRING))));
    EXPECT_EQ(xml,
              "<INSTANCENAME CLASSNAME=\"C\"><KEYVALUE VALUETYPE=\"string\">v</KEYVALUE>"
              "</INSTANCENAME>");
}

CIMClass sampleClass() {
    CIMFlavor restricted;
    restricted.set(CIMFlavor::TOSUBCLASS, false);
    restricted.set(CIMFlavor::TRANSLATABLE, true);
    CIMFlavor fixed;
    fixed.set(CIMFlavor::OVERRIDABLE, false);
    fixed.set(CIMFlavor::TOINSTANCE, true);
    CIMClass cimClass(CIMName("T_Thing"), CIMName("T_Base"));
    cimClass.addQualifier(CIMQualifier(CIMName("Version"), CIMValue(String("1.0")), restricted));
    cimClass.addQualifier(CIMQualifier(CIMName("Note"), CIMValue(String("n")), CIMFlavor(), true));
    CIMProperty id(CIMName("Id"), CIMValue(CIMTYPE_STRING, false), 0, CIMName(), CIMName("T_Base"),
                   true);
    id.addQualifier(CIMQualifier(CIMName("Key"), CIMValue(Boolean(true)), fixed));
    cimClass.addProperty(id);
    cimClass.addProperty(CIMProperty(CIMName("States"), CIMValue(CIMTYPE_UINT16, true), 4,
                                     CIMName(), CIMName("T_Thing")));
    cimClass.addProperty(
        CIMProperty(CIMName("Peer"), CIMValue(CIMTYPE_REFERENCE, false), 0, CIMName("T_Other")));
    return cimClass;
}

TEST(CimXmlWriter, AWholeClass) {
    std::string xml;
    appendClassElement(xml, sampleClass());
    EXPECT_EQ(xml,
              "<CLASS NAME=\"T_Thing\" SUPERCLASS=\"T_Base\">"
              "<QUALIFIER NAME=\"Version\" TYPE=\"string\" TOSUBCLASS=\"false\" "
              "TRANSLATABLE=\"true\"><VALUE>1.0</VALUE></QUALIFIER>"
              "<QUALIFIER NAME=\"Note\" TYPE=\"string\" PROPAGATED=\"true\"><VALUE>n</VALUE>"
              "</QUALIFIER>"
              "<PROPERTY NAME=\"Id\" TYPE=\"string\" CLASSORIGIN=\"T_Base\" PROPAGATED=\"true\">"
              "<QUALIFIER NAME=\"Key\" TYPE=\"boolean\" OVERRIDABLE=\"false\" TOINSTANCE=\"true\">"
              "<VALUE>TRUE</VALUE></QUALIFIER></PROPERTY>"
              "<PROPERTY.ARRAY NAME=\"States\" TYPE=\"uint16\" ARRAYSIZE=\"4\" "
              "CLASSORIGIN=\"T_Thing\"></PROPERTY.ARRAY>"
              "<PROPERTY.REFERENCE NAME=\"Peer\" REFERENCECLASS=\"T_Other\"></PROPERTY.REFERENCE>"
              "</CLASS>");
}

std::string classXml(const ObjectXmlOptions& options) {
    std::string xml;
    beginClassElement(xml, sampleClass(), options);
    endClassElement(xml);
    return xml;
}

TEST(CimXmlWriter, OptionsLeavePartsOut) {
    ObjectXmlOptions options;
    options.localOnly = true;
    std::string xml = classXml(options);
    EXPECT_EQ(xml.find("Note"), std::string::npos);
    EXPECT_EQ(xml.find("\"Id\""), std::string::npos);
    EXPECT_NE(xml.find("Version"), std::string::npos);
    EXPECT_NE(xml.find("States"), std::string::npos);

    options = ObjectXmlOptions();
    options.includeQualifiers = false;
    options.includeClassOrigin = false;
    Array<CIMName> names;
    names.append(CIMName("ID"));
    names.append(CIMName("NoSuch"));
    options.propertyList.set(names);
    xml = classXml(options);
    EXPECT_EQ(xml,
              "<CLASS NAME=\"T_Thing\" SUPERCLASS=\"T_Base\"><PROPERTY NAME=\"Id\" TYPE=\"string\" "
              "PROPAGATED=\"true\"></PROPERTY></CLASS>");

    options.propertyList.set(Array<CIMName>());
    xml = classXml(options);
    EXPECT_EQ(xml, "<CLASS NAME=\"T_Thing\" SUPERCLASS=\"T_Base\"></CLASS>");
}

TEST(CimXmlWriter, NamedInstances) {
    CIMInstance instance(CIMName("C"));
    instance.addProperty(CIMProperty(CIMName("k"), CIMValue(Uint8(1))));
    instance.setPath(CIMObjectPath("C.k=1"));
    std::string xml;
    appendNamedInstance(xml, instance);
    EXPECT_EQ(xml,
              "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"C\"><KEYBINDING NAME=\"k\">"
              "<KEYVALUE VALUETYPE=\"numeric\">1</KEYVALUE></KEYBINDING></INSTANCENAME>"
              "<INSTANCE CLASSNAME=\"C\"><PROPERTY NAME=\"k\" TYPE=\"uint8\"><VALUE>1</VALUE>"
              "</PROPERTY></INSTANCE></VALUE.NAMEDINSTANCE>\n");
}

const std::string kCallBegin =
    "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\">"
    "<MESSAGE ID=\"4\" PROTOCOLVERSION=\"1.0\"><SIMPLEREQ>";
const std::string kPlaceAndClass =
    "<LOCALNAMESPACEPATH><NAMESPACE NAME=\"root\"/><NAMESPACE NAME=\"cimv2\"/>"
    "</LOCALNAMESPACEPATH><IPARAMVALUE NAME=\"ClassName\"><CLASSNAME NAME=\"CIM_X\"/>"
    "</IPARAMVALUE>";
const std::string kCallEnd = "</IMETHODCALL></SIMPLEREQ></MESSAGE></CIM>\n";

std::string flagXml(const std::string& name, const std::string& value) {
    return "<IPARAMVALUE NAME=\"" + name + "\"><VALUE>" + value + "</VALUE></IPARAMVALUE>";
}

TEST(CimXmlWriter, GetClassRequest) {
    EXPECT_EQ(
        encodeGetClassRequest("4", "/root/cimv2", "CIM_X", false, true, false, CIMPropertyList()),
        kCallBegin + "<IMETHODCALL NAME=\"GetClass\">" + kPlaceAndClass +
            flagXml("LocalOnly", "FALSE") + flagXml("IncludeQualifiers", "TRUE") +
            flagXml("IncludeClassOrigin", "FALSE") + kCallEnd);
}

TEST(CimXmlWriter, EnumerateInstancesRequest) {
    Array<CIMName> names;
    names.append(CIMName("A"));
    names.append(CIMName("B"));
    EXPECT_EQ(encodeEnumerateInstancesRequest("4", "root/cimv2", "CIM_X", true, false, false, true,
                                              CIMPropertyList(names)),
              kCallBegin + "<IMETHODCALL NAME=\"EnumerateInstances\">" + kPlaceAndClass +
                  flagXml("LocalOnly", "FALSE") + flagXml("DeepInheritance", "TRUE") +
                  flagXml("IncludeQualifiers", "FALSE") + flagXml("IncludeClassOrigin", "TRUE") +
                  "<IPARAMVALUE NAME=\"PropertyList\"><VALUE.ARRAY><VALUE>A</VALUE><VALUE>B</VALUE>"
                  "</VALUE.ARRAY></IPARAMVALUE>" +
                  kCallEnd);
}

TEST(CimXmlWriter, AnEmptyPropertyListIsNotNull) {
    EXPECT_NE(
        encodeGetClassRequest("4", "root", "C", true, true, true, CIMPropertyList(Array<CIMName>()))
            .find("<IPARAMVALUE NAME=\"PropertyList\"><VALUE.ARRAY></VALUE.ARRAY>"),
        std::string::npos);
}

TEST(CimXmlWriter, AnAnswerWithAnError) {
    std::string xml;
    beginResponse(xml, "a\"b", "GetClass");
    appendError(xml, 6, "no <X>");
    endResponse(xml);
    EXPECT_EQ(xml,
              "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n<CIM CIMVERSION=\"2.0\" "
              "DTDVERSION=\"2.0\"><MESSAGE ID=\"a&quot;b\" PROTOCOLVERSION=\"1.0\"><SIMPLERSP>"
              "<IMETHODRESPONSE NAME=\"GetClass\"><ERROR CODE=\"6\" DESCRIPTION=\"no &lt;X&gt;\"/>"
              "</IMETHODRESPONSE></SIMPLERSP></MESSAGE></CIM>\n");
}

TEST(CimXmlWriter, TheDecoderReadsWhatIsWritten) {
    CIMInstance inner(CIMName("T_In"));
    inner.addProperty(CIMProperty(CIMName("A"), CIMValue(String("<&\t\n>"))));
    CIMInstance instance(CIMName("T_Thing"));
    instance.addProperty(
        CIMProperty(CIMName("Text"), CIMValue(String("a\t\"b\"\r\nc\xE2\x82\xAC"))));
    instance.addProperty(CIMProperty(CIMName("Real"), CIMValue(Real64(0.1))));
    instance.addProperty(CIMProperty(CIMName("Single"), CIMValue(Real32(0.1F))));
    instance.addProperty(CIMProperty(CIMName("Path"), CIMValue(CIMObjectPath("root/x:C.k=\"v\""))));
    instance.addProperty(CIMProperty(CIMName("In"), CIMValue(inner)));
    instance.setPath(CIMObjectPath("T_Thing.Id=\"1\""));
    std::string xml;
    beginResponse(xml, "7", "EnumerateInstances");
    beginReturnValue(xml);
    appendNamedInstance(xml, instance);
    endReturnValue(xml);
    endResponse(xml);

    MemorySource source(xml);
    const Array<CIMInstance> read = decodeEnumerateInstancesResponse(source, "7");
    ASSERT_EQ(read.size(), 1U);
    const CIMConstInstance copy(read[0]);
    ASSERT_EQ(copy.getPropertyCount(), 5U);
    EXPECT_EQ(utf8(copy.getProperty(0).getValue().toString()), "a\t\"b\"\r\nc\xE2\x82\xAC");
    Real64 real = 0;
    copy.getProperty(1).getValue().get(real);
    EXPECT_EQ(real, 0.1);
    Real32 single = 0;
    copy.getProperty(2).getValue().get(single);
    EXPECT_EQ(single, 0.1F);
    EXPECT_EQ(utf8(copy.getProperty(3).getValue().toString()), "root/x:C.k=\"v\"");
    CIMInstance innerCopy;
    copy.getProperty(4).getValue().get(innerCopy);
    EXPECT_EQ(utf8(CIMConstInstance(innerCopy).getProperty(0).getValue().toString()), "<&\t\n>");
    EXPECT_EQ(utf8(copy.getPath().toString()), "T_Thing.Id=\"1\"");
}

}  // namespace
}  // namespace Pegasus
