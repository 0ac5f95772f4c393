// Requests as a server reads them: operations and parameters, and what is refused with which word.

#include "xml/CimRequest.h"

#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <cstddef>
#include <string>

#include "xml/CimXmlWriter.h"
#include "xml/MemorySource.h"

namespace Pegasus {
namespace {

std::string utf8(const String& text) {
    return std::string(text.getCString());
}

std::string requestText(const std::string& parameters) {
    return "<?xml version=\"1.0\" encoding=\"utf-8\" ?>\n<CIM CIMVERSION=\"2.0\" "
           "DTDVERSION=\"2.0\">\n<MESSAGE ID=\"m1\" PROTOCOLVERSION=\"1.0\">\n<SIMPLEREQ>\n"
           "<IMETHODCALL NAME=\"GetClass\">\n<LOCALNAMESPACEPATH>\n<NAMESPACE NAME=\"root\"/>\n"
           "<NAMESPACE NAME=\"cimv2\"/>\n</LOCALNAMESPACEPATH>\n" +
           parameters + "</IMETHODCALL>\n</SIMPLEREQ>\n</MESSAGE>\n</CIM>\n";
}

std::string parameter(const std::string& name, const std::string& content) {
    return "<IPARAMVALUE NAME=\"" + name + "\">" + content + "</IPARAMVALUE>\n";
}

CimRequest decode(const std::string& text) {
    MemorySource source(text);
    return decodeRequest(source);
}

// The word and the detail that refuse a request.
std::string refusal(const std::string& text) {
    try {
        decode(text);
    } catch (const CimRequestError& error) {
        EXPECT_FALSE(error.detail.empty());
        return error.cimError;
    }
    ADD_FAILURE() << "accepted: " << text;
    return "";
}

std::string replaced(std::string text, const std::string& from, const std::string& to) {
    const std::size_t place = text.find(from);
    EXPECT_NE(place, std::string::npos) << from;
    return text.replace(place, from.size(), to);
}

template <typename Call>
void expectInvalidParameter(Call call) {
    try {
        call();
        ADD_FAILURE();
    } catch (const CIMException& error) {
        EXPECT_EQ(error.getCode(), CIM_ERR_INVALID_PARAMETER);
        EXPECT_NE(error.getMessage().size(), 0U);
    }
}

TEST(CimRequest, OperationNamespaceAndParameters) {
    const CimRequest request = decode(requestText(
        parameter("ClassName", "<CLASSNAME NAME=\"CIM_X\"/>") +
        parameter("LocalOnly", "<VALUE> true </VALUE>") +
        parameter("IncludeQualifiers", "<VALUE>FALSE</VALUE>") +
        parameter("PropertyList",
                  "<VALUE.ARRAY><VALUE>A</VALUE><VALUE>no name</VALUE><VALUE>B"
                  "</VALUE></VALUE.ARRAY>") +
        parameter("InstanceName",
                  "<INSTANCENAME CLASSNAME=\"C\"><KEYBINDING NAME=\"k\"><KEYVALUE>v</KEYVALUE>"
                  "</KEYBINDING></INSTANCENAME>") +
        parameter("Role", "<VALUE>r</VALUE>")));
    EXPECT_EQ(request.messageId, "m1");
    EXPECT_EQ(request.method, "GetClass");
    EXPECT_EQ(utf8(request.nameSpace.getString()), "root/cimv2");
    EXPECT_EQ(utf8(request.className("CLASSNAME").getString()), "CIM_X");
    EXPECT_TRUE(request.flag("localonly", false));
    EXPECT_FALSE(request.flag("IncludeQualifiers", true));
    const CIMPropertyList list = request.propertyList("PropertyList");
    ASSERT_EQ(list.size(), 2U);
    EXPECT_EQ(utf8(list[1].getString()), "B");
    EXPECT_EQ(utf8(request.instanceName("InstanceName").toString()), "C.k=\"v\"");
    ASSERT_NE(request.text("Role"), nullptr);
    EXPECT_EQ(utf8(*request.text("Role")), "r");
}

TEST(CimRequest, AbsentAndNullParameters) {
    for (const std::string& parameters :
         {std::string(), parameter("A", "") + parameter("B", "\n"),
          std::string("<IPARAMVALUE NAME=\"A\"/><IPARAMVALUE NAME=\"B\"/>")}) {
        const CimRequest request = decode(requestText(parameters));
        EXPECT_TRUE(request.flag("A", true));
        EXPECT_FALSE(request.flag("A", false));
        EXPECT_TRUE(request.className("A").isNull());
        EXPECT_TRUE(request.instanceName("B").getClassName().isNull());
        EXPECT_TRUE(request.propertyList("B").isNull());
        EXPECT_EQ(request.text("B"), nullptr);
    }
}

TEST(CimRequest, AnEmptyPropertyListIsNotNull) {
    const CimRequest request = decode(requestText(parameter("PropertyList", "<VALUE.ARRAY/>")));
    EXPECT_FALSE(request.propertyList("PropertyList").isNull());
    EXPECT_EQ(request.propertyList("PropertyList").size(), 0U);
}

TEST(CimRequest, ParametersOfOtherOperationsAreReadOver) {
    const CimRequest request =
        decode(requestText(parameter("NewInstance",
                                     "<INSTANCE CLASSNAME=\"C\"><PROPERTY NAME=\"P\" TYPE=\"?\"/>"
                                     "</INSTANCE>") +
                           parameter("ClassName", "<CLASSNAME NAME=\"C\"/>")));
    EXPECT_EQ(utf8(request.className("ClassName").getString()), "C");
    expectInvalidParameter([&] { request.flag("NewInstance", false); });
}

TEST(CimRequest, InvalidParameters) {
    const CimRequest request = decode(requestText(
        parameter("Flag", "<VALUE>1</VALUE>") + parameter("Empty", "<VALUE/>") +
        parameter("Twice", "<VALUE>TRUE</VALUE>") + parameter("TWICE", "<VALUE>TRUE</VALUE>") +
        parameter("ClassName", "<VALUE>C</VALUE>")));
    expectInvalidParameter([&] { request.flag("Flag", false); });
    expectInvalidParameter([&] { request.flag("Empty", false); });
    expectInvalidParameter([&] { request.flag("Twice", false); });
    expectInvalidParameter([&] { request.className("ClassName"); });
    expectInvalidParameter([&] { request.instanceName("ClassName"); });
    expectInvalidParameter([&] { request.propertyList("ClassName"); });
    expectInvalidParameter([&] { request.requireOnly({"Flag", "Empty", "ClassName", "Twice"}); });
}

TEST(CimRequest, OnlyKnownParameters) {
    const CimRequest request = decode(requestText(parameter("A", "") + parameter("b", "")));
    EXPECT_NO_THROW(request.requireOnly({"a", "B", "c"}));
    expectInvalidParameter([&] { request.requireOnly({"a"}); });
}

TEST(CimRequest, WhatTheClientWritesIsRead) {
    Array<CIMName> names;
    names.append(CIMName("P"));
    const CimRequest request = decode(encodeEnumerateInstancesRequest(
        "17", "root/cimv2", "CIM_X", false, true, false, true, CIMPropertyList(names)));
    EXPECT_EQ(request.messageId, "17");
    EXPECT_EQ(request.method, "EnumerateInstances");
    EXPECT_EQ(utf8(request.className("ClassName").getString()), "CIM_X");
    EXPECT_FALSE(request.flag("DeepInheritance", true));
    EXPECT_TRUE(request.flag("LocalOnly", false));
    EXPECT_FALSE(request.flag("IncludeQualifiers", true));
    EXPECT_TRUE(request.flag("IncludeClassOrigin", false));
    EXPECT_EQ(request.propertyList("PropertyList").size(), 1U);
}

TEST(CimRequest, VersionsOfAnotherMajorNumber) {
    const std::string text = requestText("");
    EXPECT_EQ(refusal(replaced(text, "CIMVERSION=\"2.0\"", "CIMVERSION=\"3.0\"")),
              "unsupported-cim-version");
    EXPECT_EQ(refusal(replaced(text, "DTDVERSION=\"2.0\"", "DTDVERSION=\"1.9\"")),
              "unsupported-dtd-version");
    EXPECT_EQ(refusal(replaced(text, "PROTOCOLVERSION=\"1.0\"", "PROTOCOLVERSION=\"2.0\"")),
              "unsupported-protocol-version");
    EXPECT_EQ(decode(replaced(text, "PROTOCOLVERSION=\"1.0\"", "PROTOCOLVERSION=\"1.4\"")).method,
              "GetClass");
}

TEST(CimRequest, OtherKindsOfRequests) {
    const std::string head =
        "<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"><MESSAGE ID=\"1\" PROTOCOLVERSION=\"1.0\">";
    const std::string tail = "</MESSAGE></CIM>";
    EXPECT_EQ(refusal(head + "<MULTIREQ/>" + tail), "multiple-requests-unsupported");
    EXPECT_EQ(refusal(head + "<MULTIEXPREQ/>" + tail), "multiple-requests-unsupported");
    EXPECT_EQ(refusal(head + "<SIMPLEEXPREQ/>" + tail), "unsupported-operation");
    EXPECT_EQ(refusal(head + "<SIMPLEREQ><METHODCALL NAME=\"Reset\"/></SIMPLEREQ>" + tail),
              "request-not-valid");
    EXPECT_EQ(refusal(head + "<SIMPLERSP/>" + tail), "request-not-valid");
    EXPECT_EQ(refusal(head + "<SIMPLEREQ/>" + tail), "request-not-valid");
    EXPECT_EQ(refusal(head + "<SIMPLEREQ><OTHER/></SIMPLEREQ>" + tail), "request-not-valid");
    EXPECT_EQ(refusal(head + tail), "request-not-valid");
    EXPECT_EQ(refusal("<html/>"), "request-not-valid");
}

TEST(CimRequest, RequestsThatAreNotValid) {
    const std::string text = requestText("");
    for (const char* part : {"ID=\"m1\"", "PROTOCOLVERSION=\"1.0\"", "CIMVERSION=\"2.0\"",
                             "DTDVERSION=\"2.0\"", "NAME=\"GetClass\"", "NAME=\"root\""}) {
        EXPECT_EQ(refusal(replaced(text, part, "")), "request-not-valid") << part;
    }
    EXPECT_EQ(refusal(replaced(text, "\"root\"", "\"a-b\"")), "request-not-valid");
    EXPECT_EQ(refusal(replaced(text, "</IMETHODCALL>", "</IMETHODCALL><IMETHODCALL NAME=\"X\"/>")),
              "request-not-valid");
    EXPECT_EQ(refusal(requestText("<OTHER/>")), "request-not-valid");
    EXPECT_EQ(refusal(requestText("<IPARAMVALUE/>")), "request-not-valid");
    EXPECT_EQ(refusal(requestText(parameter("A", "<VALUE/><VALUE/>"))), "request-not-valid");
    EXPECT_EQ(refusal(requestText(parameter("A", "<CLASSNAME NAME=\"1\"/>"))), "request-not-valid");
    EXPECT_EQ(refusal(requestText(parameter("A", "text"))), "request-not-valid");
}

TEST(CimRequest, ParametersAreCounted) {
    std::string parameters;
    for (int i = 0; i < 32; ++i) {
        parameters += parameter("P" + std::to_string(i), "");
    }
    EXPECT_EQ(decode(requestText(parameters)).parameters.size(), 32U);
    EXPECT_EQ(refusal(requestText(parameters + parameter("P32", ""))), "request-not-valid");
}

TEST(CimRequest, RequestsThatAreNotWellFormed) {
    const std::string text = requestText("");
    EXPECT_EQ(refusal(""), "request-not-well-formed");
    EXPECT_EQ(refusal("GET / HTTP/1.0"), "request-not-well-formed");
    EXPECT_EQ(refusal("<!DOCTYPE CIM>" + text), "request-not-well-formed");
    EXPECT_EQ(refusal(text + text), "request-not-well-formed");
    EXPECT_EQ(refusal(requestText(parameter("A", "<VALUE>\xFF</VALUE>"))),
              "request-not-well-formed");
    // The last octet is the line end behind CIM, which nothing depends on.
    for (std::size_t size = 0; size + 1 < text.size(); ++size) {
        EXPECT_EQ(refusal(text.substr(0, size)), "request-not-well-formed") << size;
    }
}

}  // namespace
}  // namespace Pegasus
