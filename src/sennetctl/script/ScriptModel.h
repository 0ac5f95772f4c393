#pragma once

// An inventory script as the generator understands it, with the places of its entries.

#include <array>
#include <string>
#include <vector>

namespace sennetctl {

/// A value of an entry; line 0 where there is no entry.
struct ScriptText {
    std::string value;
    unsigned line = 0;
    unsigned column = 0;
};

struct ScriptSlot {
    ScriptText className;
    ScriptText nameSpace;
    ScriptText propertyList;
    std::vector<ScriptText> properties;  // of the list, those that are legal names

    std::string serverSpelling;  // of the class; empty where no server told it

    bool isUsed() const { return !className.value.empty(); }
};

struct ScriptModel {
    static constexpr std::size_t kSlots = 10;

    std::string file;
    ScriptText title;
    ScriptText defaultNamespace{"root/velmira", 0, 0};
    std::array<ScriptSlot, kSlots> slots;
    bool givenUp = false;  // the generator writes nothing for the script

    const std::string& namespaceOf(const ScriptSlot& slot) const {
        return slot.nameSpace.value.empty() ? defaultNamespace.value : slot.nameSpace.value;
    }
};

}  // namespace sennetctl
