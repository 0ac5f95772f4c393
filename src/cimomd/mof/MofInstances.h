#pragma once

// Builds the instances of one compilation, joins them by their aliases and adds them to the
// repository. Aliases hold in all files of a compilation, before and after their declaration.

#include <deque>
#include <map>
#include <string>
#include <vector>

#include "mof/MofClasses.h"
#include "mof/MofContext.h"
#include "mof/MofInstanceBuilder.h"

namespace cimomd {

class MofInstances {
  public:
    /// Properties of all instances of a compilation, those with a default included.
    static constexpr std::size_t kMaxProperties = 16'000'000;
    /// How long a chain of instances may be that have each other as keys.
    static constexpr std::size_t kMaxKeyDepth = 64;

    /// In all keys of an instance. A key that is a reference holds the keys of another instance
    /// with their quotes escaped, and so on: without a bound that doubles from one to the next.
    static constexpr std::size_t kMaxKeyCharacters = 65'536;

    /// `classes` must stay alive.
    explicit MofInstances(const MofClasses& classes) : classes(classes) {}

    /// Builds the instance. Mistakes go to the log.
    void declare(MofInstance declaration, const MofContextPointer& context);

    /// To be called once after MofClasses::finish(): resolves the aliases and adds all instances.
    void finish();

  private:
    enum class PathState { Open, InProgress, Known, Failed };
    struct Entry {
        BuiltInstance built;
        const MofInstanceClass* instanceClass;
        MofPosition position;
        MofContextPointer context;
        PathState state = PathState::Open;
    };
    struct Late {
        MofInstance declaration;
        MofContextPointer context;
    };

    void build(const MofInstance& declaration, const MofContextPointer& context);
    bool canHaveInstances(const MofName& name, const MofContext& context) const;
    const MofInstanceClass& classOf(const Pegasus::CIMName& name, const MofContext& context);
    void declareAlias(const MofName& alias, const MofContext& context);
    void resolvePath(Entry& entry, std::size_t depth);
    void setPath(Entry& entry);
    bool hasKeys(const Entry& entry) const;
    bool resolve(const MofAliasUse& use, Entry& entry, std::size_t depth);
    Entry* target(const MofAliasUse& use, const MofContext& context);
    static bool fits(const MofAliasUse& use, const Entry& entry, const Entry& target);
    static bool isKey(const MofAliasUse& use, const Entry& entry);

    const MofClasses& classes;
    std::map<std::string, MofInstanceClass> instanceClasses;
    std::deque<Entry> entries;
    /// Instances of classes that are held back.
    std::vector<Late> late;
    /// Null for an instance that was left out for a mistake.
    std::map<std::string, Entry*> aliases;
    std::size_t propertyCount = 0;
};

}  // namespace cimomd
