#include "mifreader/Tolerance.h"

#include <utility>

namespace Mif {

std::optional<Tolerance> parseTolerance(std::string_view name) {
    static constexpr std::pair<std::string_view, Tolerance> kNames[] = {
        {"raw-line-ends", Tolerance::RawLineEnds},
        {"bare-line-ends", Tolerance::BareLineEnds},
        {"plain-backslashes", Tolerance::PlainBackslashes},
        {"integers-as-text", Tolerance::IntegersAsText},
        {"text-as-integers", Tolerance::TextAsIntegers},
        {"unsigned-integers", Tolerance::UnsignedIntegers},
        {"wide-integers", Tolerance::WideIntegers},
        {"any-dates", Tolerance::AnyDates},
        {"empty-dates", Tolerance::EmptyDates},
        {"long-literals", Tolerance::LongLiterals},
        {"repeated-names", Tolerance::RepeatedNames},
    };
    for (const auto& [known, tolerance] : kNames) {
        if (known == name) {
            return tolerance;
        }
    }
    return std::nullopt;
}

}  // namespace Mif
