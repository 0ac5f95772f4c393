#include "script/NewCommand.h"

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
#include "script/NewScript.h"
#include "script/ScriptModel.h"

namespace sennetctl {

namespace {

constexpr std::string_view kSuffix = ".script.inv";

/// The path without .script.inv.
std::string pathWithoutSuffix(const std::string& script) {
    if (script.size() <= kSuffix.size() ||
        script.compare(script.size() - kSuffix.size(), kSuffix.size(), kSuffix) != 0) {
        throw CannotRun(script, "the name of a script ends in .script.inv");
    }
    return script.substr(0, script.size() - kSuffix.size());
}

/// A script has no way to write these.
void refuseTitle(const std::string& title) {
    const bool any = std::any_of(title.begin(), title.end(), [](char c) {
        return c == '"' || c == '=' || static_cast<unsigned char>(c) < 0x20 || c == 0x7F;
    });
    if (any) {
        throw CannotRun("a title has no double quote, no '=' and no control character");
    }
}

std::vector<AnsweredClass> askFor(const NewOptions& options, const Output& output) {
    const Progress progress(output);
    LocalServer server;
    std::vector<AnsweredClass> classes;
    for (const std::string& name : options.classes) {
        progress.show("asking for " + name);
        try {
            classes.push_back({nullptr, server.getClass(options.nameSpace, name),
                               server.instances(options.nameSpace, name)});
        } catch (const Pegasus::CIMException& failure) {
            throw CannotRun(options.nameSpace + ":" + name + ": " + reasonOf(failure));
        }
    }
    return classes;
}

void report(const std::string& script, const std::string& properties, const NewScript& texts,
            const Output& output) {
    if (output.json) {
        Json document = Json::object();
        document["script"] = script;
        document["properties"] = properties;
        document["leftOut"] = texts.leftOut;
        printJson(document, output);
        return;
    }
    for (const std::string& leftOut : texts.leftOut) {
        output.out << "not listed: " << printable(leftOut) << '\n';
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
    refuseTitle(options.title);
    refuseExisting(options.script);
    refuseExisting(properties);
    const std::string stem = std::filesystem::path(path).filename().string();
    const std::string title =
        options.title.empty() ? readableName(stem) + " Inventory" : options.title;
    const NewScript texts = composeScript(stem, title, options.nameSpace, askFor(options, output));
    writeWholeFile(properties, texts.properties);
    try {
        writeWholeFile(options.script, texts.script);
    } catch (const CannotRun&) {
        Velm::TextFile(properties.c_str()).remove();
        throw;
    }
    report(options.script, properties, texts, output);
    return kFine;
}

}  // namespace sennetctl
