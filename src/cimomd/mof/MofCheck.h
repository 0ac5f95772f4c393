#pragma once

// Compiles MOF files only to learn whether they are right.

#include <Pegasus/Common/CIMName.h>

#include <filesystem>
#include <vector>

#include "mof/MofError.h"
#include "repository/ClassRepository.h"

namespace cimomd {

/// Raises MofErrors with the mistakes of `files`, which are compiled together. They are read as
/// what an administrator adds to `shipped`. When that fails and they declare qualifiers of
/// `shipped` themselves, they are read as a schema of their own too, which takes from `shipped`
/// only the qualifiers that it does not declare; the mistakes told are those of the reading that
/// has fewer.
void checkMofFiles(const std::vector<std::filesystem::path>& files, const ClassRepository& shipped,
                   const Pegasus::CIMNamespaceName& nameSpace);

}  // namespace cimomd
