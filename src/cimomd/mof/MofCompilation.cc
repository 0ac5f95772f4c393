#include "mof/MofCompilation.h"

#include <Pegasus/Common/Exception.h>
#include <fmt/format.h>

#include <algorithm>
#include <utility>

#include "files/BoundedFile.h"
#include "mof/MofEncoding.h"
#include "mof/MofParser.h"
#include "mof/MofPaths.h"
#include "mof/MofQualifiers.h"
#include "mof/MofToken.h"
#include "text/CimText.h"

namespace cimomd {
namespace {

using Pegasus::CIMNamespaceName;

/// Why an include cannot be followed, without its place.
struct IncludeError {
    std::string found;
    std::string expected;
};

std::string_view describe(FileStatus status) {
    switch (status) {
        case FileStatus::Absent:
            return "no such file";
        case FileStatus::TooLong:
            return "more MOF text than is allowed";
        default:
            return "a file that cannot be read";
    }
}

}  // namespace

MofCompilation::MofCompilation(const ClassRepository& base, CIMNamespaceName defaultNamespace,
                               const ClassRepository* others)
    : base(base),
      firstNamespace(std::move(defaultNamespace)),
      furtherQualifiers(others),
      draft(base) {}

void MofCompilation::addFile(const std::filesystem::path& path) {
    try {
        addText(readFile(path), path);
    } catch (const IncludeError& error) {
        log.add(path.string(), MofPosition(), error.found, "a MOF file");
    }
}

void MofCompilation::addText(std::string text, const std::filesystem::path& file) {
    ++fileCount;
    context.reset();
    draft.addNamespace(firstNamespace);
    compile(std::move(text), file);
}

ClassRepository MofCompilation::finish() {
    classes.finish();
    instances.finish();
    log.raiseIfAny();
    return std::move(draft);
}

void MofCompilation::compile(std::string text, const std::filesystem::path& path) {
    const auto source =
        std::make_shared<const MofSource>(MofSource{path.string(), std::move(text)});
    enter(source, context ? context->nameSpace : firstNamespace, !context || context->isPlaceKnown);
    openFiles.push_back(path);
    MofParser parser(source->text, source->file, log);
    while (std::optional<MofDeclaration> declaration = parser.next()) {
        std::visit([&](auto& alternative) { declare(alternative); }, *declaration);
        if (context->source != source)
            enter(source, context->nameSpace, context->isPlaceKnown);
    }
    openFiles.pop_back();
}

void MofCompilation::enter(std::shared_ptr<const MofSource> source, const CIMNamespaceName& name,
                           bool isPlaceKnown) {
    context = std::make_shared<const MofContext>(MofContext{
        draft, log, name, firstNamespace, std::move(source), furtherQualifiers, isPlaceKnown});
}

void MofCompilation::declare(const MofQualifierDeclaration& declaration) {
    if (base.findQualifier(context->nameSpace, nameOf(declaration.name)) != nullptr)
        hasRedeclaredQualifiers = true;
    if (context->isPlaceKnown)
        declareQualifier(declaration, *context);
}

void MofCompilation::declare(MofClass& declaration) {
    if (context->isPlaceKnown)
        classes.declare(std::move(declaration), context);
}

void MofCompilation::declare(MofInstance& declaration) {
    if (context->isPlaceKnown)
        instances.declare(std::move(declaration), context);
}

void MofCompilation::declare(const MofInclude& include) {
    const MofContextPointer includer = context;
    const std::filesystem::path path =
        includedFile(openFiles.back().parent_path(), include.file.text);
    try {
        checkInclude(path);
        compile(readFile(path), path);
    } catch (const IncludeError& error) {
        includer->report(include.file.position,
                         fmt::format("{} ({})", error.found, shownText(include.file.text)),
                         error.expected);
    }
}

void MofCompilation::checkInclude(const std::filesystem::path& path) const {
    if (std::find(openFiles.begin(), openFiles.end(), path) != openFiles.end())
        throw IncludeError{"a file that includes itself", "another file"};
    if (openFiles.size() > kMaxIncludeDepth)
        throw IncludeError{"an include inside too many others",
                           fmt::format("at most {} levels", kMaxIncludeDepth)};
    if (fileCount == kMaxFiles)
        throw IncludeError{"too many included files", fmt::format("at most {}", kMaxFiles)};
}

/// Counts the file. Throws IncludeError.
std::string MofCompilation::readFile(const std::filesystem::path& path) {
    FileContent content = readBoundedFile(path, kMaxBytes - byteCount);
    if (content.status == FileStatus::TooLong)
        throw IncludeError{std::string(describe(content.status)),
                           fmt::format("at most {} bytes in all files", kMaxBytes)};
    if (content.status != FileStatus::Read)
        throw IncludeError{std::string(describe(content.status)), "the name of a MOF file"};
    byteCount += content.bytes.size();
    ++fileCount;
    return utf8TextOf(std::move(content.bytes));
}

void MofCompilation::declare(const MofNamespace& pragma) {
    try {
        const CIMNamespaceName name(cimString(namespaceIn(pragma.name.text)));
        draft.addNamespace(name);
        enter(context->source, name, true);
    } catch (const Pegasus::Exception&) {
        enter(context->source, context->nameSpace, false);
        context->report(pragma.name.position, fmt::format("\"{}\"", shownText(pragma.name.text)),
                        "a namespace such as root/cimv2");
    }
}

}  // namespace cimomd
