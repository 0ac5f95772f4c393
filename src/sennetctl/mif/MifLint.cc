#include "mif/MifLint.h"

#include <algorithm>
#include <cctype>
#include <map>
#include <set>

#include "mif/LintReport.h"
#include "mif/MifText.h"
#include "mif/RowKeys.h"
#include "mif/ValueLint.h"
#include "mifreader/MifReader.h"
#include "report/Text.h"

namespace sennetctl {

namespace {

using Mif::Component;
using Mif::Group;
using Mif::Position;
using Mif::Table;
using Mif::Tolerance;

/// What the lint tells by itself, with a severity of its own, must not end the reading.
Mif::Tolerances tolerancesFor(MifProfile profile) {
    Mif::Tolerances tolerances = {Tolerance::RawLineEnds,    Tolerance::BareLineEnds,
                                  Tolerance::IntegersAsText, Tolerance::TextAsIntegers,
                                  Tolerance::WideIntegers,   Tolerance::AnyDates,
                                  Tolerance::LongLiterals};
    if (profile == MifProfile::Ca) {
        tolerances.add(Tolerance::PlainBackslashes);
    }
    return tolerances;
}

Position positionIn(std::string_view octets, std::size_t offset) {
    Position position;
    for (std::size_t i = 0; i < offset; ++i) {
        ++position.column;
        if (octets[i] == '\n') {
            ++position.line;
            position.column = 1;
        }
    }
    return position;
}

bool isBeyondAscii(char octet) {
    return static_cast<unsigned char>(octet) > 0x7E;
}

void checkEncoding(const MifText& text, LintReport& report) {
    if (text.encoding == MifText::Encoding::TwoOctetUnicode) {
        report.add(LintRule::Encoding, {}, "two-octet Unicode: importers do not read it");
    } else if (text.encoding == MifText::Encoding::Utf8WithMark) {
        report.add(LintRule::Encoding, {}, "UTF-8 byte-order mark: importers do not read it");
    }
    const auto first = std::find_if(text.octets.begin(), text.octets.end(), isBeyondAscii);
    const auto count = std::count_if(first, text.octets.end(), isBeyondAscii);
    if (count > 0) {
        const auto offset = static_cast<std::size_t>(first - text.octets.begin());
        report.add(LintRule::Encoding, positionIn(text.octets, offset),
                   counted(static_cast<std::size_t>(count), "octet") +
                       " beyond ASCII, of which this is the first: other characters arrive");
    }
}

/// Octets that no character set of the products has a character for are no reason to stop reading.
std::string readableOctets(std::string octets, MifProfile profile) {
    if (profile != MifProfile::Dmi) {
        for (char& c : octets) {
            const auto code = static_cast<unsigned char>(c);
            c = code >= 0x7F && code < 0xA0 ? '?' : c;
        }
    }
    return octets;
}

/// The texts between the bars; the last of them has all that follows the fourth bar.
std::vector<std::string> partsOf(std::string_view className) {
    constexpr std::size_t kMostParts = 5;
    std::vector<std::string> parts;
    std::size_t bar = className.find('|');
    while (bar != std::string_view::npos && parts.size() + 1 < kMostParts) {
        parts.emplace_back(className.substr(0, bar));
        className.remove_prefix(bar + 1);
        bar = className.find('|');
    }
    parts.emplace_back(className);
    return parts;
}

std::string lowerCase(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return text;
}

bool isReserved(const std::string& name) {
    const std::string lower = lowerCase(name);
    return lower == "identification" || lower == "architecture";
}

void checkClassName(const Group& group, LintReport& report) {
    const std::vector<std::string> parts = partsOf(group.className);
    const bool empty = std::any_of(parts.begin(), parts.end(),
                                   [](const std::string& part) { return part.empty(); });
    if (parts.size() != 3 || empty) {
        report.add(LintRule::ClassForm, group.classPosition,
                   "the class " + shownInFinding(group.className) +
                       " is not of the form body|name|version");
    }
    if (isReserved(group.name) || std::any_of(parts.begin(), parts.end(), isReserved)) {
        report.add(LintRule::ReservedName, group.namePosition,
                   "the group " + shownInFinding(group.name) + " of class " +
                       shownInFinding(group.className) + " would alter the machine's own record");
    }
    checkText(group.className, "class", group.classPosition, report);
}

void checkAttribute(const Mif::Attribute& attribute, LintReport& report) {
    if (!attribute.name.empty() && attribute.name.back() == ' ') {
        report.add(LintRule::FragileName, attribute.namePosition,
                   "trailing blank in the name '" + shownInFinding(attribute.name) +
                       "': old versions refuse the file");
    }
    checkText(attribute.name, "name", attribute.namePosition, report);
    checkText(attribute.description, "description", attribute.namePosition, report);
    if (attribute.value) {
        checkValue(*attribute.value, attribute.type, report);
    }
}

void checkGroup(const Group& group, LintReport& report) {
    checkClassName(group, report);
    checkText(group.name, "name", group.namePosition, report);
    checkText(group.description, "description", group.namePosition, report);
    for (const Mif::Attribute& attribute : group.attributes) {
        checkAttribute(attribute, report);
    }
}

void checkTable(const Table& table, const Group& group, LintReport& report) {
    checkText(table.name, "name", table.namePosition, report);
    for (const Mif::Row& row : table.rows) {
        for (std::size_t i = 0; i < row.values.size(); ++i) {
            checkValue(row.values[i], group.attributes[i].type, report);
        }
    }
}

void checkKeys(const Component& component, LintReport& report) {
    std::set<std::string> withoutKey;
    for (const Group& group : component.groups) {
        if (group.key.empty() && !withoutKey.insert(group.className).second) {
            report.add(LintRule::NoKey, group.classPosition,
                       "one more instance of the class " + shownInFinding(group.className) +
                           ", which has no Key: it overwrites the others");
        }
    }
}

void checkRowKeys(const Component& component, LintReport& report) {
    std::map<std::size_t, RowKeys> keysOfGroup;
    for (const Table& table : component.tables) {
        RowKeys& keys =
            keysOfGroup.try_emplace(table.group, component.groups[table.group]).first->second;
        for (const Mif::Row& row : table.rows) {
            if (keys.isRepeated(row)) {
                report.add(LintRule::RepeatedKey,
                           row.values.empty() ? table.namePosition : row.values[0].position,
                           "one more row with the key of an earlier one: it overwrites that");
            }
        }
    }
}

void checkTemplates(const Component& component, LintReport& report) {
    std::vector<bool> used(component.groups.size());
    for (const Table& table : component.tables) {
        used[table.group] = true;
    }
    for (std::size_t i = 0; i < component.groups.size(); ++i) {
        if (component.groups[i].isTemplate() && !used[i]) {
            report.add(LintRule::UnusedTemplate, component.groups[i].namePosition,
                       "the group " + shownInFinding(component.groups[i].name) +
                           " describes rows, and no table has any");
        }
    }
}

void checkComponent(const Component& component, LintReport& report) {
    checkText(component.name, "name", component.namePosition, report);
    checkText(component.description, "description", component.namePosition, report);
    for (const Position position : component.rawLineEnds) {
        report.add(LintRule::RawLineEnd, position, "line end in a literal");
    }
    for (const Group& group : component.groups) {
        checkGroup(group, report);
    }
    for (const Table& table : component.tables) {
        checkTable(table, component.groups[table.group], report);
    }
    checkRowKeys(component, report);
    checkKeys(component, report);
    checkTemplates(component, report);
    const bool hasId = std::any_of(
        component.groups.begin(), component.groups.end(),
        [](const Group& group) { return group.className.rfind("DMTF|ComponentID|", 0) == 0; });
    if (!hasId) {
        report.add(LintRule::NoComponentId, component.namePosition,
                   "no group of the class DMTF|ComponentID|001");
    }
}

}  // namespace

std::vector<Finding> MifLint::check(const std::string& file, std::string_view octets) {
    LintReport report(file, options.profile);
    if (octets.size() > options.largestKilobytes * 1024) {
        report.add(LintRule::LargeFile, {},
                   "file of " + std::to_string((octets.size() + 1023) / 1024) +
                       " KB: the site takes " + std::to_string(options.largestKilobytes));
    }
    const MifText text = mifTextOf(octets);
    checkEncoding(text, report);
    try {
        const Component component = Mif::MifReader(tolerancesFor(options.profile))
                                        .read(readableOctets(text.octets, options.profile));
        checkComponent(component, report);
        for (const Group& group : component.groups) {
            checkAttributesOfClass(group, report);
        }
    } catch (const Mif::Error& error) {
        report.add(LintRule::Structure, error.position(), error.message());
    }
    return report.take();
}

void MifLint::checkAttributesOfClass(const Group& group, LintReport& report) {
    Names names;
    std::set<std::string_view> present;
    for (const Mif::Attribute& attribute : group.attributes) {
        names.push_back(attribute.name);
        present.insert(attribute.name);
    }
    for (const std::string& earlier : attributesByClass[group.className]) {
        if (present.count(earlier) == 0) {
            report.add(LintRule::LostAttribute, group.namePosition,
                       "the attribute " + shownInFinding(earlier) + " of the class " +
                           shownInFinding(group.className) +
                           ", which an earlier file had, is missing: it becomes NULL");
        }
    }
    attributesByClass[group.className] = std::move(names);
}

}  // namespace sennetctl
