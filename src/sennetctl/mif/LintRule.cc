#include "mif/LintRule.h"

#include <array>
#include <cstddef>

namespace sennetctl {

namespace {

using Severities = std::array<std::optional<Severity>, 4>;  // in the order of MifProfile

constexpr std::optional<Severity> kSilent = std::nullopt;
constexpr std::optional<Severity> kWarning = Severity::Warning;
constexpr std::optional<Severity> kError = Severity::Error;

Severities severitiesOf(LintRule rule) {
    switch (rule) {
        case LintRule::Structure:
        case LintRule::TextAsInteger:
            return {kError, kError, kError, kError};
        case LintRule::IntegerAsText:
            return {kError, kWarning, kWarning, kSilent};
        case LintRule::WideInteger:
        case LintRule::LongLiteral:
        case LintRule::InvalidDate:
            return {kError, kWarning, kWarning, kWarning};
        case LintRule::NoKey:
        case LintRule::RepeatedKey:
            return {kError, kError, kWarning, kWarning};
        case LintRule::ReservedName:
        case LintRule::FragileName:
            return {kSilent, kError, kSilent, kSilent};
        case LintRule::Unsupported:
        case LintRule::LargeFile:
        case LintRule::LostAttribute:
            return {kSilent, kWarning, kSilent, kSilent};
        case LintRule::CutText:
            return {kSilent, kWarning, kSilent, kWarning};
        case LintRule::Encoding:
            return {kSilent, kError, kWarning, kWarning};
        case LintRule::RawLineEnd:
        case LintRule::EmptyDate:
            return {kError, kSilent, kSilent, kSilent};
        case LintRule::ClassForm:
        case LintRule::NoComponentId:
            return {kWarning, kSilent, kWarning, kSilent};
        case LintRule::UnusedTemplate:
            break;
    }
    return {kWarning, kWarning, kWarning, kWarning};
}

}  // namespace

std::optional<MifProfile> parseMifProfile(const std::string& name) {
    static constexpr const char* kNames[] = {"dmi", "sms", "ca", "landesk"};
    for (std::size_t i = 0; i < std::size(kNames); ++i) {
        if (name == kNames[i]) {
            return static_cast<MifProfile>(i);
        }
    }
    return std::nullopt;
}

std::optional<Severity> severityOf(LintRule rule, MifProfile profile) {
    return severitiesOf(rule)[static_cast<std::size_t>(profile)];
}

}  // namespace sennetctl
