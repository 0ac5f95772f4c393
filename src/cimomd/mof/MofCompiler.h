#pragma once

// Compiles MOF files (DSP0004) into a repository: all of them with everything they include, or
// nothing.

#include <Pegasus/Common/CIMName.h>

#include <filesystem>
#include <string_view>
#include <vector>

#include "mof/MofError.h"
#include "repository/ClassRepository.h"

namespace cimomd {

class MofCompiler {
  public:
    /// `repository` must outlive the compiler. Declarations go to `defaultNamespace` until a pragma
    /// names another one. A namespace that does not declare a qualifier takes it from that one.
    MofCompiler(ClassRepository& repository, Pegasus::CIMNamespaceName defaultNamespace);

    /// Qualifiers that neither the files nor the repository declare are taken from the default
    /// namespace of `others`, which must outlive the compiler.
    void useQualifiersOf(const ClassRepository& others) { furtherQualifiers = &others; }

    /// Raises MofErrors with all mistakes, and leaves the repository as it was, when anything is
    /// wrong.
    void compileFile(const std::filesystem::path& path);

    /// The same for several files as if they were one.
    void compileFiles(const std::vector<std::filesystem::path>& paths);

    /// The same for a text; `file` names it in errors and is what its includes are relative to.
    void compileText(std::string_view text, const std::filesystem::path& file);

    /// Whether the last compilation declared a qualifier that the repository had before.
    bool redeclaredQualifiers() const { return hasRedeclaredQualifiers; }

  private:
    template <typename AddFiles>
    void run(AddFiles addFiles);

    ClassRepository& target;
    Pegasus::CIMNamespaceName firstNamespace;
    const ClassRepository* furtherQualifiers = nullptr;
    bool hasRedeclaredQualifiers = false;
};

}  // namespace cimomd
