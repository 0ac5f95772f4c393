#include "html/HtmlCommand.h"

#include <Velm/TextFile.h>
#include <sys/stat.h>

#include <algorithm>
#include <filesystem>
#include <map>
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
        throw CannotRun(file + ": cannot be read");
    }
    return status.st_mtime;
}

InventoryPage composePage(const HtmlOptions& options, const Output& output) {
    const std::vector<std::string> names = shortNames(options.files);
    InventoryPage page(options.title);
    const Progress progress(output);
    for (std::size_t i = 0; i < options.files.size(); ++i) {
        const std::string& file = options.files[i];
        progress.show("file " + std::to_string(i + 1) + " of " +
                      std::to_string(options.files.size()) + ": " + file);
        const MifContent content = readMifFile(file);
        page.add(names[i], modifiedAt(file), content);
    }
    return page;
}

void makeDirectory(const std::string& directory) {
    if (Velm::TextFile(directory.c_str()).mkdir(1) != 0) {
        throw CannotRun(directory + ": cannot be made");
    }
}

void report(const std::string& path, const HtmlOptions& options, const InventoryPage& page,
            const Output& output) {
    if (output.json) {
        Json document = Json::object();
        document["page"] = path;
        document["files"] = options.files;
        document["tables"] = page.tables();
        document["rows"] = page.rows();
        printJson(document, output);
        return;
    }
    output.out << "Written: " << printable(path) << ", " << counted(page.tables(), "table")
               << " from " << counted(page.files(), "file") << " with "
               << counted(page.rows(), "row") << '\n';
}

}  // namespace

int writeHtmlPage(const HtmlOptions& options, const Output& output) {
    const std::string path = (std::filesystem::path(options.directory) / "inventory.html").string();
    if (!options.replace) {
        refuseExisting(path);
    }
    const InventoryPage page = composePage(options, output);
    makeDirectory(options.directory);
    writeWholeFile(path, page.text());
    report(path, options, page, output);
    return kFine;
}

}  // namespace sennetctl
