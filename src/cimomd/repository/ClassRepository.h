#pragma once

// The classes, qualifier declarations and declared instances of all namespaces (DSP0004). Names of
// namespaces, classes, properties and qualifiers ignore case. Reading is safe from several threads
// at once as long as nobody adds.

#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMName.h>

#include <map>
#include <memory>
#include <string>
#include <vector>

#include "repository/InstanceTable.h"
#include "repository/MethodDeclaration.h"
#include "repository/NameOrder.h"
#include "repository/QualifierDeclaration.h"
#include "repository/RepositoryError.h"

namespace cimomd {

/// Copies are independent: what is added to one is not seen in the other. They share what they
/// have in common and cost little. Everything that is added has to fit to what is there: the
/// functions that add return what does not, and add nothing then.
class ClassRepository {
  public:
    /// No class may stand deeper below its top class than this.
    static constexpr std::size_t kMaxInheritanceDepth = 64;
    /// Properties and methods of one class, inherited ones included.
    static constexpr std::size_t kMaxFeatures = 4096;
    /// Classes, features, parameters and qualifiers together. Inherited ones count in each class in
    /// which they cost memory.
    static constexpr std::size_t kMaxElements = 4'000'000;

    void addNamespace(const Pegasus::CIMNamespaceName& name);
    bool hasNamespace(const Pegasus::CIMNamespaceName& name) const;
    /// As first written, sorted.
    std::vector<Pegasus::CIMNamespaceName> namespaceNames() const;

    /// Adds the namespace too when it is new. The same declaration again is no error, another one
    /// of this name is.
    [[nodiscard]] RepositoryErrors addQualifier(const Pegasus::CIMNamespaceName& nameSpace,
                                                QualifierDeclaration declaration);

    /// Null when there is none. Valid until the next change.
    const QualifierDeclaration* findQualifier(const Pegasus::CIMNamespaceName& nameSpace,
                                              const Pegasus::CIMName& name) const;

    /// Adds a class as it was declared, without inherited elements; the repository takes it over,
    /// do not use it afterwards. Class of origin and propagation of `methods` are set here. Errors:
    /// there is such a class, its superclass is missing, a property or method changes the type of
    /// an inherited one, a qualifier changes one that may not be overridden, a bound is exceeded.
    [[nodiscard]] RepositoryErrors addClass(const Pegasus::CIMNamespaceName& nameSpace,
                                            Pegasus::CIMClass declared,
                                            std::vector<MethodDeclaration> methods = {});

    /// The class with all inherited properties and qualifiers, marked as propagated and with their
    /// class of origin. Null when there is none. Valid until the next change.
    const Pegasus::CIMConstClass* findClass(const Pegasus::CIMNamespaceName& nameSpace,
                                            const Pegasus::CIMName& name) const;

    /// The methods of the class, inherited ones first, marked as propagated. Empty when it has
    /// none or there is no such class. Valid until the next change.
    const MethodList& methodsOf(const Pegasus::CIMNamespaceName& nameSpace,
                                const Pegasus::CIMName& className) const;

    /// The classes without a superclass, in the order of their declaration.
    std::vector<Pegasus::CIMName> topClasses(const Pegasus::CIMNamespaceName& nameSpace) const;

    /// The direct subclasses, in the order of their declaration.
    std::vector<Pegasus::CIMName> subclassesOf(const Pegasus::CIMNamespaceName& nameSpace,
                                               const Pegasus::CIMName& name) const;

    /// The class and all its descendants, each before its own subclasses, siblings in the order of
    /// their declaration. Empty when there is no such class.
    std::vector<Pegasus::CIMName> withDescendants(const Pegasus::CIMNamespaceName& nameSpace,
                                                  const Pegasus::CIMName& name) const;

    /// Whether both are one class or `name` is a descendant of `ancestor`. False when there is no
    /// class `name`.
    bool isSameOrSubclass(const Pegasus::CIMNamespaceName& nameSpace, const Pegasus::CIMName& name,
                          const Pegasus::CIMName& ancestor) const;

    /// Adds a declared instance; the repository takes it over. Its path is set, with namespace and
    /// all keys. Errors: no such class, an instance with these keys is there.
    [[nodiscard]] RepositoryErrors addInstance(const Pegasus::CIMInstance& instance);

    /// The declared instances of exactly this class, in the order of their declaration, with their
    /// full paths and all properties of the class. Empty when there is none or no such class.
    /// Valid until the next change.
    const std::vector<Pegasus::CIMConstInstance>& instancesOf(
        const Pegasus::CIMNamespaceName& nameSpace, const Pegasus::CIMName& className) const;

    /// The declared instance with the class and keys of `path`, whose host and namespace do not
    /// matter. Null when there is none. Valid until the next change.
    const Pegasus::CIMConstInstance* findInstance(const Pegasus::CIMNamespaceName& nameSpace,
                                                  const Pegasus::CIMObjectPath& path) const;

  private:
    struct ClassEntry {
        Pegasus::CIMClass effective;
        /// The names of the direct subclasses.
        std::vector<Pegasus::CIMName> subclasses;
        std::size_t depth = 0;
        /// Null when there are none.
        std::shared_ptr<const MethodList> methods;
        /// Null when there are none. Copies of the repository share it until one of them adds.
        std::shared_ptr<InstanceTable> instances;
    };
    struct Namespace {
        Pegasus::CIMNamespaceName name;
        std::map<Pegasus::CIMName, QualifierDeclaration, NameOrder> qualifiers;
        std::map<Pegasus::CIMName, ClassEntry, NameOrder> classes;
        std::vector<Pegasus::CIMName> topClasses;
    };

    Namespace& access(const Pegasus::CIMNamespaceName& name);
    const Namespace* find(const Pegasus::CIMNamespaceName& name) const;
    const ClassEntry* find(const Pegasus::CIMNamespaceName& nameSpace,
                           const Pegasus::CIMName& className) const;
    static const ClassEntry* find(const Namespace& nameSpace, const Pegasus::CIMName& name);
    RepositoryErrors addTopClass(Namespace& space, Pegasus::CIMClass declared,
                                 std::vector<MethodDeclaration> methods);
    RepositoryErrors addSubclass(Namespace& space, ClassEntry& super, Pegasus::CIMClass declared,
                                 std::vector<MethodDeclaration> methods);
    RepositoryErrors reserve(std::size_t features, std::size_t elements);

    /// By names in lower case.
    std::map<std::string, Namespace> namespaces;
    std::size_t elementCount = 0;
};

}  // namespace cimomd
