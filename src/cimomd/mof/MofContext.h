#pragma once

// What the parts of the MOF compiler share while they compile one declaration.

#include <Pegasus/Common/CIMName.h>

#include <memory>
#include <string>
#include <string_view>

#include "mof/MofDeclarations.h"
#include "mof/MofErrorLog.h"
#include "mof/MofSource.h"
#include "repository/ClassRepository.h"

namespace cimomd {

/// Where declarations stand. One object serves all that stand in the same file and namespace.
struct MofContext {
    ClassRepository& repository;
    MofErrorLog& log;
    /// Where declarations go.
    Pegasus::CIMNamespaceName nameSpace;
    /// Where qualifiers are looked for that `nameSpace` does not declare.
    Pegasus::CIMNamespaceName qualifierNamespace;
    std::shared_ptr<const MofSource> source;
    /// Where qualifiers are looked for after that; null for nowhere.
    const ClassRepository* furtherQualifiers = nullptr;
    /// False behind a pragma that names no namespace: nobody knows what the declarations belong to.
    bool isPlaceKnown = true;

    const std::string& file() const { return source->file; }
    void report(MofPosition position, std::string_view found, std::string_view expected) const {
        log.add(file(), position, found, expected);
    }
};

using MofContextPointer = std::shared_ptr<const MofContext>;

/// Null for an empty text.
Pegasus::CIMName nameOf(const MofName& name);

/// The same for names that differ only by case.
std::string keyOf(const Pegasus::CIMNamespaceName& nameSpace, const Pegasus::CIMName& name);

}  // namespace cimomd
