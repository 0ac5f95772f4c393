#include "script/ServerCheck.h"

#include <algorithm>

#include "cim/CimText.h"
#include "report/Text.h"
#include "script/ColumnCheck.h"
#include "script/NameCheck.h"
#include "script/ValueCheck.h"

namespace sennetctl {

using namespace Pegasus;

namespace {

std::string nameOf(const AnsweredClass& answered) {
    return textOf(answered.definition.getClassName());
}

/// What an empty column shows nevertheless.
std::string insteadOf(const Column& column, const AnsweredClass& answered) {
    const std::string stand = standInFor(column, answered);
    return stand.empty() ? "" : "; " + stand + " is written";
}

// The generator keeps no list for a class without instances.
std::vector<const AnsweredClass*> listsOf(const std::vector<AnsweredClass>& classes) {
    std::vector<const AnsweredClass*> lists;
    for (const AnsweredClass& answered : classes) {
        if (!answered.instances.empty()) {
            lists.push_back(&answered);
        }
    }
    return lists;
}

/// "row 2", "rows 2 to 3".
std::string rowsBetween(std::size_t first, std::size_t last) {
    return first == last ? "row " + std::to_string(first)
                         : "rows " + std::to_string(first) + " to " + std::to_string(last);
}

}  // namespace

void ServerCheck::check(ScriptModel& model) {
    std::vector<AnsweredClass> classes;
    for (ScriptSlot& slot : model.slots) {
        if (!slot.isUsed()) {
            continue;
        }
        if (std::optional<AnsweredClass> answered = ask(model, slot)) {
            classes.push_back(std::move(*answered));
        }
    }
    checkPairing(model, classes);
    checkCounts(model, classes);
    for (const AnsweredClass& answered : classes) {
        checkColumns(model, answered);
    }
    if (scope.names) {
        checkNames(model, classes, texts, findings);
    }
}

std::optional<AnsweredClass> ServerCheck::ask(const ScriptModel& model, ScriptSlot& slot) {
    const std::string& nameSpace = model.namespaceOf(slot);
    AnsweredClass answered;
    answered.slot = &slot;
    try {
        answered.definition = server.getClass(nameSpace, slot.className.value);
        slot.serverSpelling = nameOf(answered);
    } catch (const CIMException& failure) {
        const bool byDefault =
            failure.getCode() == CIM_ERR_INVALID_NAMESPACE && slot.nameSpace.value.empty();
        add(model, slot.className, Severity::Error,
            "the server has no class " + slot.className.value + " in " + nameSpace +
                ", so sennet leaves it out: " + reasonOf(failure) +
                (byDefault ? " (no line N[n]= names another namespace)" : ""));
        return std::nullopt;
    }
    try {
        answered.instances = server.instances(nameSpace, slot.className.value);
    } catch (const CIMException& failure) {
        add(model, slot.className, Severity::Error,
            "the server does not give the instances of " + slot.className.value +
                ", so sennet takes it for empty: " + reasonOf(failure));
        return answered;
    }
    const std::string reason =
        answered.instances.empty() ? missing.reasonFor(answered, {}) : std::string();
    add(model, slot.className, Severity::Note,
        slot.className.value + ": " + counted(answered.instances.size(), "instance") +
            (reason.empty() ? "" : " (" + reason + ")"));
    return answered;
}

// Lists behind that of a class without instances move up.
void ServerCheck::checkPairing(const ScriptModel& model,
                               const std::vector<AnsweredClass>& classes) {
    const std::vector<const AnsweredClass*> lists = listsOf(classes);
    for (std::size_t k = 0; k < classes.size() && !lists.empty(); ++k) {
        const AnsweredClass* shown = k < lists.size() ? lists[k] : nullptr;
        if (shown == &classes[k] || (shown == nullptr && classes[k].instances.empty())) {
            continue;
        }
        add(model, classes[k].slot->className, Severity::Error,
            "a class without instances stands before others: the columns of " + nameOf(classes[k]) +
                (shown == nullptr ? " stay empty" : " show the instances of " + nameOf(*shown)));
    }
}

// The cells behind the end of a list are empty, and a reader puts the attribute's default there,
// which the generator takes from the first row.
void ServerCheck::checkCounts(const ScriptModel& model, const std::vector<AnsweredClass>& classes) {
    const std::vector<const AnsweredClass*> lists = listsOf(classes);
    const auto longest = std::max_element(lists.begin(), lists.end(),
                                          [](const AnsweredClass* one, const AnsweredClass* two) {
                                              return one->instances.size() < two->instances.size();
                                          });
    for (std::size_t k = 0; k < lists.size(); ++k) {
        const std::size_t count = lists[k]->instances.size();
        const std::size_t rows = (*longest)->instances.size();
        if (count < rows) {
            add(model, classes[k].slot->className, Severity::Warning,
                counted(count, "instance") + " of " + nameOf(*lists[k]) + " beside " +
                    std::to_string(rows) + " of " + nameOf(**longest) + ": in " +
                    rowsBetween(count + 1, rows) + " readers show the values of row 1 under the " +
                    "columns of " + nameOf(classes[k]) + " (for CA 0 or nothing)");
        }
    }
}

void ServerCheck::checkColumns(const ScriptModel& model, const AnsweredClass& answered) {
    for (const ScriptText& property : answered.slot->properties) {
        const std::optional<Column> column = columnOf(answered, property.value);
        if (!column) {
            add(model, property, Severity::Warning,
                nameOf(answered) + " has no property " + property.value +
                    ": the column stays empty");
            continue;
        }
        for (const ValueRemark& remark : remarksOn(*column, answered, texts)) {
            add(model, property, remark.severity, remark.message);
        }
        if (scope.sizes && lacksSize(*column, answered, texts)) {
            add(model, property, Severity::Warning,
                "neither the class nor the resource properties (" + nameOf(answered) + "." +
                    property.value + ".Size) give a size: 255 are taken");
        }
        if (!answered.instances.empty() && isEmpty(*column, answered)) {
            const std::string reason = missing.reasonFor(answered, property.value);
            add(model, property, Severity::Note,
                "the column " + property.value + " is empty" +
                    (reason.empty() ? "" : ": " + reason) + insteadOf(*column, answered));
        }
    }
}

void ServerCheck::add(const ScriptModel& model, const ScriptText& place, Severity severity,
                      const std::string& message) {
    findings.push_back({model.file, place.line, place.column, severity, message});
}

}  // namespace sennetctl
