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

/// Names of the files for people: without directories where that is enough to tell them apart.
std::vector<std::string> shortNames(const std::vector<std::string>& files) {
    std::map<std::string, int> uses;
    for (const std::string& file : files) {
        ++uses[std::filesystem::path(file).filename().string()];
    }
    std::vector<std::string> names;
    names.reserve(files.size());
    for (const std::string& file : files) {
        std::string name = std::filesystem::path(file).filename().string();
        names.push_back(uses[name] == 1 ? name : file);
    }
    return names;
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

void addFile(const std::string& file, const std::string& name, Composition& composed) {
    MifContent content;
    std::time_t modified = 0;
    try {
        content = readMifFile(file);
        modified = modifiedAt(file);
    } catch (const CannotRun& cause) {
        composed.failures.push_back(cause.failure());
        Failure shown = cause.failure();
        shown.file = name;
        composed.page.addMissing(shown);
        return;
    }
    composed.page.add(name, modified, content);
    composed.files.push_back(file);
}

Composition composePage(const HtmlOptions& options, const Output& output) {
    const std::vector<std::string> names = shortNames(options.files);
    Composition composed{InventoryPage(options.title), {}, {}};
    const Progress progress(output);
    for (std::size_t i = 0; i < options.files.size(); ++i) {
        const std::string& file = options.files[i];
        progress.show("file " + std::to_string(i + 1) + " of " +
                      std::to_string(options.files.size()) + ": " + file);
        addFile(file, names[i], composed);
    }
    return composed;
}

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
    const Composition composed = composePage(options, output);
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
