#pragma once

// Compiles MOF files (DSP0004) into a repository: all of a file with everything it includes, or
// nothing of it.

#include <Pegasus/Common/CIMClass.h>

#include <filesystem>
#include <string>
#include <string_view>

#include "mof/MofDeclarations.h"
#include "mof/MofError.h"
#include "repository/ClassRepository.h"

namespace cimomd {

class MofCompiler {
  public:
    static constexpr std::size_t kMaxFileBytes = std::size_t{64} << 20;
    static constexpr std::size_t kMaxIncludeDepth = 16;
    static constexpr std::size_t kMaxFiles = 10000;

    /// `repository` must outlive the compiler. Declarations go to `defaultNamespace` until a pragma
    /// names another one.
    MofCompiler(ClassRepository& repository, Pegasus::CIMNamespaceName defaultNamespace);

    /// Raises MofError, and leaves the repository as it was, when anything is wrong.
    void compileFile(const std::filesystem::path& path);

    /// The same for a text; `file` names it in errors and is what its includes are relative to.
    void compileText(std::string_view text, const std::filesystem::path& file);

  private:
    /// One file being compiled.
    struct Unit {
        std::filesystem::path path;
        std::size_t depth = 0;
    };

    void compile(std::string_view text, const Unit& unit);
    void declare(const MofQualifierDeclaration& declaration, const Unit& unit);
    void declare(const MofClass& declaration, const Unit& unit);
    void declare(const MofInclude& include, const Unit& unit);
    void declare(const MofNamespace& pragma, const Unit& unit);
    Pegasus::CIMClass classOf(const MofClass& declaration, const std::string& file) const;
    Pegasus::CIMProperty propertyOf(const MofProperty& declaration, const std::string& file) const;
    Pegasus::CIMQualifier qualifierOf(const MofQualifier& use, QualifierScopes scope,
                                      const std::string& file) const;

    ClassRepository& target;
    Pegasus::CIMNamespaceName firstNamespace;
    ClassRepository draft;
    Pegasus::CIMNamespaceName nameSpace;
    std::size_t fileCount = 0;
};

}  // namespace cimomd
