#include "mif/ValueLint.h"

#include <optional>

#include "mifreader/ValueChecker.h"

namespace sennetctl {

namespace {

using Mif::Type;
using Mif::Value;

constexpr std::size_t kLongestKeptText = 255;

bool isString(Type::Base base) {
    return base == Type::Base::String || base == Type::Base::DisplayString ||
           base == Type::Base::OctetString;
}

LintRule ruleFor(const Value& value, const Type& type) {
    const bool text = value.kind == Value::Kind::Text;
    if (isString(type.base)) {
        return text ? LintRule::LongLiteral : LintRule::IntegerAsText;
    }
    if (type.base == Type::Base::Date) {
        return text && value.text.empty() ? LintRule::EmptyDate : LintRule::InvalidDate;
    }
    return text ? LintRule::TextAsInteger : LintRule::WideInteger;
}

}  // namespace

void checkValue(const Value& value, const Type& type, LintReport& report) {
    if (value.kind == Value::Kind::Unsupported) {
        report.add(LintRule::Unsupported, value.position,
                   "'unsupported' as a value: old versions refuse it");
        return;
    }
    if (const std::optional<std::string> refusal = Mif::ValueChecker({}).refusalOf(value, type)) {
        const LintRule rule = ruleFor(value, type);
        report.add(
            rule, value.position,
            rule == LintRule::WideInteger ? *refusal + ": arrives wrong or negative" : *refusal);
    }
    if (value.kind != Value::Kind::Text) {
        return;
    }
    if (isString(type.base) && value.text.size() > kLongestKeptText) {
        report.add(
            LintRule::CutText, value.position,
            "text of " + std::to_string(value.text.size()) + " octets: no more than 255 are kept");
    }
    checkText(value.text, "value", value.position, report);
}

void checkText(const std::string& text, const std::string& what, Mif::Position position,
               LintReport& report) {
    if (text.find('"') != std::string::npos) {
        report.add(LintRule::FragileName, position,
                   "double quote in the " + what + " " + shownInFinding(text) +
                       ": old versions refuse the file");
    }
}

}  // namespace sennetctl
