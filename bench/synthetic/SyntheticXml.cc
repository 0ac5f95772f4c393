#include "bench/synthetic/SyntheticXml.h"

#include "bench/synthetic/SyntheticText.h"

namespace bench {

namespace {

void appendEscaped(std::string_view text, std::string& xml) {
    for (const char c : text) {
        switch (c) {
            case '&':
                xml += "&amp;";
                break;
            case '<':
                xml += "&lt;";
                break;
            case '>':
                xml += "&gt;";
                break;
            case '"':
                xml += "&quot;";
                break;
            case '\'':
                xml += "&apos;";
                break;
            case '\n':
                xml += "&#10;";
                break;
            default:
                xml += c;
        }
    }
}

void appendValue(std::string_view text, std::string& xml) {
    xml += "<VALUE>";
    appendEscaped(text, xml);
    xml += "</VALUE>\n";
}

void appendValues(const std::vector<std::string>& texts, std::string& xml) {
    xml += "<VALUE.ARRAY>\n";
    for (const std::string& text : texts) {
        appendValue(text, xml);
    }
    xml += "</VALUE.ARRAY>\n";
}

void appendPath(const SyntheticClass& synthetic, const InstanceTexts& texts, std::string& xml) {
    xml += "<INSTANCENAME CLASSNAME=\"" + synthetic.name + "\">\n";
    for (std::size_t i = 0; i < texts.size(); ++i) {
        if (synthetic.properties[i].isKey) {
            xml += "<KEYBINDING NAME=\"" + synthetic.properties[i].name +
                   "\">\n<KEYVALUE VALUETYPE=\"string\">";
            appendEscaped(texts[i][0], xml);
            xml += "</KEYVALUE>\n</KEYBINDING>\n";
        }
    }
    xml += "</INSTANCENAME>\n";
}

void appendProperty(const SyntheticProperty& property, const std::vector<std::string>& texts,
                    std::string& xml) {
    const std::string_view element = property.isArray() ? "PROPERTY.ARRAY" : "PROPERTY";
    ((((xml += '<') += element) += " NAME=\"") += property.name) += "\"  TYPE=\"";
    (xml += property.type()) += "\">\n";
    if (property.isArray()) {
        appendValues(texts, xml);
    } else {
        appendValue(texts[0], xml);
    }
    ((xml += "</") += element) += ">\n";
}

class ClassWriter {
  public:
    explicit ClassWriter(Random& random) : random(random) {}

    std::string write(const SyntheticClass& synthetic) {
        xml = "<CLASS NAME=\"" + synthetic.name + "\"  SUPERCLASS=\"Bench_Base\" >\n";
        appendText("UMLPackagePath", "Bench::Device::" + synthetic.name);
        appendText("Version", "2.10.0");
        appendDescription();
        for (const SyntheticProperty& property : synthetic.inherited) {
            appendDeclaration(property, "  PROPAGATED=\"true\"");
        }
        for (const SyntheticProperty& property : synthetic.properties) {
            appendDeclaration(property, " ");
        }
        for (std::size_t i = 0; i < kMethods; ++i) {
            appendMethod("Method" + std::to_string(i));
        }
        return xml + "</CLASS>\n";
    }

  private:
    static constexpr std::size_t kMethods = 8;

    // Few descriptions are long, most are a sentence or three.
    std::size_t descriptionLength() {
        switch (random.below(8)) {
            case 0:
                return 1200 + random.below(1700);
            case 1:
            case 2:
                return 500 + random.below(500);
            default:
                return 60 + random.below(300);
        }
    }

    void appendQualifier(std::string_view name, std::string_view type, std::string_view value,
                         std::string_view flavor = "") {
        xml += "<QUALIFIER NAME=\"";
        ((((xml += name) += "\" TYPE=\"") += type) += "\"") += flavor;
        xml += ">\n";
        appendValue(value, xml);
        xml += "</QUALIFIER>\n";
    }

    void appendText(std::string_view name, std::string_view value) {
        appendQualifier(name, "string", value, " TRANSLATABLE=\"true\"");
    }

    void appendDescription() {
        appendText("Description", description(random, descriptionLength()));
    }

    void appendTexts(std::string_view name, const std::vector<std::string>& texts,
                     std::string_view flavor) {
        ((xml += "<QUALIFIER NAME=\"") += name) += "\" TYPE=\"string\"";
        (xml += flavor) += ">\n";
        appendValues(texts, xml);
        xml += "</QUALIFIER>\n";
    }

    void appendStates() {
        std::vector<std::string> numbers;
        for (std::size_t i = 0; i < stateTexts().size(); ++i) {
            numbers.push_back(std::to_string(i));
        }
        numbers.emplace_back("..");
        numbers.emplace_back("0x8000..");
        std::vector<std::string> texts = stateTexts();
        texts.emplace_back("Reserved");
        texts.emplace_back("Of The Vendor");
        appendTexts("ValueMap", numbers, "");
        appendTexts("Values", texts, " TRANSLATABLE=\"true\"");
    }

    void appendDeclaration(const SyntheticProperty& property, std::string_view origin) {
        const std::string_view element = property.isArray() ? "PROPERTY.ARRAY" : "PROPERTY";
        ((((xml += '<') += element) += " NAME=\"") += property.name) += "\"";
        (((xml += origin) += " TYPE=\"") += property.type()) += "\">\n";
        if (property.isKey) {
            appendQualifier("Key", "boolean", "TRUE", " OVERRIDABLE=\"false\"");
        }
        appendDescription();
        if (property.isEnumerated()) {
            appendStates();
        } else if (property.kind == Kind::Text) {
            appendQualifier("MaxLen", "uint32", "64");
        } else if (property.kind == Kind::Uint64) {
            appendText("Units", "Bytes");
        }
        if (random.below(3) == 0) {
            appendTexts("ModelCorrespondence", {"Bench_Base." + property.name, "Bench_Other.State"},
                        "");
        }
        ((xml += "</") += element) += ">\n";
    }

    void appendMethod(const std::string& name) {
        xml += "<METHOD NAME=\"" + name + "\" TYPE=\"uint32\" PROPAGATED=\"true\">\n";
        appendDescription();
        appendStates();
        xml += "<PARAMETER NAME=\"Timeout\" TYPE=\"datetime\">\n";
        appendQualifier("IN", "boolean", "TRUE", " OVERRIDABLE=\"false\"");
        appendDescription();
        xml += "</PARAMETER>\n</METHOD>\n";
    }

    Random& random;
    std::string xml;
};

}  // namespace

std::string answerOpening(std::string_view messageId, std::string_view method) {
    std::string text =
        "<?xml version=\"1.0\" encoding=\"utf-8\" ?>\n<CIM CIMVERSION=\"2.0\" "
        "DTDVERSION=\"2.0\">\n<MESSAGE ID=\"";
    (text += messageId) += "\" PROTOCOLVERSION=\"1.0\">\n<SIMPLERSP>\n<IMETHODRESPONSE NAME=\"";
    (text += method) += "\">\n<IRETURNVALUE>\n";
    return text;
}

std::string_view answerEnd() {
    return "</IRETURNVALUE>\n</IMETHODRESPONSE>\n</SIMPLERSP>\n</MESSAGE>\n</CIM>\n";
}

std::string classXml(const SyntheticClass& synthetic, Random& random) {
    return ClassWriter(random).write(synthetic);
}

void appendInstanceXml(const SyntheticClass& synthetic, const InstanceTexts& texts,
                       std::string& xml) {
    xml += "<VALUE.NAMEDINSTANCE>\n";
    appendPath(synthetic, texts, xml);
    xml += "<INSTANCE CLASSNAME=\"" + synthetic.name + "\" >\n";
    for (std::size_t i = 0; i < texts.size(); ++i) {
        appendProperty(synthetic.properties[i], texts[i], xml);
    }
    xml += "</INSTANCE>\n</VALUE.NAMEDINSTANCE>\n";
}

}  // namespace bench
