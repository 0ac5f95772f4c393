#include "html/HtmlCommand.h"

#include <Velm/TextFile.h>
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <map>
#include <optional>
#include <ostream>

#include "html/InventoryPage.h"
#include "report/Json.h"
#include "report/Progress.h"
#include "report/Text.h"
#include "report/WholeFile.h"

namespace sennetctl {

namespace {

/// The name of a file's directory for people.
std::string directoryOf(const std::string& file) {
    const std::string directory = std::filesystem::path(file).parent_path().string();
    return directory.empty() ? "." : directory;
}

/// The files of each directory; the directories in the order of their first files.
std::vector<std::vector<std::string>> byDirectory(const std::vector<std::string>& files) {
    std::map<std::string, std::size_t> places;
    std::vector<std::vector<std::string>> groups;
    for (const std::string& file : files) {
        const auto [place, isNew] = places.try_emplace(directoryOf(file), groups.size());
        if (isNew) {
            groups.emplace_back();
        }
        groups[place->second].push_back(file);
    }
    return groups;
}

std::time_t modifiedAt(const std::string& file) {
    struct stat status = {};
    if (::stat(file.c_str(), &status) != 0) {
        throw CannotRun(file, causeOf(errno));
    }
    return status.st_mtime;
}

/// The page, and what came of the files.
struct Composition {
    InventoryPage page;
    std::vector<std::string> files;  // that are on the page
    std::vector<Failure> failures;   // of those that are not
};

class PageComposer {
  public:
    PageComposer(const HtmlOptions& theOptions, const Output& output)
        : options(theOptions),
          progress(output),
          composed{InventoryPage(theOptions.title), {}, {}} {}

    /// Where files of several directories are shown together, each directory is one machine's.
    Composition compose() {
        const std::vector<std::vector<std::string>> groups = byDirectory(options.files);
        for (const std::vector<std::string>& files : groups) {
            hasHeading = groups.size() == 1;
            for (const std::string& file : files) {
                showProgress(file);
                add(file, groups.size() > 1);
            }
        }
        return std::move(composed);
    }

  private:
    void showProgress(const std::string& file) {
        ++filesSeen;
        progress.show("file " + std::to_string(filesSeen) + " of " +
                      std::to_string(options.files.size()) + ": " + file);
    }

    void add(const std::string& file, bool isOneOfSeveral) {
        const std::string name = std::filesystem::path(file).filename().string();
        MifContent content;
        std::time_t modified = 0;
        try {
            content = readMifFile(file);
            modified = modifiedAt(file);
        } catch (const CannotRun& cause) {
            composed.failures.push_back(cause.failure());
            Failure shown = cause.failure();
            shown.file = isOneOfSeveral ? file : name;
            composed.page.addMissing(shown);
            return;
        }
        if (!hasHeading) {
            composed.page.beginGroup(directoryOf(file));
            hasHeading = true;
        }
        composed.page.add(name, modified, content);
        composed.files.push_back(file);
    }

    const HtmlOptions& options;
    Progress progress;
    Composition composed;
    std::size_t filesSeen = 0;
    bool hasHeading = false;
};

void makeDirectory(const std::string& directory) {
    if (Velm::TextFile(directory.c_str()).mkdir(1) != 0) {
        throw CannotRun(directory, causeOf(errno));
    }
}

void report(const std::optional<std::string>& path, const Composition& composed,
            const Output& output) {
    tellFailures(composed.failures, output);
    const InventoryPage& page = composed.page;
    if (output.json) {
        Json document = Json::object();
        document["page"] = path ? Json(*path) : Json(nullptr);
        document["files"] = composed.files;
        document["tables"] = page.tables();
        document["rows"] = page.rows();
        addFailures(composed.failures, document);
        printJson(document, output);
    } else if (path) {
        output.out << "Written: " << printable(*path) << ", " << counted(page.tables(), "table")
                   << " from " << counted(page.files(), "file") << " with "
                   << counted(page.rows(), "row") << '\n';
    }
}

}  // namespace

int writeHtmlPage(const HtmlOptions& options, const Output& output) {
    const std::string path = (std::filesystem::path(options.directory) / "inventory.html").string();
    if (!options.replace) {
        refuseExisting(path);
    }
    const Composition composed = PageComposer(options, output).compose();
    if (composed.files.empty()) {
        report(std::nullopt, composed, output);
        return kCannotRun;
    }
    makeDirectory(options.directory);
    writeWholeFile(path, composed.page.text());
    report(path, composed, output);
    return composed.failures.empty() ? kFine : kCannotRun;
}

}  // namespace sennetctl
