#include "script/CheckCommand.h"

#include <Velm/DirectoryReader.h>
#include <Velm/PropertiesFile.h>

#include <algorithm>
#include <filesystem>
#include <memory>
#include <optional>
#include <ostream>
#include <system_error>
#include <tuple>
#include <utility>

#include "cim/LocalServer.h"
#include "report/Finding.h"
#include "report/Progress.h"
#include "report/Text.h"
#include "report/WholeFile.h"
#include "script/KeySpelling.h"
#include "script/MissingValues.h"
#include "script/PassedOver.h"
#include "script/PropertiesLint.h"
#include "script/ScriptLint.h"
#include "script/ScriptReader.h"
#include "script/ServerCheck.h"
#include "script/TitleCheck.h"
#include "utf8/Utf8.h"

namespace sennetctl {

namespace {

constexpr std::size_t kLargestScriptOctets = std::size_t(1) << 20;

std::vector<std::string> scriptsIn(const std::string& directory) {
    const Velm::DirectoryReader reader(directory.c_str(), ".script.inv");
    std::vector<std::string> scripts;
    scripts.reserve(static_cast<std::size_t>(reader.getNumberOfFiles()));
    for (int i = 0; i < reader.getNumberOfFiles(); ++i) {
        scripts.emplace_back(reader.getFileName(i));
    }
    return scripts;
}

void sortByPlace(std::vector<Finding>& findings) {
    std::stable_sort(findings.begin(), findings.end(), [](const Finding& one, const Finding& two) {
        return std::tie(one.line, one.column) < std::tie(two.line, two.column);
    });
}

/// What is asked of the server for all scripts.
struct Answers {
    /// The time-out is for the first answer only: later ones may need a look at the whole machine.
    explicit Answers(unsigned firstTimeoutMilliseconds) : server(firstTimeoutMilliseconds) {
        server.requireAnswer();
        server.setTimeout(LocalServer::kTimeoutMilliseconds);
    }

    LocalServer server;
    MissingValues missing{server};
};

class ScriptChecker {
  public:
    explicit ScriptChecker(const CheckOptions& theOptions)
        : options(theOptions), texts(options.places.resources.c_str()) {
        std::vector<Finding> found;
        checkConfiguration(options.places, found);
        takeOver(found);
        if (const std::optional<std::string> octets = checkResources(options.places, found)) {
            keys.emplace(options.places.resources, *octets);
        }
        takeOver(found);
        texts.load();
        result.server = ServerPart::NotAsked;
        result.basis = {{"configuration", options.places.configuration},
                        {"directory", options.places.scriptDirectory},
                        {"resources", options.places.resources}};
        result.basis.insert(result.basis.end(), options.places.outputs.begin(),
                            options.places.outputs.end());
    }

    /// Unless the options forbid it.
    void reachServer() {
        if (options.offline) {
            return;
        }
        try {
            answers = std::make_unique<Answers>(options.timeoutSeconds * 1000);
            result.server = ServerPart::Asked;
        } catch (const CannotRun& failure) {
            loseServer(ServerPart::NotReached, failure, "only the scripts themselves are checked");
        }
    }

    /// The scripts of the installation.
    std::vector<std::string> listScripts() {
        const std::string& directory = options.places.scriptDirectory;
        std::vector<std::string> scripts = scriptsIn(directory);
        checkPassedOver(directory, result.findings);
        std::error_code error;
        const std::filesystem::directory_iterator listed(directory, error);
        if (error == std::errc::no_such_file_or_directory) {
            fail("there is no directory '" + directory + "' of inventory scripts");
        } else if (error) {
            fail("the directory '" + directory + "' of inventory scripts: " + error.message());
        } else if (scripts.empty()) {
            fail("there are no inventory scripts in '" + directory + "'");
        }
        return scripts;
    }

    void check(const std::string& file) {
        std::string octets;
        try {
            octets = readWholeFile(file, kLargestScriptOctets);
        } catch (const CannotRun& failure) {
            result.failures.push_back(failure.failure());
            return;
        }
        result.files.push_back(file);
        std::vector<Finding> found = findingsIn(file, octets);
        takeOver(found);
    }

    /// To be called behind the last script.
    void checkKeys() {
        if (keys) {
            std::vector<Finding> found;
            keys->tell(options.scripts.empty() && result.failures.empty() &&
                           result.server != ServerPart::BrokeDown,
                       found);
            takeOver(found);
        }
    }

    /// Returns the exit status, which is kCannotRun where some script was not read.
    int tell(const Output& output) const {
        if (options.verbose && !output.json) {
            for (const auto& [name, path] : result.basis) {
                output.out << name << ": " << printable(path) << '\n';
            }
        }
        tellFailures(troubles, output);
        return printResult(result, output);
    }

  private:
    void fail(const std::string& reason) { result.failures.push_back({{}, 0, 0, reason}); }

    /// Findings of one file.
    void takeOver(std::vector<Finding>& found) {
        sortByPlace(found);
        result.findings.insert(result.findings.end(), found.begin(), found.end());
        found.clear();
    }

    std::vector<Finding> findingsIn(const std::string& file, std::string_view octets) {
        if (utf8::clean(file) != file) {
            return {{file, 0, 0, Severity::Error,
                     "a file whose name is not UTF-8 is passed over by sennet: rename it"}};
        }
        std::vector<Finding> found;
        ScriptModel model = ScriptReader(file, found).read(octets);
        checkScript(model, found);
        titles.check(model, texts.getProperties(), found);
        if (answers && !model.givenUp) {
            askServer(model, found);
        }
        if (keys && !model.givenUp) {
            keys->look(model);
        }
        if (options.translations && keys) {
            checkTranslations(model, texts.getProperties(), found);
        }
        return found;
    }

    void askServer(ScriptModel& model, std::vector<Finding>& found) {
        try {
            ServerCheck(answers->server, answers->missing, texts.getProperties(),
                        {keys && options.translations, keys.has_value()}, found)
                .check(model);
        } catch (const CannotRun& failure) {
            loseServer(ServerPart::BrokeDown, failure,
                       "from " + model.file + " on only the scripts themselves are checked");
            answers.reset();
        }
    }

    void loseServer(ServerPart how, const CannotRun& failure, const std::string& consequence) {
        result.server = how;
        result.serverReason = failure.what();
        troubles.push_back(failure.failure());
        troubles.push_back({{}, 0, 0, consequence});
    }

    const CheckOptions& options;
    Velm::PropertiesFile texts;
    std::optional<KeySpelling> keys;   // of the texts; without them each name would be told
    std::unique_ptr<Answers> answers;  // none when there is no server
    TitleCheck titles;
    CheckResult result;
    std::vector<Failure> troubles;  // with the server, which leave the scripts' own findings
};

}  // namespace

int checkScripts(const CheckOptions& options, const Output& output) {
    ScriptChecker checker(options);
    const std::vector<std::string> files =
        options.scripts.empty() ? checker.listScripts() : options.scripts;
    if (!files.empty()) {
        checker.reachServer();
        const Progress progress(output);
        for (std::size_t i = 0; i < files.size(); ++i) {
            progress.show("script " + std::to_string(i + 1) + " of " +
                          std::to_string(files.size()) + ": " + files[i]);
            checker.check(files[i]);
        }
        checker.checkKeys();
    }
    return checker.tell(output);
}

}  // namespace sennetctl
