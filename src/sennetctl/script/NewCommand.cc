#include "script/NewCommand.h"

#include <Velm/PropertiesFile.h>
#include <Velm/TextFile.h>

#include <algorithm>
#include <filesystem>
#include <ostream>

#include "cim/CimText.h"
#include "cim/LocalServer.h"
#include "report/Json.h"
#include "report/Progress.h"
#include "report/Text.h"
#include "report/WholeFile.h"
#include "script/ColumnNames.h"
#include "script/NameFaults.h"
#include "script/NewScript.h"
#include "script/ScriptModel.h"
#include "script/ScriptText.h"

namespace sennetctl {

namespace {

constexpr std::size_t kLongestTitle = 13;  // what no product shortens

/// The path without .script.inv.
std::string pathWithoutSuffix(const std::string& script) {
    const std::string name = std::filesystem::path(script).filename().string();
    if (name.size() <= kScriptSuffix.size() ||
        name.compare(name.size() - kScriptSuffix.size(), kScriptSuffix.size(), kScriptSuffix) !=
            0) {
        throw CannotRun(script, "the name of a script ends in .script.inv");
    }
    return script.substr(0, script.size() - kScriptSuffix.size());
}

/// What no script can write, or breaks the files that are made of it.
void refuseTitle(const std::string& title) {
    constexpr std::size_t kLongestTitle = 200;
    const bool any = std::any_of(title.begin(), title.end(), [](char c) {
        return std::string_view("\"\\$`=|").find(c) != std::string_view::npos ||
               static_cast<unsigned char>(c) < 0x20 || c == 0x7F;
    });
    if (any) {
        throw CannotRun(
            "a title has none of the characters \" \\ $ ` = | and no control character");
    }
    const bool isAscii = std::all_of(title.begin(), title.end(),
                                     [](char c) { return static_cast<unsigned char>(c) < 0x80; });
    if (title.empty() || title.size() > kLongestTitle || !isAscii) {
        throw CannotRun("a title is a text of 1 to 200 letters of ASCII");
    }
}

void refuseReservedName(const std::string& name) {
    const std::vector<NameFault> faults = groupNameFaults(name);
    if (!faults.empty()) {
        throw CannotRun("the title " + name + faults.front().message);
    }
}

void refuseRepeatedClasses(const std::vector<std::string>& classes) {
    for (auto name = classes.begin(); name != classes.end(); ++name) {
        const bool repeated = std::any_of(classes.begin(), name, [&](const std::string& other) {
            return sameIgnoringCase(other, *name);
        });
        if (repeated) {
            throw CannotRun("the class " + *name + " is given twice");
        }
    }
}

/// Files, title and texts; the classes are for the server to tell.
NewScriptPlan planFor(const NewOptions& options) {
    NewScriptPlan plan;
    plan.fileName = std::filesystem::path(options.script).filename().string();
    const std::string stem = readableName(pathWithoutSuffix(plan.fileName));
    plan.title = options.title.empty() ? trimmed(stem) + " Inventory" : trimmed(options.title);
    refuseTitle(plan.title);
    plan.shownTitle = withShorterWords(options.title.empty() ? stem : plan.title, kLongestTitle);
    refuseReservedName(plan.title);
    refuseReservedName(plan.shownTitle);
    plan.nameSpace = options.nameSpace;
    Velm::PropertiesFile texts(options.resources.c_str());
    texts.load();
    plan.texts = texts.getProperties();
    return plan;
}

std::vector<AnsweredClass> askFor(const NewOptions& options, const Output& output) {
    const Progress progress(output);
    LocalServer server(options.timeoutSeconds * 1000);
    std::vector<AnsweredClass> classes;
    for (const std::string& name : options.classes) {
        progress.show("asking for " + name);
        try {
            const Pegasus::CIMClass definition = server.getClass(options.nameSpace, name);
            server.setTimeout(LocalServer::kTimeoutMilliseconds);
            classes.push_back({nullptr, definition, server.instances(options.nameSpace, name)});
        } catch (const Pegasus::CIMException& failure) {
            throw CannotRun(options.nameSpace + ":" + name + ": " + reasonOf(failure));
        }
    }
    return classes;
}

/// Rows of classes stand side by side, whatever they belong to; empty for one class.
std::string remarkOnCounts(const std::vector<AnsweredClass>& classes) {
    const bool differ = std::any_of(classes.begin(), classes.end(), [&](const AnsweredClass& one) {
        return one.instances.size() != classes.front().instances.size();
    });
    if (!differ) {
        return {};
    }
    std::string counts;
    for (const AnsweredClass& one : classes) {
        counts += (counts.empty() ? "" : ", ") + textOf(one.definition.getClassName()) + " " +
                  std::to_string(one.instances.size());
    }
    return "the classes have different numbers of instances (" + counts +
           "), whose rows stand side by side: better write a script for each";
}

void report(const NewOptions& options, const std::string& properties, const NewScript& texts,
            const std::string& remark, const Output& output) {
    const std::string& script = options.script;
    if (output.json) {
        Json document = Json::object();
        document["script"] = script;
        document["properties"] = properties;
        document["leftOut"] = texts.leftOut;
        document["present"] = texts.present;
        document["remark"] = remark.empty() ? Json(nullptr) : Json(remark);
        printJson(document, output);
        return;
    }
    for (const std::string& leftOut : texts.leftOut) {
        output.out << "not listed: " << printable(leftOut) << '\n';
    }
    for (const std::string& present : texts.present) {
        output.out << "in " << printable(options.resources) << " already: " << printable(present)
                   << '\n';
    }
    if (!remark.empty()) {
        output.out << "warning: " << printable(remark) << '\n';
    }
    output.out
        << "Written: " << printable(script) << " and " << printable(properties)
        << "\nEdit both, append the second to the resource properties (sennet.properties), and\n"
           "run: sennetctl check --translations "
        << printable(script) << '\n';
}

}  // namespace

int writeNewScript(const NewOptions& options, const Output& output) {
    const std::string path = pathWithoutSuffix(options.script);
    const std::string properties = path + ".properties";
    if (options.classes.size() > ScriptModel::kSlots) {
        throw CannotRun("a script has room for 10 classes");
    }
    refuseRepeatedClasses(options.classes);
    NewScriptPlan plan = planFor(options);
    refuseExisting(options.script);
    refuseExisting(properties);
    plan.classes = askFor(options, output);
    const NewScript texts = composeScript(plan);
    writeWholeFile(properties, texts.properties);
    try {
        writeWholeFile(options.script, texts.script);
    } catch (const CannotRun&) {
        Velm::TextFile(properties.c_str()).remove();
        throw;
    }
    report(options, properties, texts, remarkOnCounts(plan.classes), output);
    return kFine;
}

}  // namespace sennetctl
