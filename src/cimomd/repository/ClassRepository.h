#pragma once

// The classes and qualifier declarations of all namespaces (DSP0004). Names of namespaces, classes,
// properties and qualifiers ignore case. Reading is safe from several threads at once as long as
// nobody adds.

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMName.h>

#include <map>
#include <string>
#include <vector>

#include "repository/QualifierDeclaration.h"
#include "repository/RepositoryError.h"

namespace cimomd {

/// Copies are independent: what is added to one is not seen in the other.
class ClassRepository {
  public:
    /// No class may stand deeper below its top class than this.
    static constexpr std::size_t kMaxInheritanceDepth = 64;

    void addNamespace(const Pegasus::CIMNamespaceName& name);
    bool hasNamespace(const Pegasus::CIMNamespaceName& name) const;

    /// Adds the namespace too when it is new. Throws RepositoryError when there is such a
    /// qualifier.
    void addQualifier(const Pegasus::CIMNamespaceName& nameSpace, QualifierDeclaration declaration);

    /// Null when there is none. Valid until the next change.
    const QualifierDeclaration* findQualifier(const Pegasus::CIMNamespaceName& nameSpace,
                                              const Pegasus::CIMName& name) const;

    /// Adds a class as it was declared, without inherited elements; the repository takes it over,
    /// do not use it afterwards. Throws RepositoryError, and adds nothing, when there is such a
    /// class, its superclass is missing, a property changes the type of an inherited one, or a
    /// qualifier changes one that may not be overridden.
    void addClass(const Pegasus::CIMNamespaceName& nameSpace, Pegasus::CIMClass declared);

    /// The class with all inherited properties and qualifiers, marked as propagated and with their
    /// class of origin. Null when there is none. Valid until the next change.
    const Pegasus::CIMConstClass* findClass(const Pegasus::CIMNamespaceName& nameSpace,
                                            const Pegasus::CIMName& name) const;

    /// The class and all its descendants, each before its own subclasses, siblings in the order of
    /// their declaration. Empty when there is no such class.
    std::vector<Pegasus::CIMName> withDescendants(const Pegasus::CIMNamespaceName& nameSpace,
                                                  const Pegasus::CIMName& name) const;

  private:
    struct ClassEntry {
        Pegasus::CIMClass effective;
        /// Keys of the direct subclasses.
        std::vector<std::string> subclasses;
        std::size_t depth = 0;
    };
    struct Namespace {
        std::map<std::string, QualifierDeclaration> qualifiers;
        std::map<std::string, ClassEntry> classes;
    };

    const Namespace* find(const Pegasus::CIMNamespaceName& name) const;
    static const ClassEntry* find(const Namespace& nameSpace, const Pegasus::CIMName& name);

    std::map<std::string, Namespace> namespaces;
};

}  // namespace cimomd
