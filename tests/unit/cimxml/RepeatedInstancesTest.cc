// Instances that repeat the markup of earlier ones: the decoder compares octets there instead of
// reading them, and what comes out must be what reading gives. When an answer arrives in small
// pieces nothing can be compared, so that way is the measure here.

#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <random>
#include <string>
#include <vector>

#include "ResponseText.h"
#include "xml/CimXmlReader.h"
#include "xml/CimXmlWriter.h"
#include "xml/MemorySource.h"

namespace Pegasus {
namespace {

using namespace std::string_literals;

constexpr std::size_t kAtOnce = 1024 * 1024;
constexpr std::size_t kInPieces = 5;

// The instances in CIM-XML, or the message of the exception.
std::string outcome(const std::string& members, std::size_t pieceSize) {
    const std::string text = instancesText(members);
    MemorySource source(text, pieceSize);
    std::string xml;
    try {
        for (const CIMInstance& instance : decodeEnumerateInstancesResponse(source, "7")) {
            appendNamedInstance(xml, instance);
        }
    } catch (const Exception& error) {
        xml = "refused: "s + static_cast<const char*>(error.getMessage().getCString());
    }
    return xml;
}

std::string property(const std::string& name, const std::string& type, const std::string& value) {
    return "<PROPERTY NAME=\"" + name + "\"  TYPE=\"" + type + "\">\n<VALUE>" + value +
           "</VALUE>\n</PROPERTY>\n";
}

std::string null(const std::string& name, const std::string& type) {
    return "<PROPERTY NAME=\"" + name + "\"  TYPE=\"" + type + "\">\n</PROPERTY>\n";
}

std::string array(const std::string& name, const std::string& type,
                  const std::vector<std::string>& values) {
    std::string xml =
        "<PROPERTY.ARRAY NAME=\"" + name + "\"  TYPE=\"" + type + "\">\n<VALUE.ARRAY>\n";
    for (const std::string& value : values) {
        xml += "<VALUE>" + value + "</VALUE>\n";
    }
    return xml + "</VALUE.ARRAY>\n</PROPERTY.ARRAY>\n";
}

std::string utf8(const String& text) {
    return std::string(text.getCString());
}

// The texts of property `index` of instances with these members.
std::vector<std::string> valuesOf(const std::vector<std::string>& members, Uint32 index = 0) {
    std::string xml;
    for (const std::string& member : members) {
        xml += instanceXml(member);
    }
    const std::string text = instancesText(xml);
    MemorySource source(text, kAtOnce);
    std::vector<std::string> values;
    for (const CIMInstance& instance : decodeEnumerateInstancesResponse(source, "7")) {
        const CIMConstInstance& read = instance;
        const CIMValue value = read.getProperty(index).getValue();
        values.push_back(value.isNull() ? "null" : utf8(value.toString()));
    }
    return values;
}

using Texts = std::vector<std::string>;

TEST(RepeatedInstances, HaveTheirOwnValues) {
    EXPECT_EQ(valuesOf({property("A", "string", "one"), property("A", "string", ""),
                        property("A", "string", " three ")}),
              (Texts{"one", "", "three"}));
    EXPECT_EQ(valuesOf({property("A", "uint8", "1"), property("A", "uint8", " 0x10 "),
                        property("A", "uint8", "255")}),
              (Texts{"1", "16", "255"}));
    EXPECT_EQ(valuesOf({property("A", "sint64", "1"), property("A", "sint64", "-5")}),
              (Texts{"1", "-5"}));
    EXPECT_EQ(valuesOf({property("A", "boolean", "TRUE"), property("A", "boolean", "false")}),
              (Texts{"TRUE", "FALSE"}));
    EXPECT_EQ(valuesOf({property("A", "char16", "a"), property("A", "char16", "b")}),
              (Texts{"a", "b"}));
    EXPECT_EQ(valuesOf({property("A", "datetime", ""),
                        property("A", "datetime", "20260102030405.000000+060")}),
              (Texts{"00000000000000.000000:000", "20260102030405.000000+060"}));
}

TEST(RepeatedInstances, HaveTheirReferencesReplaced) {
    EXPECT_EQ(valuesOf({property("A", "string", "x"), property("A", "string", "a&lt;&#8364;&amp;"),
                        property("A", "string", "a&amp;")}),
              (Texts{"x", "a<\xE2\x82\xAC&", "a&"}));
    EXPECT_EQ(
        valuesOf({array("A", "string", {"p", "q"}), array("A", "string", {"&#x31;&gt;", "2"})}),
        (Texts{"p q ", "1> 2 "}));
}

TEST(RepeatedInstances, MayHaveBlanksInTheirTags) {
    const auto spaced = [](const std::string& value) {
        return "<PROPERTY NAME='A' TYPE='uint16'><VALUE>" + value + "</VALUE\t></PROPERTY\n>";
    };
    EXPECT_EQ(valuesOf({spaced("1"), spaced("2"), property("A", "uint16", "3"), spaced("4")}),
              (Texts{"1", "2", "3", "4"}));
}

TEST(RepeatedInstances, MayBeNullBetweenOthers) {
    EXPECT_EQ(valuesOf({property("A", "uint16", "1"), null("A", "uint16"), null("A", "uint16"),
                        property("A", "uint16", "4"), null("A", "uint16")}),
              (Texts{"1", "null", "null", "4", "null"}));
}

TEST(RepeatedInstances, HaveArraysOfAnyLength) {
    EXPECT_EQ(valuesOf({array("A", "uint16", {"1"}), array("A", "uint16", {"1", "2", "3"}),
                        array("A", "uint16", {"4"}), array("A", "uint16", {"5", "6"}),
                        array("A", "uint16", {})}),
              (Texts{"1 ", "1 2 3 ", "4 ", "5 6 ", ""}));
}

TEST(RepeatedInstances, MayLeavePropertiesOutAndAddThem) {
    const std::string a = property("A", "string", "a");
    const std::string b = property("B", "string", "b");
    const std::string c = property("C", "string", "c");
    EXPECT_EQ(valuesOf({a + b + c, b + c, c, a + c, c + a, b + a + c}),
              (Texts{"a", "b", "c", "a", "c", "b"}));
    EXPECT_EQ(valuesOf({a + c, a + b + c, a + b + c}, 1), (Texts{"c", "b", "b"}));
}

TEST(RepeatedInstances, MayChangeAType) {
    EXPECT_EQ(valuesOf({property("A", "string", "1"), property("A", "uint16", "1"),
                        property("A", "string", "x"), array("A", "string", {"y"})}),
              (Texts{"1", "1", "x", "y "}));
}

TEST(RepeatedInstances, AreRefusedWhenAPropertyComesTwice) {
    const std::string a = property("A", "string", "a");
    const std::string b = property("B", "string", "b");
    const std::string again = property("a", "uint16", "1");
    for (const std::string& last : {a + a, a + b + a, b + a + b, a + again, b + a + again}) {
        const std::string members =
            instanceXml(a + b) + instanceXml(b + a) + instanceXml(a + b) + instanceXml(last);
        EXPECT_NE(outcome(members, kAtOnce).find("is given twice"), std::string::npos) << last;
        EXPECT_EQ(outcome(members, kAtOnce), outcome(members, kInPieces)) << last;
    }
}

TEST(RepeatedInstances, SayWhichValueIsWrong) {
    const std::string good =
        instanceXml(property("A", "string", "a") + property("B", "uint8", "1"));
    const std::string wrong =
        instanceXml(property("A", "string", "a") + property("B", "uint8", "256"));
    const std::string message = outcome(good + good + wrong, kAtOnce);
    EXPECT_NE(message.find("value \"256\" is no uint8"), std::string::npos) << message;
    EXPECT_NE(message.find("in property B of class T_Thing"), std::string::npos) << message;
    EXPECT_EQ(message, outcome(good + good + wrong, kInPieces));
}

// All texts of an array are found before the first of them is looked at.
TEST(RepeatedInstances, SayWhatIsWrongFirst) {
    const std::string good = instanceXml(array("A", "uint8", {"1", "2"}));
    const std::string wrong = instanceXml(array("A", "uint8", {"1", "256", "&none;"}));
    const std::string message = outcome(good + good + wrong, kAtOnce);
    EXPECT_NE(message.find("value \"256\" is no uint8"), std::string::npos) << message;
    EXPECT_EQ(message, outcome(good + good + wrong, kInPieces));
}

std::string keyed(const std::string& type, const std::string& value) {
    return "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"T_Thing\"><KEYBINDING NAME=\"Id\">"
           "<KEYVALUE VALUETYPE=\"" +
           type + "\">" + value +
           "</KEYVALUE></KEYBINDING></INSTANCENAME><INSTANCE CLASSNAME=\"T_Thing\"/>"
           "</VALUE.NAMEDINSTANCE>";
}

TEST(RepeatedInstances, HaveNoKeysThatAreEmptyNumbers) {
    for (const std::string type : {"numeric", "boolean"}) {
        const std::string value = type == "numeric" ? "1" : "true";
        for (const std::string& members :
             {keyed(type, value) + keyed(type, ""),
              keyed(type, value) + keyed(type, value) + keyed(type, "")}) {
            const std::string message = outcome(members, kAtOnce);
            EXPECT_TRUE(message.starts_with("refused: key value \"\" is no ")) << message;
            EXPECT_EQ(message, outcome(members, kInPieces));
        }
    }
    const std::string texts = keyed("string", "a") + keyed("string", "") + keyed("string", "");
    EXPECT_EQ(outcome(texts, kAtOnce), outcome(texts, kInPieces));
}

TEST(RepeatedInstances, AreReadStrictly) {
    const std::string good = instanceXml(property("A", "string", "a") + array("B", "uint8", {"1"}));
    for (const char* value : {"a&b;", "a]]&gt;", "a]]>", "<b/>", "&#0;", "a\rb", "a\r\nb", "a>b",
                              "<![CDATA[ x ]]>", "<!-- c -->x"}) {
        const std::string members =
            good + good + instanceXml(property("A", "string", value) + array("B", "uint8", {"1"}));
        EXPECT_EQ(outcome(members, kAtOnce), outcome(members, kInPieces)) << value;
    }
}

// Answers of random instances over few names and types, every third with something unusual in it.
class RandomAnswer {
  public:
    explicit RandomAnswer(unsigned seed) : random(seed) {}

    std::string instances() {
        std::string xml;
        for (int i = 0; i < 12; ++i) {
            std::string members;
            for (int p = 0; p < 5; ++p) {
                members += oneIn(10) ? "" : member(oneIn(80) ? number(5) : p);
            }
            xml += instanceXml(members, std::to_string(i));
        }
        return xml;
    }

  private:
    int number(int below) { return std::uniform_int_distribution<int>(0, below - 1)(random); }
    bool oneIn(int chances) { return number(chances) == 0; }

    std::string member(int index) {
        static const std::vector<std::string> types{"string", "uint8", "string", "datetime",
                                                    "real32"};
        const std::string name(1, static_cast<char>('A' + index));
        const std::string& type = types[static_cast<std::size_t>(oneIn(40) ? 0 : index)];
        if (oneIn(30)) {
            return unusual(name, type);
        }
        if (oneIn(8)) {
            return null(name, type);
        }
        if (index == 2 || oneIn(40)) {
            std::vector<std::string> values(static_cast<std::size_t>(number(4)));
            for (std::string& each : values) {
                each = value(type);
            }
            return array(name, type, values);
        }
        return property(name, type, value(type));
    }

    std::string value(const std::string& type) {
        if (oneIn(300)) {
            return "wrong&amp;";
        }
        if (type == "string") {
            static const std::vector<std::string> texts{"",   "a", " b ", "&lt;x", "\xE2\x82\xAC",
                                                        "a>b"};
            return texts[static_cast<std::size_t>(number(6))];
        }
        return type == "datetime" ? "20260102030405.000000+060" : std::to_string(number(200));
    }

    std::string unusual(const std::string& name, const std::string& type) {
        const std::string start = "<PROPERTY NAME=\"" + name + "\"  TYPE=\"" + type + "\">";
        switch (number(7)) {
            case 0:
                return start + "<!-- --><VALUE>1</VALUE></PROPERTY>";
            case 1:
                return start + "<VALUE/></PROPERTY>";
            case 2:
                return start +
                       "<QUALIFIER NAME=\"q\" TYPE=\"boolean\"/><VALUE>1</VALUE></PROPERTY>";
            case 3:
                return "<PROPERTY.REFERENCE NAME=\"" + name + "\"/>";
            case 4:
                return "<PROPERTY NAME=\"" + name + "\" TYPE=\"" + type +
                       "\" PROPAGATED=\"true\" CLASSORIGIN=\"O&#x61;\"><VALUE>1</VALUE></PROPERTY>";
            case 5:
                return "<PROPERTY.ARRAY NAME=\"" + name + "\" TYPE=\"" + type +
                       "\"><VALUE.ARRAY><VALUE>1</VALUE><VALUE.NULL/></VALUE.ARRAY></"
                       "PROPERTY.ARRAY>";
            default:
                return start + "<VALUE><![CDATA[7]]></VALUE></PROPERTY>";
        }
    }

    std::mt19937 random;
};

TEST(RepeatedInstances, AreWhatReadingThemGives) {
    int accepted = 0;
    for (unsigned seed = 0; seed < 2000; ++seed) {
        const std::string xml = RandomAnswer(seed).instances();
        const std::string inPieces = outcome(xml, kInPieces);
        ASSERT_EQ(outcome(xml, kAtOnce), inPieces) << xml;
        accepted += inPieces.starts_with("refused") ? 0 : 1;
    }
    EXPECT_GT(accepted, 100);
    EXPECT_LT(accepted, 1900);
}

}  // namespace
}  // namespace Pegasus
