#include "bench/synthetic/SyntheticMof.h"

namespace bench {

namespace {

std::string literal(const SyntheticProperty& property, const std::string& text) {
    const bool isQuoted =
        std::string(property.type()) == "string" || property.kind == Kind::DateTime;
    if (!isQuoted) {
        return text;
    }
    std::string quoted = "\"";
    for (const char c : text) {
        if (c == '"' || c == '\\') {
            quoted += '\\';
        }
        quoted += c;
    }
    return quoted + "\"";
}

std::string value(const SyntheticProperty& property, const std::vector<std::string>& texts) {
    std::string mof;
    for (const std::string& text : texts) {
        mof += (mof.empty() ? "" : ", ") + literal(property, text);
    }
    return property.isArray() ? "{" + mof + "}" : mof;
}

}  // namespace

std::string classMof(const SyntheticClass& synthetic) {
    std::string mof = "class " + synthetic.name + " {\n";
    for (const SyntheticProperty& property : synthetic.properties) {
        mof += std::string(property.isKey ? "[Key] " : "") + property.type() + " " + property.name +
               (property.isArray() ? "[]" : "") + ";\n";
    }
    return mof + "};\n";
}

std::string instanceMof(const SyntheticClass& synthetic, const InstanceTexts& texts) {
    std::string mof = "instance of " + synthetic.name + " {\n";
    for (std::size_t i = 0; i < texts.size(); ++i) {
        const SyntheticProperty& property = synthetic.properties[i];
        mof += property.name + " = " + value(property, texts[i]) + ";\n";
    }
    return mof + "};\n";
}

}  // namespace bench
