#include "script/TitleCheck.h"

#include <algorithm>

#include "script/NameCheck.h"
#include "script/NameFaults.h"
#include "script/ScriptText.h"

namespace sennetctl {

namespace {

void add(const ScriptModel& model, Severity severity, const std::string& message,
         std::vector<Finding>& findings) {
    findings.push_back({model.file, model.title.line, model.title.column, severity, message});
}

void addFaults(const ScriptModel& model, const std::string& title,
               const std::vector<NameFault>& faults, std::vector<Finding>& findings) {
    for (const NameFault& fault : faults) {
        add(model, fault.severity, "the title " + title + fault.message, findings);
    }
}

}  // namespace

// The class of a table has the script's title, its name the one that is shown.
void TitleCheck::check(const ScriptModel& model, const Velm::Properties& texts,
                       std::vector<Finding>& findings) {
    const Known title{model.file, ownTitle(model), shownTitle(model, texts)};
    addFaults(model, title.shown, groupNameFaults(title.shown), findings);
    addFaults(model, title.shown, sqlNameFaults(title.shown), findings);
    addFaults(model, title.title, classFaults(title.title), findings);
    std::string untranslated = title.title;
    std::replace(untranslated.begin(), untranslated.end(), ' ', '_');
    if (untranslated != title.shown) {
        addFaults(model, title.title, literalFaults(title.title), findings);
        addFaults(model, title.title, shellTextFaults(title.title), findings);
    }
    if (!model.givenUp) {
        compare(title, model, findings);
    }
    known.push_back(title);
}

void TitleCheck::compare(const Known& title, const ScriptModel& model,
                         std::vector<Finding>& findings) const {
    const auto tellFirst = [&](const auto& isSame, const std::string& consequence) {
        const auto first = std::find_if(known.begin(), known.end(), [&](const Known& other) {
            return other.file != title.file && isSame(other);
        });
        if (first == known.end()) {
            return false;
        }
        add(model, Severity::Warning, first->file + " has the title " + first->shown + consequence,
            findings);
        return true;
    };
    tellFirst([&](const Known& other) { return other.title == title.title; },
              ", too: both tables get the same MIF class") ||
        tellFirst([&](const Known& other) { return other.shown == title.shown; },
                  ", too: for QVE both are one SQL table and view") ||
        tellFirst([&](const Known& other) { return sameIgnoringCase(other.shown, title.shown); },
                  ": for QVE both are one SQL table in databases that ignore case");
}

}  // namespace sennetctl
