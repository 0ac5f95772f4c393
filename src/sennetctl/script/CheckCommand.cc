#include "script/CheckCommand.h"

#include <Velm/DirectoryReader.h>
#include <Velm/PlatformUtilities.h>
#include <Velm/PropertiesFile.h>

#include <algorithm>
#include <map>
#include <memory>
#include <ostream>
#include <tuple>

#include "cim/LocalServer.h"
#include "report/Finding.h"
#include "report/Progress.h"
#include "report/Text.h"
#include "report/WholeFile.h"
#include "script/MissingValues.h"
#include "script/NameCheck.h"
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
    /// Reaches the server unless the options forbid it.
    explicit ScriptChecker(const CheckOptions& theOptions)
        : options(theOptions), texts(Velm::PlatformUtilities::getSennetResourceFile()) {
        texts.load();
        if (options.offline) {
            return;
        }
        try {
            answers = std::make_unique<Answers>(options.timeoutSeconds * 1000);
            part = ServerPart::Asked;
        } catch (const CannotRun& failure) {
            loseServer(failure, "only the scripts themselves are checked");
        }
    }

    void check(const std::string& file) {
        std::string octets;
        try {
            octets = readWholeFile(file, kLargestScriptOctets);
        } catch (const CannotRun& failure) {
            troubles.emplace_back(failure.what());
            return;
        }
        files.push_back(file);
        std::vector<Finding> found = findingsIn(file, octets);
        std::stable_sort(found.begin(), found.end(), [](const Finding& one, const Finding& two) {
            return std::tie(one.line, one.column) < std::tie(two.line, two.column);
        });
        findings.insert(findings.end(), found.begin(), found.end());
    }

    /// Returns the exit status, which is kCannotRun where some script was not read.
    int tell(std::size_t wanted, const Output& output) const {
        for (const std::string& trouble : troubles) {
            output.err << "sennetctl: " << printable(trouble) << '\n';
        }
        const int status =
            files.empty() ? kCannotRun : printFindings(findings, files, output, part);
        return files.size() < wanted ? kCannotRun : status;
    }

  private:
    std::vector<Finding> findingsIn(const std::string& file, std::string_view octets) {
        std::vector<Finding> found;
        ScriptModel model = ScriptReader(file, found).read(octets);
        checkScript(model, found);
        compareTitle(model, found);
        if (answers && !model.givenUp) {
            askServer(model, found);
        }
        if (options.translations) {
            checkTranslations(model, texts.getProperties(), found);
        }
        return found;
    }

    /// A reader takes two tables of one class for one.
    void compareTitle(const ScriptModel& model, std::vector<Finding>& found) {
        const std::string title = shownTitle(model, texts.getProperties());
        checkTitleText(model, title, found);
        const auto [first, isNew] = fileOfTitle.try_emplace(title, model.file);
        if (!isNew && first->second != model.file && !model.givenUp) {
            found.push_back({model.file, model.title.line, model.title.column, Severity::Warning,
                             first->second + " has the title " + title +
                                 ", too: both tables get the same MIF class"});
        }
    }

    void askServer(ScriptModel& model, std::vector<Finding>& found) {
        try {
            ServerCheck(answers->server, answers->missing, texts.getProperties(),
                        options.translations, found)
                .check(model);
        } catch (const CannotRun& failure) {
            loseServer(failure,
                       "from " + model.file + " on only the scripts themselves are checked");
            part = ServerPart::BrokeDown;
            answers.reset();
        }
    }

    void loseServer(const CannotRun& failure, const std::string& consequence) {
        troubles.emplace_back(failure.what());
        troubles.push_back(consequence);
    }

    const CheckOptions& options;
    Velm::PropertiesFile texts;
    std::unique_ptr<Answers> answers;  // none when there is no server
    ServerPart part = ServerPart::NotAsked;
    std::map<std::string, std::string> fileOfTitle;
    std::vector<std::string> files;  // that were read
    std::vector<Finding> findings;
    std::vector<std::string> troubles;
};

}  // namespace

int checkScripts(const CheckOptions& options, const Output& output) {
    const std::vector<std::string> files =
        options.scripts.empty() ? installedScripts() : options.scripts;
    ScriptChecker checker(options);
    {
        const Progress progress(output);
        for (std::size_t i = 0; i < files.size(); ++i) {
            progress.show("script " + std::to_string(i + 1) + " of " +
                          std::to_string(files.size()) + ": " + files[i]);
            checker.check(files[i]);
        }
    }
    return checker.tell(files.size(), output);
}

}  // namespace sennetctl
