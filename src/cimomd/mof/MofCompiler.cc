#include "mof/MofCompiler.h"

#include <utility>

#include "mof/MofCompilation.h"

namespace cimomd {

MofCompiler::MofCompiler(ClassRepository& repository, Pegasus::CIMNamespaceName defaultNamespace)
    : target(repository), firstNamespace(std::move(defaultNamespace)) {}

void MofCompiler::compileFile(const std::filesystem::path& path) {
    compileFiles({path});
}

void MofCompiler::compileFiles(const std::vector<std::filesystem::path>& paths) {
    run([&](MofCompilation& compilation) {
        for (const std::filesystem::path& path : paths)
            compilation.addFile(path);
    });
}

void MofCompiler::compileText(std::string_view text, const std::filesystem::path& file) {
    run([&](MofCompilation& compilation) { compilation.addText(std::string(text), file); });
}

template <typename AddFiles>
void MofCompiler::run(AddFiles addFiles) {
    MofCompilation compilation(target, firstNamespace, furtherQualifiers);
    try {
        addFiles(compilation);
        target = compilation.finish();
    } catch (const MofErrors&) {
        hasRedeclaredQualifiers = compilation.redeclaredQualifiers();
        throw;
    }
    hasRedeclaredQualifiers = compilation.redeclaredQualifiers();
}

}  // namespace cimomd
