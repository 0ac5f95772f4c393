#include "script/CheckCommand.h"

#include <Velm/DirectoryReader.h>
#include <Velm/PlatformUtilities.h>
#include <Velm/PropertiesFile.h>

#include <algorithm>
#include <memory>
#include <ostream>
#include <tuple>

#include "cim/LocalServer.h"
#include "report/Finding.h"
#include "report/Progress.h"
#include "report/Text.h"
#include "report/WholeFile.h"
#include "script/MissingValues.h"
#include "script/ScriptLint.h"
#include "script/ScriptReader.h"
#include "script/ServerCheck.h"

namespace sennetctl {

namespace {

constexpr std::size_t kLargestScriptOctets = std::size_t(1) << 20;

std::vector<std::string> installedScripts() {
    const char* directory = Velm::PlatformUtilities::getSennetDirectory();
    const Velm::DirectoryReader reader(directory, ".script.inv");
    std::vector<std::string> scripts;
    scripts.reserve(static_cast<std::size_t>(reader.getNumberOfFiles()));
    for (int i = 0; i < reader.getNumberOfFiles(); ++i) {
        scripts.emplace_back(reader.getFileName(i));
    }
    if (scripts.empty()) {
        throw CannotRun(std::string("there are no inventory scripts in ") + directory);
    }
    return scripts;
}

/// What is asked of the server for all scripts.
struct Answers {
    LocalServer server;
    MissingValues missing{server};
};

std::unique_ptr<Answers> connectUnlessOffline(const CheckOptions& options, const Output& output) {
    if (options.offline) {
        return nullptr;
    }
    try {
        return std::make_unique<Answers>();
    } catch (const CannotRun& failure) {
        output.err << "sennetctl: " << printable(failure.what())
                   << "\nsennetctl: only the scripts themselves are checked\n";
        return nullptr;
    }
}

std::vector<Finding> checkScriptFile(const std::string& file, const CheckOptions& options,
                                     const Velm::Properties& texts, Answers* answers) {
    std::vector<Finding> findings;
    ScriptModel model =
        ScriptReader(file, findings).read(readWholeFile(file, kLargestScriptOctets));
    checkScript(model, findings);
    if (options.translations) {
        checkTranslations(model, texts, findings);
    }
    if (answers != nullptr && !model.givenUp) {
        ServerCheck(answers->server, answers->missing, texts, options.translations, findings)
            .check(model);
    }
    std::stable_sort(findings.begin(), findings.end(), [](const Finding& one, const Finding& two) {
        return std::tie(one.line, one.column) < std::tie(two.line, two.column);
    });
    return findings;
}

}  // namespace

int checkScripts(const CheckOptions& options, const Output& output) {
    const std::vector<std::string> files =
        options.scripts.empty() ? installedScripts() : options.scripts;
    Velm::PropertiesFile texts(Velm::PlatformUtilities::getSennetResourceFile());
    texts.load();
    const std::unique_ptr<Answers> answers = connectUnlessOffline(options, output);
    std::vector<Finding> findings;
    {
        const Progress progress(output);
        for (std::size_t i = 0; i < files.size(); ++i) {
            progress.show("script " + std::to_string(i + 1) + " of " +
                          std::to_string(files.size()) + ": " + files[i]);
            const std::vector<Finding> found =
                checkScriptFile(files[i], options, texts.getProperties(), answers.get());
            findings.insert(findings.end(), found.begin(), found.end());
        }
    }
    return printFindings(findings, files, output);
}

}  // namespace sennetctl
