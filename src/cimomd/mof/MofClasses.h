#pragma once

// Adds the classes of one compilation to a repository, in whatever order schemas declare them.

#include <map>
#include <set>
#include <string>
#include <vector>

#include "mof/MofContext.h"

namespace cimomd {

class MofClasses {
  public:
    /// Classes that wait for their superclass, and classes that references name in advance.
    static constexpr std::size_t kMaxOpen = 100'000;

    /// Adds the class, or keeps it until its superclass is added. Mistakes go to the log.
    void declare(MofClass declaration, const MofContextPointer& context);

    /// To be called once after the last class: reports superclasses and classes of references that
    /// nobody declared, and references that do not fit to those they override.
    void finish();

    /// Whether the class waits for its superclass or did so in vain.
    bool isHeldBack(const MofContext& context, const Pegasus::CIMName& name) const;

    /// Whether there is a mistake in this class or in one above it: what does not fit to it may
    /// fit once that is corrected.
    bool isFaulty(const MofContext& context, const Pegasus::CIMName& name) const;

  private:
    struct Waiting {
        MofClass declaration;
        MofContextPointer context;
    };
    /// A class that a reference names.
    struct Referenced {
        MofName name;
        MofContextPointer context;
    };

    /// A reference whose class takes the place of another one in a subclass.
    struct OverriddenReference {
        MofName name;
        Pegasus::CIMName inherited;
        MofContextPointer context;
    };

    void add(const MofClass& declaration, const MofContextPointer& context);
    void keepWaiting(MofClass declaration, const MofContextPointer& context);
    void refuseOwnSuperClass(const MofClass& declaration, const MofContext& context);
    void noteOverrides(const MofClass& declaration, const MofContextPointer& context);
    void checkAsAssociation(const MofClass& declaration, const MofContext& context) const;
    void reportOverrides() const;
    void noteReferences(const MofClass& declaration, const MofContextPointer& context);
    void giveUpWaitingFor(const std::string& superKey);
    void giveUp(const Waiting& entry, bool isSuperFaulty);
    void reportReferences() const;

    /// By the keys of their superclasses.
    std::map<std::string, std::vector<Waiting>> waiting;
    std::set<std::string> heldBack;
    /// By key; the first place of each.
    std::map<std::string, Referenced> referenced;
    /// Those whose classes are not known yet, or do not fit.
    std::vector<OverriddenReference> overriddenReferences;
    std::set<std::string> faulty;
};

}  // namespace cimomd
