// Answers as a whole: what encloses the result, classes and instances, and which answers fail how.

#include "xml/CimXmlReader.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <Pegasus/Common/CIMFlavor.h>
#include <gtest/gtest.h>

#include <cstddef>
#include <string>

#include "ResponseText.h"
#include "xml/MemorySource.h"

namespace Pegasus {
namespace {

std::string utf8(const String& text) {
    return std::string(text.getCString());
}

CIMClass decodeClass(const std::string& text, std::size_t pieceSize = ~std::size_t{0}) {
    MemorySource source(text, pieceSize);
    return decodeGetClassResponse(source, "7");
}

Array<CIMInstance> decodeInstances(const std::string& text,
                                   std::size_t pieceSize = ~std::size_t{0}) {
    MemorySource source(text, pieceSize);
    return decodeEnumerateInstancesResponse(source, "7");
}

// The message of the CIMClientXmlException that refuses an answer to EnumerateInstances.
std::string refusal(const std::string& text) {
    try {
        decodeInstances(text);
    } catch (const CIMClientXmlException& error) {
        return utf8(error.getMessage());
    }
    ADD_FAILURE() << "accepted: " << text;
    return "";
}

std::string classRefusal(const std::string& content) {
    try {
        decodeClass(classText("<CLASS NAME=\"T_Thing\">" + content + "</CLASS>"));
    } catch (const CIMClientXmlException& error) {
        return utf8(error.getMessage());
    }
    ADD_FAILURE() << "accepted: " << content;
    return "";
}

bool contains(const std::string& text, const std::string& part) {
    return text.find(part) != std::string::npos;
}

std::string replaced(std::string text, const std::string& from, const std::string& to) {
    const std::size_t place = text.find(from);
    EXPECT_NE(place, std::string::npos) << from;
    return text.replace(place, from.size(), to);
}

const std::string kClass =
    "<CLASS NAME=\"T_Thing\" SUPERCLASS=\"T_Base\" >\n"
    "<QUALIFIER NAME=\"Version\" TYPE=\"string\" TOSUBCLASS=\"false\" TRANSLATABLE=\"true\">\n"
    "<VALUE>2.10.0</VALUE>\n</QUALIFIER>\n"
    "<QUALIFIER NAME=\"Abstract\" TYPE=\"boolean\" OVERRIDABLE=\"FALSE\" TOINSTANCE=\"true\" "
    "PROPAGATED=\"true\">\n<VALUE>TRUE</VALUE>\n</QUALIFIER>\n"
    "<PROPERTY NAME=\"Id\" CLASSORIGIN=\"T_Base\" PROPAGATED=\"true\" TYPE=\"string\">\n"
    "<QUALIFIER NAME=\"Key\" TYPE=\"boolean\"><VALUE>true</VALUE></QUALIFIER>\n"
    "<QUALIFIER NAME=\"MaxLen\" TYPE=\"uint32\"><VALUE>64</VALUE></QUALIFIER>\n</PROPERTY>\n"
    "<PROPERTY.ARRAY NAME=\"States\" TYPE=\"uint16\">\n"
    "<QUALIFIER NAME=\"Values\" TYPE=\"string\">\n<VALUE.ARRAY>\n<VALUE>On</VALUE>\n"
    "<VALUE>Off</VALUE>\n</VALUE.ARRAY>\n</QUALIFIER>\n</PROPERTY.ARRAY>\n"
    "<PROPERTY NAME=\"Level\" TYPE=\"sint32\"><VALUE>-3</VALUE></PROPERTY>\n"
    "<PROPERTY.REFERENCE NAME=\"Peer\" REFERENCECLASS=\"T_Other\"/>\n"
    "<METHOD NAME=\"Reset\" TYPE=\"uint32\" CLASSORIGIN=\"T_Base\">\n"
    "<QUALIFIER NAME=\"Description\" TYPE=\"string\"><VALUE>Resets.</VALUE></QUALIFIER>\n"
    "<PARAMETER NAME=\"A\" TYPE=\"uint16\">"
    "<QUALIFIER NAME=\"In\" TYPE=\"boolean\"><VALUE>TRUE</VALUE></QUALIFIER></PARAMETER>\n"
    "<PARAMETER.REFERENCE NAME=\"B\" REFERENCECLASS=\"T_Other\"/>\n"
    "<PARAMETER.ARRAY NAME=\"C\" TYPE=\"string\" ARRAYSIZE=\"2\"/>\n"
    "<PARAMETER.REFARRAY NAME=\"D\"/>\n</METHOD>\n</CLASS>\n";

TEST(CimXmlReader, AClassWithAllItsParts) {
    const CIMClass cimClass = decodeClass(classText(kClass));
    EXPECT_EQ(utf8(cimClass.getClassName().getString()), "T_Thing");
    EXPECT_EQ(utf8(cimClass.getSuperClassName().getString()), "T_Base");
    EXPECT_EQ(cimClass.getQualifierCount(), 2U);
    ASSERT_EQ(cimClass.getPropertyCount(), 4U);

    const CIMConstProperty id = CIMConstClass(cimClass).getProperty(0);
    EXPECT_EQ(utf8(id.getName().getString()), "Id");
    EXPECT_EQ(id.getType(), CIMTYPE_STRING);
    EXPECT_TRUE(id.getValue().isNull());
    EXPECT_EQ(utf8(id.getClassOrigin().getString()), "T_Base");
    EXPECT_TRUE(id.getPropagated());
    ASSERT_EQ(id.getQualifierCount(), 2U);
    EXPECT_EQ(utf8(id.getQualifier(1).getName().getString()), "MaxLen");
    EXPECT_EQ(id.getQualifier(1).getType(), CIMTYPE_UINT32);
    EXPECT_EQ(utf8(id.getQualifier(1).getValue().toString()), "64");

    const CIMConstProperty states = CIMConstClass(cimClass).getProperty(1);
    EXPECT_TRUE(states.isArray());
    EXPECT_EQ(states.getType(), CIMTYPE_UINT16);
    EXPECT_TRUE(states.getClassOrigin().isNull());
    EXPECT_FALSE(states.getPropagated());
    ASSERT_EQ(states.getQualifierCount(), 1U);
    Array<String> values;
    states.getQualifier(0).getValue().get(values);
    ASSERT_EQ(values.size(), 2U);
    EXPECT_EQ(utf8(values[1]), "Off");

    EXPECT_EQ(utf8(CIMConstClass(cimClass).getProperty(2).getValue().toString()), "-3");
    EXPECT_EQ(utf8(CIMConstClass(cimClass).getProperty(3).getReferenceClassName().getString()),
              "T_Other");
}

TEST(CimXmlReader, FlavorsOfQualifiers) {
    const CIMClass cimClass = decodeClass(classText(kClass));
    const CIMConstQualifier version = CIMConstClass(cimClass).getQualifier(0);
    EXPECT_TRUE(version.getFlavor().has(CIMFlavor::OVERRIDABLE));
    EXPECT_FALSE(version.getFlavor().has(CIMFlavor::TOSUBCLASS));
    EXPECT_FALSE(version.getFlavor().has(CIMFlavor::TOINSTANCE));
    EXPECT_TRUE(version.getFlavor().has(CIMFlavor::TRANSLATABLE));
    EXPECT_FALSE(version.getPropagated());
    const CIMConstQualifier abstract = CIMConstClass(cimClass).getQualifier(1);
    EXPECT_FALSE(abstract.getFlavor().has(CIMFlavor::OVERRIDABLE));
    EXPECT_TRUE(abstract.getFlavor().has(CIMFlavor::TOSUBCLASS));
    EXPECT_TRUE(abstract.getFlavor().has(CIMFlavor::TOINSTANCE));
    EXPECT_FALSE(abstract.getFlavor().has(CIMFlavor::TRANSLATABLE));
    EXPECT_TRUE(abstract.getPropagated());
}

TEST(CimXmlReader, AQualifierWithoutValueIsNull) {
    const CIMClass cimClass = decodeClass(
        classText("<CLASS NAME=\"T_Thing\"><QUALIFIER NAME=\"Note\" TYPE=\"string\"/></CLASS>"));
    EXPECT_TRUE(CIMConstClass(cimClass).getQualifier(0).getValue().isNull());
    EXPECT_EQ(CIMConstClass(cimClass).getQualifier(0).getType(), CIMTYPE_STRING);
    EXPECT_TRUE(cimClass.getSuperClassName().isNull());
}

TEST(CimXmlReader, EmbeddedObjectsInAClassHaveTheirType) {
    const CIMClass cimClass = decodeClass(
        classText("<CLASS NAME=\"T_Thing\"><PROPERTY NAME=\"P\" TYPE=\"string\" "
                  "EmbeddedObject=\"instance\"/><PROPERTY.ARRAY NAME=\"Q\" TYPE=\"string\" "
                  "EmbeddedObject=\"object\"/></CLASS>"));
    EXPECT_EQ(CIMConstClass(cimClass).getProperty(0).getType(), CIMTYPE_INSTANCE);
    EXPECT_EQ(CIMConstClass(cimClass).getProperty(1).getType(), CIMTYPE_OBJECT);
}

TEST(CimXmlReader, WithoutReturnValueTheClassIsUninitialized) {
    EXPECT_TRUE(decodeClass(responseText("GetClass", "")).isUninitialized());
}

TEST(CimXmlReader, AReturnValueOfGetClassHoldsOneClass) {
    EXPECT_THROW(decodeClass(classText("")), CIMClientXmlException);
    EXPECT_THROW(decodeClass(classText("<CLASS NAME=\"C\"/><CLASS NAME=\"D\"/>")),
                 CIMClientXmlException);
    EXPECT_THROW(decodeClass(classText("<INSTANCE CLASSNAME=\"C\"/>")), CIMClientXmlException);
}

TEST(CimXmlReader, InstancesKeepTheirOrderAndPath) {
    const std::string members =
        "<QUALIFIER NAME=\"Q\" TYPE=\"string\"/>"
        "<PROPERTY NAME=\"Id\" TYPE=\"string\"><VALUE>x</VALUE></PROPERTY>\n"
        "<PROPERTY.ARRAY NAME=\"States\" TYPE=\"uint16\"/>\n";
    const Array<CIMInstance> instances =
        decodeInstances(instancesText(instanceXml(members, "b") + instanceXml("", "a")));
    ASSERT_EQ(instances.size(), 2U);
    EXPECT_EQ(utf8(instances[0].getClassName().getString()), "T_Thing");
    EXPECT_EQ(utf8(instances[0].getPath().toString()), "T_Thing.Id=\"b\"");
    EXPECT_EQ(instances[0].getPropertyCount(), 2U);
    EXPECT_EQ(instances[0].getQualifierCount(), 1U);
    EXPECT_EQ(instances[0].findProperty("STATES"), 1U);
    EXPECT_EQ(utf8(instances[1].getPath().toString()), "T_Thing.Id=\"a\"");
    EXPECT_EQ(instances[1].getPropertyCount(), 0U);
}

TEST(CimXmlReader, NoInstances) {
    EXPECT_EQ(decodeInstances(responseText("EnumerateInstances", "")).size(), 0U);
    EXPECT_EQ(decodeInstances(instancesText("")).size(), 0U);
    EXPECT_EQ(decodeInstances(responseText("EnumerateInstances", "<IRETURNVALUE/>")).size(), 0U);
}

TEST(CimXmlReader, PiecesOfAnySizeGiveTheSame) {
    const std::string members =
        "<PROPERTY NAME=\"A\" TYPE=\"string\"><VALUE> &lt;\xE2\x82\xAC&#8364; </VALUE></PROPERTY>";
    const std::string text = instancesText(instanceXml(members, "&amp;") + instanceXml(members));
    for (std::size_t pieceSize = 1; pieceSize < 100; ++pieceSize) {
        const Array<CIMInstance> instances = decodeInstances(text, pieceSize);
        ASSERT_EQ(instances.size(), 2U);
        EXPECT_EQ(utf8(instances[0].getPath().toString()), "T_Thing.Id=\"&\"");
        EXPECT_EQ(utf8(CIMConstInstance(instances[1]).getProperty(0).getValue().toString()),
                  "<\xE2\x82\xAC\xE2\x82\xAC");
    }
    EXPECT_EQ(decodeClass(classText(kClass), 1).getPropertyCount(), 4U);
}

// The last octet of an answer is the line end behind CIM, which nothing depends on.
TEST(CimXmlReader, AnAnswerCutAnywhereFails) {
    const std::string instances = instancesText(
        instanceXml("<PROPERTY NAME=\"A\" TYPE=\"string\"><VALUE>\xE2\x82\xAC</VALUE></PROPERTY>"));
    for (std::size_t size = 0; size + 1 < instances.size(); ++size) {
        // Inside the character the cut shows as a fault of UTF-8.
        const bool isInCharacter = static_cast<unsigned char>(instances[size]) >= 0x80 &&
                                   static_cast<unsigned char>(instances[size]) < 0xC0;
        if (isInCharacter) {
            EXPECT_THROW(decodeInstances(instances.substr(0, size)), CIMClientResponseException);
        } else {
            EXPECT_THROW(decodeInstances(instances.substr(0, size)), CIMClientXmlException);
        }
    }
    const std::string cimClass = classText(kClass);
    for (std::size_t size = 0; size + 1 < cimClass.size(); ++size) {
        EXPECT_THROW(decodeClass(cimClass.substr(0, size)), CIMClientXmlException) << size;
    }
    const std::string error =
        responseText("EnumerateInstances", "<ERROR CODE=\"5\" DESCRIPTION=\"no\"/>");
    for (std::size_t size = 0; size + 1 < error.size(); ++size) {
        EXPECT_THROW(decodeInstances(error.substr(0, size)), CIMClientXmlException) << size;
    }
}

void expectStatus(const std::string& error, Uint32 code, const std::string& description) {
    try {
        decodeInstances(responseText("EnumerateInstances", error));
        ADD_FAILURE() << error;
    } catch (const CIMException& status) {
        EXPECT_EQ(static_cast<Uint32>(status.getCode()), code) << error;
        EXPECT_TRUE(contains(utf8(status.getMessage()), description)) << status.getMessage();
    }
}

TEST(CimXmlReader, AnErrorIsACimException) {
    expectStatus("<ERROR CODE=\"5\" DESCRIPTION=\"no &quot;X&quot; here\"/>", 5, "no \"X\" here");
    expectStatus("<ERROR CODE=\"99\"/>", 99, "");
    expectStatus(
        "<ERROR CODE=\"1\" DESCRIPTION=\"d\">\n<INSTANCE CLASSNAME=\"CIM_Error\">"
        "<PROPERTY NAME=\"a b\" TYPE=\"?\"/></INSTANCE>\n</ERROR>\n",
        1, "d");
    expectStatus("<IRETURNVALUE>" + instanceXml("") + "</IRETURNVALUE><ERROR CODE=\"1\"/>", 1, "");
    EXPECT_THROW(decodeClass(responseText("GetClass", "<ERROR CODE=\"6\"/>")), CIMException);
}

TEST(CimXmlReader, AnErrorNeedsACodeAboveZero) {
    const auto refuse = [](const std::string& xml) {
        return refusal(responseText("EnumerateInstances", xml));
    };
    EXPECT_TRUE(contains(refuse("<ERROR CODE=\"0\"/>"), "CODE is \"0\""));
    EXPECT_TRUE(contains(refuse("<ERROR CODE=\"\"/>"), "CODE is \"\""));
    EXPECT_TRUE(contains(refuse("<ERROR CODE=\"-1\"/>"), "CODE is \"-1\""));
    EXPECT_TRUE(contains(refuse("<ERROR CODE=\"4294967296\"/>"), "expected a number"));
    EXPECT_TRUE(contains(refuse("<ERROR/>"), "no attribute CODE"));
    EXPECT_TRUE(contains(refuse("<ERROR CODE=\"1\"/><ERROR CODE=\"1\"/>"), "may not stand"));
}

TEST(CimXmlReader, AnotherMessageIdOrMethodIsNoAnswer) {
    const std::string text = instancesText("");
    EXPECT_THROW(decodeInstances(replaced(text, "ID=\"7\"", "ID=\"8\"")),
                 CIMClientResponseException);
    EXPECT_THROW(decodeInstances(replaced(text, "ID=\"7\"", "ID=\"\"")),
                 CIMClientResponseException);
    EXPECT_THROW(decodeClass(text), CIMClientResponseException);
    EXPECT_THROW(decodeInstances(replaced(text, "ID=\"7\" ", "")), CIMClientXmlException);
}

TEST(CimXmlReader, OnlyTheMajorVersionCounts) {
    const std::string text = instancesText(instanceXml(""));
    const char* const accepted[][2] = {{"CIMVERSION=\"2.0\"", "CIMVERSION=\"2.3\""},
                                       {"DTDVERSION=\"2.0\"", "DTDVERSION=\"2.4.1\""},
                                       {"PROTOCOLVERSION=\"1.0\"", "PROTOCOLVERSION=\"1.4\""}};
    for (const auto& change : accepted) {
        EXPECT_EQ(decodeInstances(replaced(text, change[0], change[1])).size(), 1U) << change[1];
    }
    const char* const refused[][2] = {{"CIMVERSION=\"2.0\"", "CIMVERSION=\"3.0\""},
                                      {"CIMVERSION=\"2.0\"", "CIMVERSION=\"20.0\""},
                                      {"CIMVERSION=\"2.0\"", "CIMVERSION=\"\""},
                                      {"CIMVERSION=\"2.0\"", ""},
                                      {"DTDVERSION=\"2.0\"", "DTDVERSION=\"1.0\""},
                                      {"DTDVERSION=\"2.0\"", ""},
                                      {"PROTOCOLVERSION=\"1.0\"", "PROTOCOLVERSION=\"2.0\""},
                                      {"PROTOCOLVERSION=\"1.0\"", ""}};
    for (const auto& change : refused) {
        EXPECT_THROW(decodeInstances(replaced(text, change[0], change[1])), CIMClientXmlException)
            << change[1];
    }
}

TEST(CimXmlReader, WhatEnclosesTheResultIsChecked) {
    const std::string text = instancesText("");
    const auto refuse = [&text](const std::string& from, const std::string& to) {
        return refusal(replaced(text, from, to));
    };
    EXPECT_TRUE(contains(refuse("<SIMPLERSP>", "<OTHER/><SIMPLERSP>"), "expected SIMPLERSP"));
    EXPECT_TRUE(contains(refuse("</SIMPLERSP>", "</SIMPLERSP><SIMPLERSP/>"), "may not stand"));
    EXPECT_TRUE(contains(refuse("</MESSAGE>", "</MESSAGE><MESSAGE/>"), "may not stand"));
    EXPECT_TRUE(contains(refuse("</IMETHODRESPONSE>", "</IMETHODRESPONSE><IMETHODRESPONSE/>"),
                         "may not stand"));
    EXPECT_TRUE(contains(refuse("<IRETURNVALUE>", "<PARAMVALUE NAME=\"x\"/><IRETURNVALUE>"),
                         "\"PARAMVALUE\" may not"));
    EXPECT_TRUE(contains(refuse("</IRETURNVALUE>", "</IRETURNVALUE><IRETURNVALUE/>"), "may not"));
    EXPECT_TRUE(
        contains(refuse("<IRETURNVALUE>", "text<IRETURNVALUE>"), "\"text\" stands between"));
    EXPECT_TRUE(contains(refusal("<html><body>Hello</body></html>"), "expected CIM"));
    EXPECT_TRUE(contains(refusal("<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"/>"),
                         "ends too early; expected MESSAGE"));
    EXPECT_TRUE(contains(refusal("not XML"), "before the root"));
    EXPECT_TRUE(contains(refusal("<!DOCTYPE CIM>" + text), "document type"));
    EXPECT_TRUE(contains(refusal(text + "<x/>"), "second root"));
}

TEST(CimXmlReader, OnlyNamedInstancesAreEnumerated) {
    for (const char* other :
         {"<INSTANCE CLASSNAME=\"C\"/>", "<VALUE.OBJECT><INSTANCE CLASSNAME=\"C\"/></VALUE.OBJECT>",
          "<CLASS NAME=\"C\"/>", "<INSTANCENAME CLASSNAME=\"C\"/>"}) {
        EXPECT_TRUE(contains(refusal(instancesText(other)), "expected VALUE.NAMEDINSTANCE"));
    }
    EXPECT_TRUE(
        contains(refusal(instancesText("<VALUE.NAMEDINSTANCE/>")), "expected INSTANCENAME"));
    EXPECT_TRUE(
        contains(refusal(instancesText("<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"C\"/>"
                                       "</VALUE.NAMEDINSTANCE>")),
                 "expected INSTANCE"));
    EXPECT_TRUE(contains(refusal(instancesText("<VALUE.NAMEDINSTANCE><INSTANCE CLASSNAME=\"C\"/>"
                                               "</VALUE.NAMEDINSTANCE>")),
                         "expected INSTANCENAME"));
}

TEST(CimXmlReader, AnAbsurdNumberOfKeysIsRead) {
    constexpr int kKeys = 100000;
    std::string keys;
    for (int i = 0; i < kKeys; ++i) {
        keys += "<KEYBINDING NAME=\"K" + std::to_string(i) + "\"><KEYVALUE/></KEYBINDING>";
    }
    const auto named = [](const std::string& content) {
        return instancesText("<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"C\">" + content +
                             "</INSTANCENAME><INSTANCE CLASSNAME=\"C\"/></VALUE.NAMEDINSTANCE>");
    };
    const Array<CIMInstance> instances = decodeInstances(named(keys));
    ASSERT_EQ(instances.size(), 1U);
    EXPECT_EQ(instances[0].getPath().getKeyBindings().size(), Uint32{kKeys});
    EXPECT_TRUE(contains(refusal(named(keys + "<KEYBINDING NAME=\"k0\"><KEYVALUE/></KEYBINDING>")),
                         "given twice"));
}

TEST(CimXmlReader, FaultsInInstances) {
    const auto refuse = [](const std::string& members) {
        return refusal(instancesText(instanceXml("") + instanceXml(members) + instanceXml("")));
    };
    EXPECT_TRUE(contains(refuse("<PROPERTY NAME=\"Size\" TYPE=\"uint8\"/>"
                                "<PROPERTY NAME=\"SIZE\" TYPE=\"uint8\"/>"),
                         "property \"SIZE\" is given twice"));
    EXPECT_TRUE(contains(refuse("<PROPERTY TYPE=\"uint8\"/>"), "no attribute NAME"));
    EXPECT_TRUE(contains(refuse("<PROPERTY NAME=\"P\"/>"), "no attribute TYPE"));
    EXPECT_TRUE(contains(refuse("<PROPERTY NAME=\"\" TYPE=\"uint8\"/>"), "NAME of element"));
    EXPECT_TRUE(contains(refuse("<PROPERTY NAME=\"a b\" TYPE=\"uint8\"/>"), "is \"a b\""));
    EXPECT_TRUE(contains(refuse("<PROPERTY.ARRAY NAME=\"P\"/>"), "no attribute TYPE"));
    EXPECT_TRUE(contains(refuse("<PROPERTY.REFERENCE/>"), "no attribute NAME"));
    EXPECT_TRUE(contains(refuse("<METHOD NAME=\"M\"/>"), "\"METHOD\" may not"));
    EXPECT_TRUE(contains(refuse("<OTHER/>"), "\"OTHER\" may not stand here"));
    EXPECT_TRUE(contains(refuse("text"), "\"text\" stands between"));
    EXPECT_TRUE(contains(refuse("<QUALIFIER NAME=\"Q\" TYPE=\"string\"/>"
                                "<QUALIFIER NAME=\"q\" TYPE=\"string\"/>"),
                         "qualifier \"q\" is given twice"));
    EXPECT_TRUE(contains(
        refusal(replaced(instancesText(instanceXml("")), "INSTANCE CLASSNAME", "INSTANCE X")),
        "no attribute CLASSNAME"));
}

TEST(CimXmlReader, FaultsInClasses) {
    EXPECT_TRUE(contains(classRefusal("<PROPERTY NAME=\"P\" TYPE=\"uint8\"><QUALIFIER NAME=\"Q\" "
                                      "TYPE=\"uint8\"><VALUE>x</VALUE></QUALIFIER></PROPERTY>"),
                         "\"x\" is no uint8"));
    EXPECT_TRUE(contains(classRefusal("<PROPERTY NAME=\"P\" TYPE=\"uint8\"><QUALIFIER NAME=\"Q\" "
                                      "TYPE=\"string\"/><QUALIFIER NAME=\"Q\" TYPE=\"string\"/>"
                                      "</PROPERTY>"),
                         "qualifier \"Q\" is given twice"));
    EXPECT_TRUE(contains(classRefusal("<QUALIFIER NAME=\"Q\"/>"), "no attribute TYPE"));
    EXPECT_TRUE(contains(classRefusal("<QUALIFIER NAME=\"Q\" TYPE=\"string\" TOSUBCLASS=\"1\"/>"),
                         "TOSUBCLASS"));
    EXPECT_TRUE(contains(classRefusal("<QUALIFIER NAME=\"Q\" TYPE=\"string\"><VALUE/><VALUE/>"
                                      "</QUALIFIER>"),
                         "expected one VALUE"));
    EXPECT_TRUE(contains(classRefusal("<METHOD/>"), "no attribute NAME"));
    EXPECT_TRUE(contains(classRefusal("<METHOD NAME=\"M\" TYPE=\"x\"/>"), "TYPE is \"x\""));
    EXPECT_TRUE(
        contains(classRefusal("<METHOD NAME=\"M\"><OTHER/></METHOD>"), "kind of PARAMETER"));
    EXPECT_TRUE(contains(classRefusal("<METHOD NAME=\"M\"><PARAMETER NAME=\"A\"/></METHOD>"),
                         "no attribute TYPE"));
    EXPECT_TRUE(contains(
        classRefusal("<METHOD NAME=\"M\"><PARAMETER.REFERENCE NAME=\"A\"><X/></PARAMETER.REFERENCE>"
                     "</METHOD>"),
        "expected QUALIFIER"));
    EXPECT_TRUE(contains(classRefusal("<INSTANCE CLASSNAME=\"C\"/>"), "; in class T_Thing"));
}

TEST(CimXmlReader, TextThatIsNotUtf8IsAResponseException) {
    const std::string text = instancesText(
        instanceXml("<PROPERTY NAME=\"P\" TYPE=\"string\"><VALUE>?</VALUE></PROPERTY>"));
    for (const char* octets : {"\xFF", "\xC0\x80", "\xED\xA0\x80", "\xE2\x82"}) {
        try {
            decodeInstances(replaced(text, ">?<", ">" + std::string(octets) + "<"));
            ADD_FAILURE();
        } catch (const CIMClientResponseException& error) {
            EXPECT_TRUE(contains(utf8(error.getMessage()), "property P of class T_Thing"))
                << error.getMessage();
        }
    }
}

TEST(CimXmlReader, AFaultAtTheEndFailsTheWholeAnswer) {
    std::string many;
    for (int i = 0; i < 1000; ++i) {
        many += instanceXml("");
    }
    EXPECT_EQ(decodeInstances(instancesText(many)).size(), 1000U);
    EXPECT_THROW(decodeInstances(instancesText(many + instanceXml("<X/>"))), CIMClientXmlException);
}

TEST(CimXmlReader, DeepAndWideAnswersEndWithAnException) {
    std::string deep;
    std::string wide = "<INSTANCE";
    for (int i = 0; i < 1000000; ++i) {
        deep += "<VALUE.REFERENCE>";
        wide += " a" + std::to_string(i) + "='1'";
    }
    EXPECT_THROW(decodeInstances(instancesText(deep)), CIMClientXmlException);
    EXPECT_THROW(decodeInstances(instancesText(wide + "/>")), CIMClientXmlException);

    // The same through elements that may stand there: keys whose values are references.
    std::string keys;
    for (int i = 0; i < 1000000; ++i) {
        keys += "<INSTANCENAME CLASSNAME='C'><KEYBINDING NAME='K'><VALUE.REFERENCE>";
    }
    EXPECT_THROW(decodeInstances(instancesText("<VALUE.NAMEDINSTANCE>" + keys)),
                 CIMClientXmlException);
}

}  // namespace
}  // namespace Pegasus
