#pragma once

// One run of the MOF compiler: the files it reads, and what they declare, in a draft of its own.

#include <Pegasus/Common/CIMName.h>

#include <filesystem>
#include <string>
#include <vector>

#include "mof/MofClasses.h"
#include "mof/MofContext.h"
#include "mof/MofInstances.h"

namespace cimomd {

class MofCompilation {
  public:
    /// All files together.
    static constexpr std::size_t kMaxBytes = std::size_t{64} << 20;
    static constexpr std::size_t kMaxIncludeDepth = 16;
    static constexpr std::size_t kMaxFiles = 10'000;

    /// Adds to a copy of `base`. Qualifiers that it does not have are taken from `others`, which
    /// may be null.
    MofCompilation(const ClassRepository& base, Pegasus::CIMNamespaceName defaultNamespace,
                   const ClassRepository* others);

    // What is being compiled refers to the draft.
    MofCompilation(const MofCompilation&) = delete;
    MofCompilation& operator=(const MofCompilation&) = delete;

    /// Compile a file, or a text that stands for one. Mistakes are kept; raise MofErrors when they
    /// are too many.
    void addFile(const std::filesystem::path& path);
    void addText(std::string text, const std::filesystem::path& file);

    /// To be called once after the last file: the repository with all that was declared. Raises
    /// MofErrors when there was any mistake.
    ClassRepository finish();

    bool redeclaredQualifiers() const { return hasRedeclaredQualifiers; }

  private:
    void compile(std::string text, const std::filesystem::path& path);
    void enter(std::shared_ptr<const MofSource> source, const Pegasus::CIMNamespaceName& name,
               bool isPlaceKnown);
    void declare(const MofQualifierDeclaration& declaration);
    void declare(MofClass& declaration);
    void declare(MofInstance& declaration);
    void declare(const MofInclude& include);
    void declare(const MofNamespace& pragma);
    std::string readFile(const std::filesystem::path& path);
    void checkInclude(const std::filesystem::path& path) const;

    const ClassRepository& base;
    Pegasus::CIMNamespaceName firstNamespace;
    const ClassRepository* furtherQualifiers;
    ClassRepository draft;
    MofErrorLog log;
    MofClasses classes;
    MofInstances instances{classes};
    MofContextPointer context;
    /// The files being compiled, each included by the one before it.
    std::vector<std::filesystem::path> openFiles;
    std::size_t fileCount = 0;
    std::size_t byteCount = 0;
    bool hasRedeclaredQualifiers = false;
};

}  // namespace cimomd
