#include "mif/MifLint.h"

#include <algorithm>
#include <cctype>
#include <map>
#include <set>

#include "mif/LintReport.h"
#include "mif/MifText.h"
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

std::vector<std::string> partsOf(const std::string& className) {
    std::vector<std::string> parts(1);
    for (const char c : className) {
        if (c == '|') {
            parts.emplace_back();
        } else {
            parts.back() += c;
        }
    }
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
        report.add(
            LintRule::ClassForm, group.classPosition,
            "the class " + fromLatin1(group.className) + " is not of the form body|name|version");
    }
    if (isReserved(group.name) || std::any_of(parts.begin(), parts.end(), isReserved)) {
        report.add(LintRule::ReservedName, group.namePosition,
                   "the group " + fromLatin1(group.name) + " of class " +
                       fromLatin1(group.className) + " would alter the machine's own record");
    }
    checkText(group.className, "class", group.classPosition, report);
}

void checkAttribute(const Mif::Attribute& attribute, LintReport& report) {
    if (!attribute.name.empty() && attribute.name.back() == ' ') {
        report.add(LintRule::FragileName, attribute.namePosition,
                   "trailing blank in the name '" + fromLatin1(attribute.name) +
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
                       "one more instance of the class " + fromLatin1(group.className) +
                           ", which has no Key: it overwrites the others");
        }
    }
}

std::string keyText(const Mif::Value& value) {
    return value.kind == Mif::Value::Kind::Integer
               ? (value.negative ? "-" : "") + std::to_string(value.magnitude)
               : value.text;
}

/// What tells a row from the others of its class.
std::vector<std::string> keyOf(const Mif::Row& row, const Group& group) {
    std::vector<std::string> key;
    for (std::size_t place = 0; place < group.attributes.size(); ++place) {
        const auto& ids = group.key;
        if (std::find(ids.begin(), ids.end(), group.attributes[place].id) != ids.end()) {
            key.push_back(keyText(row.at(group, place)));
        }
    }
    return key;
}

void checkRowKeys(const Component& component, LintReport& report) {
    std::map<std::size_t, std::set<std::vector<std::string>>> keysOfGroup;
    for (const Table& table : component.tables) {
        const Group& group = component.groups[table.group];
        for (const Mif::Row& row : table.rows) {
            if (!keysOfGroup[table.group].insert(keyOf(row, group)).second) {
                report.add(LintRule::RepeatedKey,
                           row.values.empty() ? table.namePosition : row.values[0].position,
                           "one more row with the key of an earlier one: it overwrites that");
            }
        }
    }
}

void checkTemplates(const Component& component, LintReport& report) {
    for (std::size_t i = 0; i < component.groups.size(); ++i) {
        const bool used = std::any_of(component.tables.begin(), component.tables.end(),
                                      [i](const Table& table) { return table.group == i; });
        if (component.groups[i].isTemplate() && !used) {
            report.add(LintRule::UnusedTemplate, component.groups[i].namePosition,
                       "the group " + fromLatin1(component.groups[i].name) +
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
    for (const Mif::Attribute& attribute : group.attributes) {
        names.push_back(attribute.name);
    }
    for (const std::string& earlier : attributesByClass[group.className]) {
        if (std::find(names.begin(), names.end(), earlier) == names.end()) {
            report.add(LintRule::LostAttribute, group.namePosition,
                       "the attribute " + fromLatin1(earlier) + " of the class " +
                           fromLatin1(group.className) +
                           ", which an earlier file had, is missing: it becomes NULL");
        }
    }
    attributesByClass[group.className] = std::move(names);
}

}  // namespace sennetctl
