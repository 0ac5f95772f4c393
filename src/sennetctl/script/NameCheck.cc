#include "script/NameCheck.h"

#include <algorithm>

#include "CimScriptParser/CimScriptParser.h"
#include "SennetConverter/framework/NameRules.h"
#include "SennetConverter/framework/SennetUtilities.h"
#include "cim/CimText.h"
#include "script/FixedColumns.h"
#include "script/NameFaults.h"
#include "script/ScriptText.h"

namespace sennetctl {

using namespace Pegasus;

namespace {

/// A column before a product's rules.
struct NamedColumn {
    ScriptText place;
    String name;
    Uint32 number;    // its Id in the group
    bool isRepeated;  // its property has a column already, which has been told
};

String pegasusText(const std::string& text) {
    return String(text.c_str());
}

bool isRepeated(const ScriptSlot& slot, const ScriptText& property) {
    return std::any_of(
        slot.properties.begin(), slot.properties.end(), [&](const ScriptText& other) {
            return other.column < property.column && sameIgnoringCase(other.value, property.value);
        });
}

std::vector<NamedColumn> columnsOf(const std::vector<AnsweredClass>& classes,
                                   const Velm::Properties& texts) {
    std::vector<NamedColumn> columns;
    for (const AnsweredClass& answered : classes) {
        const String className = answered.definition.getClassName().getString();
        for (const ScriptText& property : answered.slot->properties) {
            const auto number = static_cast<Uint32>(columns.size() + 2);
            columns.push_back(
                {property, translatedPropertyName(texts, className, pegasusText(property.value)),
                 number, isRepeated(*answered.slot, property)});
        }
    }
    return columns;
}

class NameChecker {
  public:
    NameChecker(const ScriptModel& model, std::vector<Finding>& findings)
        : model(model), findings(findings) {}

    /// Names as SMS, LANDesk and CA take them.
    void checkPlain(const std::vector<NamedColumn>& columns) {
        Array<String> used;
        for (const NamedColumn& column : columns) {
            for (const NameFault& fault : literalFaults(textOf(column.name))) {
                add(column.place, "the name " + textOf(column.name) + fault.message,
                    fault.severity);
            }
            if (isRowNumberName(column.name)) {
                add(column.place,
                    "the name " + textOf(column.name) +
                        " is that of the numbers of rows, too: readers refuse two attributes of "
                        "one name",
                    Severity::Error);
            }
            tellRepeated(column, "all products", column.name, used);
        }
    }

    void checkQve(const std::vector<NamedColumn>& columns) {
        Array<String> used;
        for (const NamedColumn& column : columns) {
            const String name = shortened(column, "QVE", kLongestName);
            tellFixed(column, "QVE", name, isQveColumn(name));
            // What collides for all products has been told.
            if (!collidesPlainly(columns, column)) {
                tellRepeated(column, "QVE", name, used);
            }
            tellOtherCase(columns, column);
            tellRenamed(column);
            tellNoSqlName(column, name);
        }
    }

    /// Here words are abbreviated after the names were made different.
    void checkLumo(const std::vector<NamedColumn>& columns) {
        Array<String> used;
        std::vector<String> written;
        for (const NamedColumn& column : columns) {
            const String name = SennetUtilities::substituteValues(SennetUtilities::makeUnique(
                shortened(column, "QVE with Lumo", kLongestLumoName), number(column), used));
            tellFixed(column, "QVE with Lumo", name, isLumoColumn(name) && !isQveColumn(name));
            const bool taken =
                std::any_of(written.begin(), written.end(),
                            [&](const String& other) { return String::equalNoCase(other, name); });
            if (taken && !column.isRepeated) {
                add(column.place, "two columns are called " + textOf(name) +
                                      " for QVE with Lumo, which refuses the table");
            }
            written.push_back(name);
        }
    }

    void checkTitle(const ScriptText& place, const String& title) {
        for (const unsigned limit : {kLongestName, kLongestLumoName}) {
            const String name = SennetUtilities::hashString(title, limit);
            if (name.size() > 0 && !String::equal(name, withUnderscores(title))) {
                add(place, "the title " + textOf(title) + " is shortened to " + textOf(name) +
                               " for QVE" + (limit == kLongestLumoName ? " with Lumo" : ""));
            }
        }
    }

  private:
    static String withUnderscores(const String& text) {
        return SennetUtilities::replaceAll(text, ' ', '_');
    }

    static String number(const NamedColumn& column) {
        return SennetUtilities::toUnsignedDecimal(column.number);
    }

    static bool collidesPlainly(const std::vector<NamedColumn>& columns,
                                const NamedColumn& column) {
        return std::any_of(columns.begin(), columns.end(), [&](const NamedColumn& other) {
            return other.number < column.number && String::equal(other.name, column.name);
        });
    }

    void tellOtherCase(const std::vector<NamedColumn>& columns, const NamedColumn& column) {
        for (const NamedColumn& other : columns) {
            if (!column.isRepeated && other.number < column.number &&
                String::equalNoCase(other.name, column.name) &&
                !String::equal(other.name, column.name)) {
                add(column.place, "the names " + textOf(other.name) + " and " +
                                      textOf(column.name) +
                                      " differ in case only: for QVE the table has one twice");
                return;
            }
        }
    }

    void tellRenamed(const NamedColumn& column) {
        const String name =
            SennetUtilities::formatPropertyName4quvelle(column.name, column.name.size() + 1);
        String expected = withUnderscores(column.name);
        for (const char parenthesis : {'(', ')'}) {
            expected = SennetUtilities::replaceAll(expected, parenthesis, '_');
        }
        if (!String::equal(name, expected)) {
            add(column.place,
                "the name " + textOf(column.name) + " becomes " + textOf(name) +
                    " for QVE, for databases have a word that is called so",
                Severity::Note);
        }
    }

    void tellNoSqlName(const NamedColumn& column, const String& inQve) {
        const std::string name = textOf(inQve);
        if (isSqlWord(inQve)) {
            add(column.place, "the name " + textOf(column.name) +
                                  " is a word of SQL: for QVE some databases refuse the table");
        }
        for (const NameFault& fault : sqlNameFaults(name)) {
            add(column.place, "the name " + textOf(column.name) + fault.message, fault.severity);
        }
        if (!name.empty() && name[0] >= '0' && name[0] <= '9') {
            add(column.place, "the name " + textOf(column.name) +
                                  " begins with a digit: for QVE databases refuse the table");
        }
    }

    void tellFixed(const NamedColumn& column, const std::string& product, const String& name,
                   bool isFixed) {
        if (isFixed) {
            add(column.place,
                "each table of " + product + " has a column " + textOf(name) +
                    " already: it refuses this one",
                Severity::Error);
        }
    }

    void tellRepeated(const NamedColumn& column, const std::string& product, const String& name,
                      Array<String>& used) {
        const String unique = SennetUtilities::makeUnique(name, number(column), used);
        if (!String::equal(unique, name) && !column.isRepeated) {
            add(column.place, "two columns are called " + textOf(name) + ": for " + product +
                                  " this one becomes " + textOf(unique));
        }
    }

    /// The name as QVE takes it; tells when that cuts it.
    String shortened(const NamedColumn& column, const std::string& product, unsigned limit) {
        String name = SennetUtilities::formatPropertyName4quvelle(column.name, limit);
        if (column.name.size() > limit) {
            add(column.place, "the name " + textOf(column.name) + " is cut to " + textOf(name) +
                                  " for " + product);
        }
        return name;
    }

    void add(const ScriptText& place, const std::string& message,
             Severity severity = Severity::Warning) {
        findings.push_back({model.file, place.line, place.column, severity, message});
    }

    const ScriptModel& model;
    std::vector<Finding>& findings;
};

}  // namespace

void checkNames(const ScriptModel& model, const std::vector<AnsweredClass>& classes,
                const Velm::Properties& texts, std::vector<Finding>& findings) {
    const std::vector<NamedColumn> columns = columnsOf(classes, texts);
    NameChecker checker(model, findings);
    checker.checkPlain(columns);
    checker.checkQve(columns);
    checker.checkLumo(columns);
    checker.checkTitle(model.title, pegasusText(shownTitle(model, texts)));
}

std::string ownTitle(const ScriptModel& model) {
    return model.title.value.empty() ? textOf(CimScriptParser(pegasusText(model.file)).getTitle())
                                     : model.title.value;
}

std::string shownTitle(const ScriptModel& model, const Velm::Properties& texts) {
    return textOf(SennetUtilities::trim(translatedTitle(texts, pegasusText(ownTitle(model)))));
}

}  // namespace sennetctl
