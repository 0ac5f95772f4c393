#pragma once

// Which MOF files make up the classes that are served: the shipped schema, then the administrator's
// own files.

#include <Pegasus/Common/CIMName.h>

#include <filesystem>
#include <memory>
#include <optional>
#include <vector>

#include "repository/ClassRepository.h"

namespace cimomd {

/// Where the classes come from.
struct SchemaSources {
    std::filesystem::path schemaFile;
    /// Its *.mof are compiled in the order of their names' bytes; it may be absent.
    std::optional<std::filesystem::path> ownDirectory;
    Pegasus::CIMNamespaceName nameSpace;
};

class SchemaLoader {
  public:
    explicit SchemaLoader(SchemaSources schemaSources);

    /// For the start: a file of the administrator that is wrong is logged and left out as a whole.
    /// Raises std::exception when the shipped schema is wrong.
    std::shared_ptr<const ClassRepository> loadWhatIsRight() const;

    /// For a reload: raises std::exception at the first mistake in any file.
    std::shared_ptr<const ClassRepository> loadAll() const;

  private:
    std::shared_ptr<ClassRepository> shipped() const;
    void compileOrLeaveOut(const std::filesystem::path& file, ClassRepository& classes) const;
    std::vector<std::filesystem::path> ownFiles() const;

    SchemaSources sources;
};

}  // namespace cimomd
