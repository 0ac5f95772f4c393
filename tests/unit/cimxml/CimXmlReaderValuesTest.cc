// Values in answers: which text of which element becomes which value, and which fail the answer.

#include <Pegasus/Client/ClientExceptions.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "ResponseText.h"
#include "xml/CimXmlReader.h"
#include "xml/MemorySource.h"

namespace Pegasus {
namespace {

using namespace std::string_literals;

std::string utf8(const String& text) {
    return std::string(text.getCString());
}

Array<CIMInstance> decode(const std::string& text) {
    MemorySource source(text);
    return decodeEnumerateInstancesResponse(source, "7");
}

// The only property of the only instance, given as XML.
CIMConstProperty property(const std::string& xml) {
    const Array<CIMInstance> instances = decode(instancesText(instanceXml(xml)));
    EXPECT_EQ(instances.size(), 1U);
    EXPECT_EQ(instances[0].getPropertyCount(), 1U);
    return CIMConstInstance(instances[0]).getProperty(0);
}

CIMValue scalar(const std::string& type, const std::string& content) {
    return property("<PROPERTY NAME=\"P\" TYPE=\"" + type + "\">" + content + "</PROPERTY>")
        .getValue();
}

CIMValue array(const std::string& type, const std::string& content) {
    return property("<PROPERTY.ARRAY NAME=\"P\" TYPE=\"" + type + "\">" + content +
                    "</PROPERTY.ARRAY>")
        .getValue();
}

// The message of the exception that refuses one property.
std::string refusal(const std::string& xml) {
    try {
        decode(instancesText(instanceXml(xml)));
    } catch (const CIMClientXmlException& error) {
        return utf8(error.getMessage());
    }
    ADD_FAILURE() << "accepted: " << xml;
    return "";
}

bool contains(const std::string& text, const std::string& part) {
    return text.find(part) != std::string::npos;
}

struct ScalarCase {
    std::string type;
    std::string content;
    CIMType cimType;
    bool isNull;
    std::string text;
};

class AcceptedScalar : public testing::TestWithParam<ScalarCase> {};

TEST_P(AcceptedScalar, HasTypeAndText) {
    const ScalarCase& expected = GetParam();
    const CIMValue value = scalar(expected.type, expected.content);
    EXPECT_EQ(value.getType(), expected.cimType);
    EXPECT_FALSE(value.isArray());
    EXPECT_EQ(value.isNull(), expected.isNull);
    EXPECT_EQ(utf8(value.toString()), expected.text);
}

const ScalarCase kScalars[] = {
    {"boolean", "<VALUE>TRUE</VALUE>", CIMTYPE_BOOLEAN, false, "TRUE"},
    {"boolean", "<VALUE> false </VALUE>", CIMTYPE_BOOLEAN, false, "FALSE"},
    {"uint8", "<VALUE>255</VALUE>", CIMTYPE_UINT8, false, "255"},
    {"sint8", "<VALUE>-128</VALUE>", CIMTYPE_SINT8, false, "-128"},
    {"uint16", "<VALUE>0xffff</VALUE>", CIMTYPE_UINT16, false, "65535"},
    {"sint16", "<VALUE>-32768</VALUE>", CIMTYPE_SINT16, false, "-32768"},
    {"uint32", "<VALUE> 4294967295\n</VALUE>", CIMTYPE_UINT32, false, "4294967295"},
    {"sint32", "<VALUE>-2147483648</VALUE>", CIMTYPE_SINT32, false, "-2147483648"},
    {"uint64", "<VALUE>18446744073709551615</VALUE>", CIMTYPE_UINT64, false,
     "18446744073709551615"},
    {"sint64", "<VALUE>-9223372036854775808</VALUE>", CIMTYPE_SINT64, false,
     "-9223372036854775808"},
    {"real32", "<VALUE>0.1</VALUE>", CIMTYPE_REAL32, false, "1.0000000149011612e-01"},
    {"real64", "<VALUE>1.5</VALUE>", CIMTYPE_REAL64, false, "1.5000000000000000e+00"},
    {"real64", "<VALUE>2</VALUE>", CIMTYPE_REAL64, false, "2.0000000000000000e+00"},
    {"char16", "<VALUE>&#8364;</VALUE>", CIMTYPE_CHAR16, false, "\\x20AC"},
    {"char16", "<VALUE>A</VALUE>", CIMTYPE_CHAR16, false, "A"},
    {"datetime", "<VALUE>20261121104314.000000+000</VALUE>", CIMTYPE_DATETIME, false,
     "20261121104314.000000+000"},
    {"datetime", "<VALUE/>", CIMTYPE_DATETIME, false, "00000000000000.000000:000"},
    {"datetime", "<VALUE> </VALUE>", CIMTYPE_DATETIME, false, "00000000000000.000000:000"},
    {"string", "<VALUE>text</VALUE>", CIMTYPE_STRING, false, "text"},
    {"string", "<VALUE> \r\n\ttwo  words \n</VALUE>", CIMTYPE_STRING, false, "two  words"},
    {"string", "<VALUE/>", CIMTYPE_STRING, false, ""},
    {"string", "<VALUE></VALUE>", CIMTYPE_STRING, false, ""},
    {"string", "<VALUE>  </VALUE>", CIMTYPE_STRING, false, ""},
    {"string", "<VALUE><![CDATA[ <b> ]]></VALUE>", CIMTYPE_STRING, false, " <b> "},
    {"string", "<VALUE>\n <![CDATA[ x ]]> \n</VALUE>", CIMTYPE_STRING, false, " x "},
    {"string", "<VALUE> a <![CDATA[ b ]]> c </VALUE>", CIMTYPE_STRING, false, "a  b  c"},
    {"string", "<VALUE><![CDATA[]]></VALUE>", CIMTYPE_STRING, false, ""},
    {"string", "<VALUE><![CDATA[ a]]><!--x--><![CDATA[b ]]></VALUE>", CIMTYPE_STRING, false,
     " ab "},
    {"string", "<VALUE>one<!-- -->two<?p?>three</VALUE>", CIMTYPE_STRING, false, "onetwothree"},
    {"string", "<VALUE>&lt;a&gt; &amp;&quot;&apos;&#x20AC;</VALUE>", CIMTYPE_STRING, false,
     "<a> &\"'\xE2\x82\xAC"},
    {"string", "<VALUE>1&#10;2&#9;3</VALUE>", CIMTYPE_STRING, false, "1\n2\t3"},
    {"string", "<VALUE>a&#1;b&#31;c&#127;</VALUE>", CIMTYPE_STRING, false,
     "a\x01"s + "b\x1F"s + "c\x7F"},
    {"string", "<VALUE>caf\xC3\xA9 \xF0\x90\x8D\x88</VALUE>", CIMTYPE_STRING, false,
     "caf\xC3\xA9 \xF0\x90\x8D\x88"},
    {"string", "<VALUE xml:lang=\"en\" TYPE=\"string\" OTHER=\"\">x</VALUE>", CIMTYPE_STRING, false,
     "x"},
    {"string", "", CIMTYPE_STRING, true, ""},
    {"uint16", "", CIMTYPE_UINT16, true, ""},
    {"datetime", "\n", CIMTYPE_DATETIME, true, ""},
};

INSTANTIATE_TEST_SUITE_P(CimXmlReader, AcceptedScalar, testing::ValuesIn(kScalars));

struct RefusedCase {
    std::string type;
    std::string content;
    std::string part;  // of the message
};

class RefusedScalar : public testing::TestWithParam<RefusedCase> {};

TEST_P(RefusedScalar, NamesClassPropertyAndPlace) {
    const std::string message = refusal("<PROPERTY NAME=\"Speed\" TYPE=\"" + GetParam().type +
                                        "\">" + GetParam().content + "</PROPERTY>");
    EXPECT_TRUE(contains(message, GetParam().part)) << message;
    EXPECT_TRUE(contains(message, "; in property Speed of class T_Thing")) << message;
    EXPECT_TRUE(contains(message, "; at byte ")) << message;
}

const RefusedCase kRefused[] = {
    {"boolean", "<VALUE/>", "\"\" is no boolean"},
    {"boolean", "<VALUE>1</VALUE>", "\"1\" is no boolean"},
    {"uint8", "<VALUE>256</VALUE>", "\"256\" is no uint8"},
    {"uint8", "<VALUE>-1</VALUE>", "\"-1\" is no uint8"},
    {"sint8", "<VALUE>128</VALUE>", "\"128\" is no sint8"},
    {"uint16", "<VALUE>unknown</VALUE>", "\"unknown\" is no uint16"},
    {"uint16", "<VALUE></VALUE>", "\"\" is no uint16"},
    {"uint16", "<VALUE>65536</VALUE>", "\"65536\" is no uint16"},
    {"sint16", "<VALUE>1.0</VALUE>", "\"1.0\" is no sint16"},
    {"uint32", "<VALUE>1010b</VALUE>", "\"1010b\" is no uint32"},
    {"sint32", "<VALUE>2147483648</VALUE>", "is no sint32"},
    {"uint64", "<VALUE>18446744073709551616</VALUE>", "is no uint64"},
    {"sint64", "<VALUE>9223372036854775808</VALUE>", "is no sint64"},
    {"real32", "<VALUE>INF</VALUE>", "\"INF\" is no real32"},
    {"real64", "<VALUE>NaN</VALUE>", "\"NaN\" is no real64"},
    {"real64", "<VALUE></VALUE>", "\"\" is no real64"},
    {"char16", "<VALUE>AB</VALUE>", "\"AB\" is no char16"},
    {"char16", "<VALUE/>", "\"\" is no char16"},
    {"datetime", "<VALUE>20180911124613.128***:000</VALUE>", "is no datetime"},
    {"datetime", "<VALUE>today</VALUE>", "\"today\" is no datetime"},
    {"string", "<VALUE>1</VALUE><VALUE>2</VALUE>", "\"VALUE\" may not stand here"},
    {"string", "<VALUE.ARRAY/>", "\"VALUE.ARRAY\" may not stand here"},
    {"string", "<VALUE.NULL/>", "\"VALUE.NULL\" may not stand here"},
    {"string", "<VALUE><b/></VALUE>", "\"b\" may not stand here"},
    {"string", "text", "\"text\" stands between elements"},
    {"string", "<OTHER/>", "\"OTHER\" may not stand here"},
    {"", "<VALUE>1</VALUE>", "TYPE is \"\""},
    {"uint128", "<VALUE>1</VALUE>", "TYPE is \"uint128\""},
    {"STRING", "<VALUE>1</VALUE>", "TYPE is \"STRING\""},
    {"reference", "<VALUE>1</VALUE>", "TYPE is \"reference\""},
    {"string\" EmbeddedObject=\"thing", "", "EmbeddedObject is \"thing\""},
    {"uint8\" EmbeddedObject=\"instance", "", "with type \"uint8\""},
    {"string\" PROPAGATED=\"yes", "", "PROPAGATED of element \"PROPERTY\" is \"yes\""},
    {"string\" CLASSORIGIN=\"a b", "", "CLASSORIGIN of element \"PROPERTY\" is \"a b\""},
};

INSTANTIATE_TEST_SUITE_P(CimXmlReader, RefusedScalar, testing::ValuesIn(kRefused));

TEST(CimXmlReaderValues, ThePlaceIsThatOfTheValue) {
    const std::string text = instancesText(
        instanceXml("<PROPERTY NAME=\"P\" TYPE=\"uint8\"><VALUE>x</VALUE></PROPERTY>"));
    const std::string place = "; at byte " + std::to_string(text.find("<VALUE>"));
    try {
        decode(text);
        FAIL();
    } catch (const CIMClientXmlException& error) {
        EXPECT_TRUE(contains(utf8(error.getMessage()), place)) << error.getMessage();
    }
}

struct ArrayCase {
    std::string type;
    std::string content;
    bool isNull;
    Uint32 size;
    std::string text;
};

class AcceptedArray : public testing::TestWithParam<ArrayCase> {};

TEST_P(AcceptedArray, HasSizeAndText) {
    const CIMValue value = array(GetParam().type, GetParam().content);
    EXPECT_TRUE(value.isArray());
    EXPECT_EQ(value.isNull(), GetParam().isNull);
    EXPECT_EQ(value.getArraySize(), GetParam().size);
    EXPECT_EQ(utf8(value.toString()), GetParam().text);
}

const ArrayCase kArrays[] = {
    {"uint16", "<VALUE.ARRAY><VALUE>1</VALUE><VALUE>2</VALUE></VALUE.ARRAY>", false, 2, "1 2 "},
    {"uint16", "<VALUE.ARRAY>\n<VALUE> 0x10 </VALUE>\n</VALUE.ARRAY>", false, 1, "16 "},
    {"uint16", "<VALUE.ARRAY/>", false, 0, ""},
    {"uint16", "<VALUE.ARRAY></VALUE.ARRAY>", false, 0, ""},
    {"uint16", "", true, 0, ""},
    {"uint16", "<VALUE.ARRAY><VALUE.NULL/><VALUE>7</VALUE></VALUE.ARRAY>", false, 2, "0 7 "},
    {"boolean", "<VALUE.ARRAY><VALUE>true</VALUE><VALUE.NULL/></VALUE.ARRAY>", false, 2,
     "TRUE FALSE "},
    {"string", "<VALUE.ARRAY><VALUE>a</VALUE><VALUE/><VALUE.NULL></VALUE.NULL></VALUE.ARRAY>",
     false, 3, "a   "},
    {"real64", "<VALUE.ARRAY><VALUE>1.5</VALUE></VALUE.ARRAY>", false, 1,
     "1.5000000000000000e+00 "},
    {"datetime", "<VALUE.ARRAY><VALUE/></VALUE.ARRAY>", false, 1, "00000000000000.000000:000 "},
    {"char16", "<VALUE.ARRAY><VALUE>a</VALUE><VALUE>b</VALUE></VALUE.ARRAY>", false, 2, "a b "},
};

INSTANTIATE_TEST_SUITE_P(CimXmlReader, AcceptedArray, testing::ValuesIn(kArrays));

TEST(CimXmlReaderValues, ArraysOfEveryNumericType) {
    for (const char* type :
         {"uint8", "sint8", "uint16", "sint16", "uint32", "sint32", "uint64", "sint64"}) {
        const CIMValue value = array(type, "<VALUE.ARRAY><VALUE>100</VALUE></VALUE.ARRAY>");
        EXPECT_EQ(utf8(value.toString()), "100 ") << type;
        EXPECT_STREQ(cimTypeToString(value.getType()), type);
    }
}

TEST(CimXmlReaderValues, ArraysRefuse) {
    const std::string begin = "<PROPERTY.ARRAY NAME=\"P\" TYPE=\"uint8\"";
    const std::string end = "</PROPERTY.ARRAY>";
    EXPECT_TRUE(contains(refusal(begin + "><VALUE>1</VALUE>" + end), "\"VALUE\" may not"));
    EXPECT_TRUE(contains(refusal(begin + "><VALUE.ARRAY/><VALUE.ARRAY/>" + end), "may not"));
    EXPECT_TRUE(contains(refusal(begin + "><VALUE.ARRAY><VALUE>x</VALUE></VALUE.ARRAY>" + end),
                         "no uint8"));
    EXPECT_TRUE(contains(refusal(begin + "><VALUE.ARRAY><OTHER/></VALUE.ARRAY>" + end),
                         "expected VALUE or VALUE.NULL"));
    EXPECT_TRUE(
        contains(refusal(begin + "><VALUE.ARRAY><VALUE.NULL>1</VALUE.NULL></VALUE.ARRAY>" + end),
                 "stands between"));
    EXPECT_TRUE(contains(refusal(begin + " ARRAYSIZE=\"x\">" + end), "ARRAYSIZE is \"x\""));
    EXPECT_TRUE(contains(refusal(begin + " ARRAYSIZE=\"-1\">" + end), "ARRAYSIZE is \"-1\""));
}

TEST(CimXmlReaderValues, TheDeclaredArraySizeIsKept) {
    EXPECT_EQ(
        property("<PROPERTY.ARRAY NAME=\"P\" TYPE=\"uint8\" ARRAYSIZE=\"4\"/>").getArraySize(), 4U);
    EXPECT_EQ(property("<PROPERTY.ARRAY NAME=\"P\" TYPE=\"uint8\"/>").getArraySize(), 0U);
}

std::string reference(const std::string& path) {
    return utf8(property("<PROPERTY.REFERENCE NAME=\"P\" REFERENCECLASS=\"T_Other\">" + path +
                         "</PROPERTY.REFERENCE>")
                    .getValue()
                    .toString());
}

const std::string kInstanceName =
    "<INSTANCENAME CLASSNAME=\"T_Other\"><KEYBINDING NAME=\"K\"><KEYVALUE>v</KEYVALUE></KEYBINDING>"
    "</INSTANCENAME>";
const std::string kLocalPath =
    "<LOCALNAMESPACEPATH><NAMESPACE NAME=\"root\"/><NAMESPACE NAME=\"cimv2\"/>"
    "</LOCALNAMESPACEPATH>";
const std::string kHostPath = "<NAMESPACEPATH><HOST>h</HOST>" + kLocalPath + "</NAMESPACEPATH>";

std::string inReference(const std::string& xml) {
    return "<VALUE.REFERENCE>" + xml + "</VALUE.REFERENCE>";
}

TEST(CimXmlReaderValues, ReferencesOfEveryKind) {
    EXPECT_EQ(reference(inReference(kInstanceName)), "T_Other.K=\"v\"");
    EXPECT_EQ(reference(inReference("<LOCALINSTANCEPATH>" + kLocalPath + kInstanceName +
                                    "</LOCALINSTANCEPATH>")),
              "root/cimv2:T_Other.K=\"v\"");
    EXPECT_EQ(
        reference(inReference("<INSTANCEPATH>" + kHostPath + kInstanceName + "</INSTANCEPATH>")),
        "//h/root/cimv2:T_Other.K=\"v\"");
    EXPECT_EQ(reference(inReference("<CLASSNAME NAME=\"T_Other\"/>")), "T_Other");
    EXPECT_EQ(reference(inReference("<LOCALCLASSPATH>" + kLocalPath +
                                    "<CLASSNAME NAME=\"T_Other\"/></LOCALCLASSPATH>")),
              "root/cimv2:T_Other");
    EXPECT_EQ(reference(inReference("<CLASSPATH>" + kHostPath +
                                    "<CLASSNAME NAME=\"T_Other\"/></CLASSPATH>")),
              "//h/root/cimv2:T_Other");
}

TEST(CimXmlReaderValues, AnEmptyReferencePropertyIsNull) {
    const CIMConstProperty null = property("<PROPERTY.REFERENCE NAME=\"P\"/>");
    EXPECT_TRUE(null.getValue().isNull());
    EXPECT_EQ(null.getType(), CIMTYPE_REFERENCE);
    EXPECT_FALSE(null.isArray());
    EXPECT_TRUE(null.getReferenceClassName().isNull());
}

TEST(CimXmlReaderValues, TheReferenceClassIsKept) {
    const CIMConstProperty given =
        property("<PROPERTY.REFERENCE NAME=\"P\" REFERENCECLASS=\"T_Other\"/>");
    EXPECT_EQ(utf8(given.getReferenceClassName().getString()), "T_Other");
}

TEST(CimXmlReaderValues, ArraysOfReferences) {
    const CIMValue value =
        property("<PROPERTY.REFARRAY NAME=\"P\"><VALUE.REFARRAY>" + inReference(kInstanceName) +
                 "<VALUE.NULL/></VALUE.REFARRAY></PROPERTY.REFARRAY>")
            .getValue();
    EXPECT_EQ(value.getType(), CIMTYPE_REFERENCE);
    Array<CIMObjectPath> paths;
    value.get(paths);
    ASSERT_EQ(paths.size(), 2U);
    EXPECT_EQ(utf8(paths[0].toString()), "T_Other.K=\"v\"");
    EXPECT_TRUE(paths[1].getClassName().isNull());
}

TEST(CimXmlReaderValues, ReferencesRefuse) {
    const auto refuse = [](const std::string& xml) {
        return refusal("<PROPERTY.REFERENCE NAME=\"P\">" + xml + "</PROPERTY.REFERENCE>");
    };
    EXPECT_TRUE(contains(refuse("<VALUE>x</VALUE>"), "\"VALUE\" may not"));
    EXPECT_TRUE(contains(refuse("<VALUE.REFERENCE/>"), "ends too early"));
    EXPECT_TRUE(contains(refuse(inReference("<OTHER/>")), "\"OTHER\" may not"));
    EXPECT_TRUE(contains(refuse(inReference(kInstanceName + kInstanceName)), "may not"));
    EXPECT_TRUE(contains(
        refuse(inReference("<LOCALINSTANCEPATH>" + kInstanceName + "</LOCALINSTANCEPATH>")),
        "expected LOCALNAMESPACEPATH"));
    EXPECT_TRUE(
        contains(refuse(inReference("<LOCALCLASSPATH><LOCALNAMESPACEPATH/><CLASSNAME NAME=\"C\"/>"
                                    "</LOCALCLASSPATH>")),
                 "namespace \"\" has no legal name"));
    EXPECT_TRUE(
        contains(refuse(inReference("<CLASSPATH><NAMESPACEPATH><HOST>a b</HOST>" + kLocalPath +
                                    "</NAMESPACEPATH><CLASSNAME NAME=\"C\"/></CLASSPATH>")),
                 "host \"a b\""));
    EXPECT_TRUE(contains(refuse(inReference("<CLASSNAME NAME=\"1\"/>")), "is \"1\""));
    EXPECT_TRUE(contains(refuse(inReference("<CLASSNAME/>")), "no attribute NAME"));
}

std::string keyOf(const std::string& keyValue) {
    return reference(inReference("<INSTANCENAME CLASSNAME=\"C\"><KEYBINDING NAME=\"k\">" +
                                 keyValue + "</KEYBINDING></INSTANCENAME>"));
}

TEST(CimXmlReaderValues, KeysOfEveryType) {
    EXPECT_EQ(keyOf("<KEYVALUE>a\"b</KEYVALUE>"), "C.k=\"a\\\"b\"");
    EXPECT_EQ(keyOf("<KEYVALUE VALUETYPE=\"string\" TYPE=\"\"> x </KEYVALUE>"), "C.k=\"x\"");
    EXPECT_EQ(keyOf("<KEYVALUE VALUETYPE=\"string\" TYPE=\"string\"/>"), "C.k=\"\"");
    EXPECT_EQ(keyOf("<KEYVALUE VALUETYPE=\"numeric\" TYPE=\"uint8\"> 7 </KEYVALUE>"), "C.k=7");
    EXPECT_EQ(keyOf("<KEYVALUE VALUETYPE=\"numeric\">0x1F</KEYVALUE>"), "C.k=0x1F");
    EXPECT_EQ(keyOf("<KEYVALUE VALUETYPE=\"numeric\">-5</KEYVALUE>"), "C.k=-5");
    EXPECT_EQ(keyOf("<KEYVALUE VALUETYPE=\"boolean\">true</KEYVALUE>"), "C.k=TRUE");
    EXPECT_EQ(keyOf("<KEYVALUE VALUETYPE=\"boolean\">FALSE</KEYVALUE>"), "C.k=FALSE");
    EXPECT_EQ(keyOf(inReference(kInstanceName)), "C.k=\"T_Other.K=\\\"v\\\"\"");
}

TEST(CimXmlReaderValues, InstanceNamesWithoutKeyBindings) {
    EXPECT_EQ(reference(inReference("<INSTANCENAME CLASSNAME=\"C\"/>")), "C");
    const CIMValue value = property(
                               "<PROPERTY.REFERENCE NAME=\"P\"><VALUE.REFERENCE><INSTANCENAME "
                               "CLASSNAME=\"C\"><KEYVALUE>v</KEYVALUE></INSTANCENAME>"
                               "</VALUE.REFERENCE></PROPERTY.REFERENCE>")
                               .getValue();
    CIMObjectPath path;
    value.get(path);
    ASSERT_EQ(path.getKeyBindings().size(), 1U);
    EXPECT_TRUE(path.getKeyBindings()[0].getName().isNull());
    EXPECT_EQ(utf8(path.getKeyBindings()[0].getValue()), "v");
}

/// A reference to an instance whose key is a reference, and so on.
std::string referenceThrough(int count, const std::string& innermost) {
    std::string path = innermost;
    for (int i = 0; i < count; ++i) {
        path = "<INSTANCENAME CLASSNAME=\"C\">" + inReference(path) + "</INSTANCENAME>";
    }
    return inReference(path);
}

std::string instanceNameWithKey(const std::string& text) {
    return "<INSTANCENAME CLASSNAME=\"D\"><KEYVALUE>" + text + "</KEYVALUE></INSTANCENAME>";
}

// Each one in another doubles the quotation marks and backslashes of its text.
TEST(CimXmlReaderValues, ReferencesInKeysAreBounded) {
    const auto refuse = [](const std::string& reference) {
        return refusal("<PROPERTY.REFERENCE NAME=\"P\">" + reference + "</PROPERTY.REFERENCE>");
    };
    const std::string instance = "<INSTANCENAME CLASSNAME=\"D\"/>";
    EXPECT_EQ(reference(referenceThrough(2, instance)), "C.=\"C.=\\\"D\\\"\"");
    EXPECT_EQ(reference(referenceThrough(4, instance)).size(), 43U);
    EXPECT_TRUE(contains(refuse(referenceThrough(5, instance)), "too many references"));
    EXPECT_TRUE(contains(refuse(referenceThrough(20, instance)), "too many references"));

    // D.="..." has five characters more than its text.
    const std::string longest(65536 - 5, 'x');
    EXPECT_EQ(reference(referenceThrough(1, instanceNameWithKey(longest))).size(), 65536 + 5 + 2U);
    EXPECT_TRUE(contains(refuse(referenceThrough(1, instanceNameWithKey(longest + "x"))),
                         "reference is too long"));
    EXPECT_EQ(reference(referenceThrough(0, instanceNameWithKey(longest + "x"))).size(), 65537U);
}

TEST(CimXmlReaderValues, KeysRefuse) {
    const auto refuse = [](const std::string& keys) {
        return refusal(
            "<PROPERTY.REFERENCE NAME=\"P\"><VALUE.REFERENCE><INSTANCENAME "
            "CLASSNAME=\"C\">" +
            keys + "</INSTANCENAME></VALUE.REFERENCE></PROPERTY.REFERENCE>");
    };
    const std::string begin = "<KEYBINDING NAME=\"k\">";
    const std::string end = "</KEYBINDING>";
    EXPECT_TRUE(contains(refuse(begin + "<KEYVALUE VALUETYPE=\"numeric\">x</KEYVALUE>" + end),
                         "\"x\" is no number"));
    EXPECT_TRUE(
        contains(refuse(begin + "<KEYVALUE VALUETYPE=\"boolean\"/>" + end), "\"\" is no boolean"));
    EXPECT_TRUE(
        contains(refuse(begin + "<KEYVALUE VALUETYPE=\"x\"/>" + end), "VALUETYPE is \"x\""));
    EXPECT_TRUE(contains(refuse(begin + end), "ends too early"));
    EXPECT_TRUE(contains(refuse(begin + "<KEYVALUE/><KEYVALUE/>" + end), "may not"));
    EXPECT_TRUE(contains(refuse(begin + "<VALUE/>" + end), "expected KEYBINDING, KEYVALUE"));
    EXPECT_TRUE(
        contains(refuse(begin + "<KEYVALUE/>" + end + "<KEYBINDING NAME=\"K\"><KEYVALUE/>" + end),
                 "given twice"));
    EXPECT_TRUE(contains(refuse("<KEYBINDING><KEYVALUE/>" + end), "no attribute NAME"));
}

const std::string kEmbedded =
    "&lt;INSTANCE CLASSNAME=\"T_In\"&gt;&lt;PROPERTY NAME=\"A\" TYPE=\"string\"&gt;&lt;VALUE&gt;x "
    "&amp;amp; y&lt;/VALUE&gt;&lt;/PROPERTY&gt;&lt;/INSTANCE&gt;";

TEST(CimXmlReaderValues, EmbeddedInstances) {
    const CIMValue value =
        scalar("string\" EmbeddedObject=\"instance", "<VALUE>\n" + kEmbedded + "\n</VALUE>");
    EXPECT_EQ(value.getType(), CIMTYPE_INSTANCE);
    CIMInstance instance;
    value.get(instance);
    EXPECT_EQ(utf8(instance.getClassName().getString()), "T_In");
    ASSERT_EQ(instance.getPropertyCount(), 1U);
    EXPECT_EQ(utf8(instance.getProperty(0).getValue().toString()), "x & y");
    EXPECT_EQ(utf8(value.toString()),
              "<INSTANCE CLASSNAME=\"T_In\"><PROPERTY NAME=\"A\" TYPE=\"string\"><VALUE>x &amp; "
              "y</VALUE></PROPERTY></INSTANCE>");
}

TEST(CimXmlReaderValues, EmbeddedObjectsInCDataAndInCapitals) {
    const CIMValue value =
        scalar("string\" EMBEDDEDOBJECT=\"object",
               "<VALUE><![CDATA[<CLASS NAME=\"T_In\" SUPERCLASS=\"T_Up\"/>]]></VALUE>");
    EXPECT_EQ(value.getType(), CIMTYPE_OBJECT);
    CIMObject object;
    value.get(object);
    EXPECT_TRUE(object.isClass());
    EXPECT_EQ(utf8(object.getClassName().getString()), "T_In");
}

TEST(CimXmlReaderValues, AnEmbeddedObjectMayBeAnInstance) {
    const CIMValue value =
        scalar("string\" EmbeddedObject=\"object", "<VALUE>" + kEmbedded + "</VALUE>");
    EXPECT_EQ(value.getType(), CIMTYPE_OBJECT);
    CIMObject object;
    value.get(object);
    EXPECT_TRUE(object.isInstance());
}

TEST(CimXmlReaderValues, EmbeddedObjectsAreNullWithoutValueAndMayBeArrays) {
    EXPECT_TRUE(scalar("string\" EmbeddedObject=\"instance", "").isNull());
    EXPECT_EQ(scalar("string\" EmbeddedObject=\"instance", "").getType(), CIMTYPE_INSTANCE);
    const CIMValue value = array("string\" EmbeddedObject=\"instance",
                                 "<VALUE.ARRAY><VALUE>" + kEmbedded + "</VALUE></VALUE.ARRAY>");
    EXPECT_EQ(value.getType(), CIMTYPE_INSTANCE);
    EXPECT_EQ(value.getArraySize(), 1U);
}

TEST(CimXmlReaderValues, EmbeddedObjectsRefuse) {
    const auto refuse = [](const std::string& kind, const std::string& text) {
        const std::string message =
            refusal("<PROPERTY NAME=\"Outer\" TYPE=\"string\" EmbeddedObject=\"" + kind +
                    "\"><VALUE><![CDATA[" + text + "]]></VALUE></PROPERTY>");
        EXPECT_TRUE(contains(message, "; in property Outer of class T_Thing")) << message;
        return message;
    };
    EXPECT_TRUE(contains(refuse("instance", "not XML"), "embedded object is faulty (text stands"));
    EXPECT_TRUE(contains(refuse("instance", ""), "expected a root element"));
    EXPECT_TRUE(contains(refuse("instance", "<CLASS NAME=\"C\"/>"), "expected INSTANCE"));
    EXPECT_TRUE(contains(refuse("object", "<OTHER/>"), "expected INSTANCE or CLASS"));
    EXPECT_TRUE(
        contains(refuse("object", "<CLASS NAME=\"C\"/><CLASS NAME=\"C\"/>"), "second root"));
    EXPECT_TRUE(contains(refuse("instance",
                                "<INSTANCE CLASSNAME=\"T_In\"><PROPERTY NAME=\"Inner\" "
                                "TYPE=\"uint8\"><VALUE>x</VALUE></PROPERTY></INSTANCE>"),
                         "\"x\" is no uint8; at byte 63; in property Inner of class T_In)"));
}

TEST(CimXmlReaderValues, EmbeddingIsBounded) {
    const auto embed = [](int levels) {
        std::string xml = "<INSTANCE CLASSNAME=\"T_In\"/>";
        for (int i = 0; i < levels; ++i) {
            std::string escaped;
            for (const char c : xml) {
                escaped += c == '<' ? "&lt;" : c == '&' ? "&amp;" : std::string(1, c);
            }
            xml =
                "<INSTANCE CLASSNAME=\"T_In\"><PROPERTY NAME=\"P\" TYPE=\"string\" "
                "EmbeddedObject=\"instance\"><VALUE>" +
                escaped + "</VALUE></PROPERTY></INSTANCE>";
        }
        return "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"T_In\"/>" + xml +
               "</VALUE.NAMEDINSTANCE>";
    };
    EXPECT_EQ(decode(instancesText(embed(8))).size(), 1U);
    EXPECT_THROW(decode(instancesText(embed(9))), CIMClientXmlException);
}

}  // namespace
}  // namespace Pegasus
