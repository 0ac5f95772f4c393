#include "service/SchemaLoader.h"

#include <fmt/format.h>

#include <algorithm>
#include <stdexcept>
#include <system_error>
#include <utility>

#include "mof/MofCompiler.h"
#include "service/Log.h"

namespace cimomd {
namespace {

constexpr std::size_t kMaxOwnFiles = 10000;

/// As "*.mof" matches: editors hide their copies behind a dot.
bool isMofFile(const std::filesystem::path& path) {
    return path.extension() == ".mof" && path.filename().native().front() != '.';
}

}  // namespace

SchemaLoader::SchemaLoader(SchemaSources schemaSources) : sources(std::move(schemaSources)) {}

std::shared_ptr<const ClassRepository> SchemaLoader::loadWhatIsRight() const {
    auto classes = shipped();
    try {
        for (const auto& file : ownFiles())
            compileOrLeaveOut(file, *classes);
    } catch (const std::filesystem::filesystem_error& error) {
        logText(LogLevel::Error, error.what());
    }
    return classes;
}

std::shared_ptr<const ClassRepository> SchemaLoader::loadAll() const {
    auto classes = shipped();
    for (const auto& file : ownFiles())
        MofCompiler(*classes, sources.nameSpace).compileFile(file);
    return classes;
}

void SchemaLoader::compileOrLeaveOut(const std::filesystem::path& file,
                                     ClassRepository& classes) const {
    try {
        MofCompiler(classes, sources.nameSpace).compileFile(file);
    } catch (const std::exception& error) {
        logText(LogLevel::Error, fmt::format("left out: {}", error.what()));
    }
}

std::shared_ptr<ClassRepository> SchemaLoader::shipped() const {
    auto classes = std::make_shared<ClassRepository>();
    MofCompiler(*classes, sources.nameSpace).compileFile(sources.schemaFile);
    return classes;
}

std::vector<std::filesystem::path> SchemaLoader::ownFiles() const {
    std::vector<std::filesystem::path> files;
    std::error_code error;
    if (!sources.ownDirectory || !std::filesystem::exists(*sources.ownDirectory, error))
        return files;
    for (const auto& entry : std::filesystem::directory_iterator(*sources.ownDirectory)) {
        if (isMofFile(entry.path()))
            files.push_back(entry.path());
        if (files.size() > kMaxOwnFiles)
            throw std::runtime_error(fmt::format("{}: more than {} files",
                                                 sources.ownDirectory->string(), kMaxOwnFiles));
    }
    std::sort(files.begin(), files.end(), [](const auto& a, const auto& b) {
        return a.filename().native() < b.filename().native();
    });
    return files;
}

}  // namespace cimomd
