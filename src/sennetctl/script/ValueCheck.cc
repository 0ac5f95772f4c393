#include "script/ValueCheck.h"

#include <algorithm>
#include <optional>
#include <utility>

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
constexpr std::size_t kLongestDate = 8;  // for QVE

/// What the generator keeps to itself.
struct Rules : SennetConverter {
    using SennetConverter::escape;
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

/// No more of the texts than shows whether they are cut: names may be long and in each element.
template <typename TextAt>
String joined(Uint32 count, TextAt textAt) {
    constexpr Uint32 kEnough = kLongestText + 1;
    String all;
    for (Uint32 i = 0; i < count && all.size() < kEnough; ++i) {
        all.append(i > 0 ? "," : "");
        all.append(textAt(i).subString(0, kEnough));
    }
    return all;
}

bool becomesBlank(Uint16 character) {
    return (character < ' ' && character != '\r' && character != '\n') || character > '~';
}

/// The values of a column, as texts that nothing has cut yet to the length they are written in.
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
        if (!value.isArray()) {
            return read<String>(value);
        }
        const auto texts = read<Array<String>>(value);
        return joined(texts.size(), [&](Uint32 i) { return texts[i]; });
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
        return joined(numbers.size(), [&](Uint32 i) { return known.nameOf(numbers[i]); });
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
    std::size_t longerThanSqlColumn = 0;
    std::size_t blanked = 0;
    std::size_t quoted = 0;
    std::size_t lineEnds = 0;
    std::size_t hiddenEnds = 0;  // of literals of CA
    std::size_t wide = 0;
    std::size_t noDates = 0;
    std::size_t missing = 0;
    std::size_t present = 0;
};

/// How wide a column is that shows the values; 0 for no limit.
struct Widths {
    std::size_t everywhere = 0;
    std::size_t inSql = 0;  // where only QVE's schema scripts take the size
};

Widths widthsOf(const Column& column, const AnsweredClass& answered, CIMType type,
                const Velm::Properties& texts) {
    const bool isArray = column.declared && column.declared->isArray();
    if (isArray || type == CIMTYPE_DATETIME) {
        return {0, givenSize(column, answered, texts)};
    }
    return {declaredSize(column, answered, texts), 0};
}

/// Month/day/year, in which months and days have no leading zero.
std::size_t lengthForQve(const String& date) {
    return kLongestDate - (Uint16(date[4]) == '0' ? 1 : 0) - (Uint16(date[6]) == '0' ? 1 : 0);
}

void countDate(const ResolvedProperty& shown, std::size_t width, Losses& losses) {
    const String text = read<CIMDateTime>(shown.value).toString();
    if (!Rules::isCalendarDateTime(text)) {
        ++losses.noDates;
    } else if (width > 0 && lengthForQve(text) > width) {
        ++losses.longerThanSqlColumn;
    }
}

template <typename Is>
bool hasAny(const String& text, std::size_t written, Is is) {
    const Char16* begin = text.getChar16Data();
    return std::any_of(begin, begin + written, [&](Char16 c) { return is(Uint16(c)); });
}

/// Whether the quote behind the text is taken for a part of it where CA reads it. References and
/// the like are cut after they were escaped.
bool hidesEndForCa(const String& text, std::size_t limit) {
    const String written = limit == kLongestOther ? Rules::escape(text, "\r\n\"") : text;
    const std::size_t size = std::min<std::size_t>(written.size(), limit);
    return size > 0 && Uint16(written[static_cast<Uint32>(size - 1)]) == '\\';
}

void countText(const String& text, std::size_t limit, const Widths& widths, Losses& losses) {
    const std::size_t written = std::min<std::size_t>(text.size(), limit);
    losses.cut += text.size() > limit ? 1 : 0;
    losses.longerThanColumn += widths.everywhere > 0 && written > widths.everywhere ? 1 : 0;
    losses.longerThanSqlColumn += widths.inSql > 0 && written > widths.inSql ? 1 : 0;
    losses.blanked += hasAny(text, written, becomesBlank) ? 1 : 0;
    losses.quoted += hasAny(text, written, [](Uint16 c) { return c == '"'; }) ? 1 : 0;
    losses.hiddenEnds += hidesEndForCa(text, limit) ? 1 : 0;
    losses.lineEnds +=
        hasAny(text, written, [](Uint16 c) { return c == '\r' || c == '\n'; }) ? 1 : 0;
}

Losses countLosses(WrittenColumn& values, const Widths& widths) {
    Losses losses;
    values.forEach([&](const ResolvedProperty& shown) {
        if (shown.value.isNull()) {
            ++losses.missing;
            return;
        }
        ++losses.present;
        if (shown.type == CIMTYPE_DATETIME && !shown.value.isArray()) {
            countDate(shown, widths.inSql, losses);
            return;
        }
        losses.wide += values.survivesWriting(shown) ? 0 : 1;
        countText(values.textOf(shown), WrittenColumn::limitOf(shown), widths, losses);
    });
    return losses;
}

/// Characters that any value of the type has room in; 0 where the type does not tell.
std::size_t roomFor(CIMType type) {
    switch (type) {
        case CIMTYPE_UINT8:
            return 3;
        case CIMTYPE_SINT8:
            return 4;
        case CIMTYPE_UINT16:
            return 5;
        case CIMTYPE_SINT16:
            return 6;
        case CIMTYPE_UINT32:
        case CIMTYPE_UINT64:
            return 10;
        case CIMTYPE_SINT32:
        case CIMTYPE_SINT64:
            return 11;
        case CIMTYPE_DATETIME:
            return kLongestDate;
        default:
            return 0;
    }
}

/// What is told of a size that is enough for the values, but not for others of the type.
std::optional<ValueRemark> remarkOnSize(const Column& column, CIMType type, std::size_t size) {
    if (size == 0 || size >= roomFor(type) || hasQualifier(column, "Values") ||
        (column.declared && column.declared->isArray())) {
        return std::nullopt;
    }
    return ValueRemark{Severity::Note, "the size " + std::to_string(size) + " of the column " +
                                           textOf(column.name) + " is less than the " +
                                           std::to_string(roomFor(type)) +
                                           " characters that its type may need"};
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
    const Widths widths = widthsOf(column, answered, values.type(), texts);
    const Losses losses = countLosses(values, widths);
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
    add(losses.longerThanColumn, " longer than the column of " + std::to_string(widths.everywhere));
    add(losses.longerThanSqlColumn,
        " longer than the column of " + std::to_string(widths.inSql) + " in QVE's schema scripts");
    add(losses.blanked, " with letters beyond ASCII or control characters: each becomes a blank");
    add(losses.quoted,
        " with a double quote: old versions of SMS refuse the file, and for QVE it becomes '");
    add(losses.lineEnds,
        " with a line end, which is written as it is: readers that keep to the standard refuse it",
        Severity::Note);
    add(losses.hiddenEnds,
        " with a backslash at the end: the file of all scripts cannot be read by CA",
        Severity::Error);
    add(losses.wide, " beyond 32 bits with sign: another number is written");
    add(losses.noDates, " no date from 1900 to 2099: " + standIn + " is written");
    if (losses.present > 0 && !standIn.empty()) {
        add(losses.missing, " missing: " + standIn + " is written", Severity::Note);
    }
    if (losses.longerThanColumn + losses.longerThanSqlColumn == 0) {
        if (auto remark = remarkOnSize(column, values.type(), givenSize(column, answered, texts))) {
            remarks.push_back(*std::move(remark));
        }
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
