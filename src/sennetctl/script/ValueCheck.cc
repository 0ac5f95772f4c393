#include "script/ValueCheck.h"

#include <algorithm>

#include "SennetConverter/framework/PropertyLookup.h"
#include "SennetConverter/mif/SennetConverter.h"
#include "SennetConverter/mif/ValueNames.h"
#include "cim/CimText.h"
#include "report/Text.h"

namespace sennetctl {

using namespace Pegasus;

namespace {

constexpr std::size_t kLongestText = 255;
constexpr std::size_t kLongestOther = 32;

/// What the generator keeps to itself.
struct Rules : SennetConverter {
    using SennetConverter::isCalendarDateTime;
};

template <typename T>
T read(const CIMValue& value) {
    T content{};
    value.get(content);
    return content;
}

/// Whether the product reads the number that the server gave.
bool survives(const CIMValue& value) {
    constexpr Sint64 kLargest = 0x7FFFFFFF;
    switch (value.getType()) {
        case CIMTYPE_UINT64:
            return read<Uint64>(value) <= Uint64(kLargest);
        case CIMTYPE_UINT32:
            return read<Uint32>(value) <= Uint32(kLargest);
        case CIMTYPE_SINT64:
            return read<Sint64>(value) >= -kLargest - 1 && read<Sint64>(value) <= kLargest;
        default:
            return true;
    }
}

/// Numbers of 64 bits are written whole in an array.
bool allSurvive(const CIMValue& value) {
    if (value.getType() != CIMTYPE_UINT32) {
        return true;
    }
    const auto numbers = read<Array<Uint32>>(value);
    const Uint32* begin = numbers.getData();
    return std::all_of(begin, begin + numbers.size(),
                       [](Uint32 number) { return number <= 0x7FFFFFFF; });
}

String joined(const Array<String>& texts) {
    String all;
    for (Uint32 i = 0; i < texts.size(); ++i) {
        all.append(i > 0 ? "," : "");
        all.append(texts[i]);
    }
    return all;
}

bool becomesBlank(Uint16 character) {
    return (character < ' ' && character != '\r' && character != '\n') || character > '~';
}

/// The values of a column, as texts that nothing has cut yet.
class WrittenColumn {
  public:
    WrittenColumn(const Column& theColumn, const AnsweredClass& theAnswered)
        : column(theColumn),
          answered(theAnswered),
          definition(theAnswered.definition),
          lookup(definition, theColumn.name),
          hasNames(hasQualifier(theColumn, "Values")) {}

    template <typename Visit>
    void forEach(Visit visit) const {
        for (const CIMInstance& instance : answered.instances) {
            visit(lookup.in(&instance));
        }
    }

    CIMType type() const {
        return answered.instances.empty() ? lookup.in(nullptr).type
                                          : lookup.in(&answered.instances.front()).type;
    }

    String textOf(const ResolvedProperty& shown) {
        const CIMValue& value = shown.value;
        if (CimConverter::isInteger(shown.type)) {
            return hasNames          ? namesOf(value, shown.type)
                   : value.isArray() ? SennetConverter::formatIntegerArray(value, shown.type)
                                     : CimConverter::mapInteger(value, shown.type);
        }
        if (shown.type != CIMTYPE_STRING) {
            return value.toString();
        }
        return value.isArray() ? joined(read<Array<String>>(value)) : read<String>(value);
    }

    bool survivesWriting(const ResolvedProperty& shown) const {
        if (shown.value.isNull() || !CimConverter::isInteger(shown.type) || hasNames) {
            return true;
        }
        return shown.value.isArray() ? allSurvive(shown.value) : survives(shown.value);
    }

    /// At how many characters the text is cut.
    static std::size_t limitOf(const ResolvedProperty& shown) {
        const bool isText = shown.value.isArray() || shown.type == CIMTYPE_STRING ||
                            CimConverter::isInteger(shown.type);
        return isText ? kLongestText : kLongestOther;
    }

  private:
    String namesOf(const CIMValue& value, CIMType type) {
        const CIMProperty property = *column.declared;
        const ValueNames& known = names.of(property, property.findQualifier(CIMName("Values")));
        if (!value.isArray()) {
            return known.nameOf(CimConverter::getUint64(value, type));
        }
        const Array<Uint64> numbers = CimConverter::getUint64Array(value, type);
        Array<String> texts;
        for (Uint32 i = 0; i < numbers.size(); ++i) {
            texts.append(known.nameOf(numbers[i]));
        }
        return joined(texts);
    }

    const Column& column;
    const AnsweredClass& answered;
    CIMClass definition;
    PropertyLookup lookup;
    bool hasNames;
    ValueNamesCache names;
};

/// How many values are lost in which way.
struct Losses {
    std::size_t cut = 0;
    std::size_t longerThanColumn = 0;
    std::size_t blanked = 0;
    std::size_t wide = 0;
    std::size_t noDates = 0;
    std::size_t missing = 0;
    std::size_t present = 0;
};

void countDate(const ResolvedProperty& shown, Losses& losses) {
    const String text = read<CIMDateTime>(shown.value).toString();
    losses.noDates += Rules::isCalendarDateTime(text) ? 0 : 1;
}

void countText(const String& text, std::size_t limit, std::size_t width, Losses& losses) {
    const std::size_t written = std::min<std::size_t>(text.size(), limit);
    losses.cut += text.size() > limit ? 1 : 0;
    losses.longerThanColumn += width > 0 && written > width ? 1 : 0;
    for (std::size_t i = 0; i < written; ++i) {
        if (becomesBlank(text[static_cast<Uint32>(i)])) {
            ++losses.blanked;
            return;
        }
    }
}

Losses countLosses(WrittenColumn& values, std::size_t width) {
    Losses losses;
    values.forEach([&](const ResolvedProperty& shown) {
        if (shown.value.isNull()) {
            ++losses.missing;
            return;
        }
        ++losses.present;
        if (shown.type == CIMTYPE_DATETIME && !shown.value.isArray()) {
            countDate(shown, losses);
            return;
        }
        losses.wide += values.survivesWriting(shown) ? 0 : 1;
        countText(values.textOf(shown), WrittenColumn::limitOf(shown),
                  shown.value.isArray() ? 0 : width, losses);
    });
    return losses;
}

std::string standInFor(CIMType type, bool isArray) {
    if (isArray) {
        return {};
    }
    if (type == CIMTYPE_DATETIME) {
        return std::string(SennetConverter::kUnknownDate) + " (for QVE nothing)";
    }
    return CimConverter::isInteger(type) ? "0 (for QVE null)" : "";
}

}  // namespace

std::vector<ValueRemark> remarksOn(const Column& column, const AnsweredClass& answered,
                                   const Velm::Properties& texts) {
    WrittenColumn values(column, answered);
    const std::size_t width = declaredSize(column, answered, texts);
    const Losses losses = countLosses(values, width);
    const std::string standIn = standInFor(column, answered);
    std::vector<ValueRemark> remarks;
    const auto add = [&](std::size_t count, const std::string& what,
                         Severity severity = Severity::Warning) {
        if (count > 0) {
            remarks.push_back(
                {severity, counted(count, "value") + " of " + textOf(column.name) + what});
        }
    };
    add(losses.cut, " cut, for texts end at 255 characters, and other values at 32");
    add(losses.longerThanColumn, " longer than the column of " + std::to_string(width));
    add(losses.blanked, " with letters beyond ASCII or control characters: each becomes a blank");
    add(losses.wide, " beyond 32 bits with sign: another number is written");
    add(losses.noDates, " no date from 1900 to 2099: " + standIn + " is written");
    if (losses.present > 0 && !standIn.empty()) {
        add(losses.missing, " missing: " + standIn + " is written", Severity::Note);
    }
    return remarks;
}

std::string standInFor(const Column& column, const AnsweredClass& answered) {
    return standInFor(WrittenColumn(column, answered).type(),
                      column.declared && column.declared->isArray());
}

std::size_t countWideValues(const Column& column, const AnsweredClass& answered) {
    const WrittenColumn values(column, answered);
    std::size_t count = 0;
    values.forEach(
        [&](const ResolvedProperty& shown) { count += values.survivesWriting(shown) ? 0 : 1; });
    return count;
}

std::size_t longestText(const Column& column, const AnsweredClass& answered) {
    WrittenColumn values(column, answered);
    std::size_t longest = 0;
    values.forEach([&](const ResolvedProperty& shown) {
        if (!shown.value.isNull()) {
            longest = std::max<std::size_t>(longest, values.textOf(shown).size());
        }
    });
    return longest;
}

}  // namespace sennetctl
