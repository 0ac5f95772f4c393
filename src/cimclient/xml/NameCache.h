// Makes each CIM name of a message once: an answer repeats the same few names for every instance.

#pragma once

#include <Pegasus/Common/CIMName.h>

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>

namespace Pegasus {

/// Copies of one name share their text. A cache belongs to one thread.
class NameCache {
  public:
    /// The name that `utf8` spells, case kept; nullptr when it is no legal CIM name. The pointer
    /// stays valid as long as the cache.
    const CIMName* find(std::string_view utf8);

  private:
    struct Hash {
        using is_transparent = void;
        std::size_t operator()(std::string_view text) const {
            return std::hash<std::string_view>()(text);
        }
    };

    std::unordered_map<std::string, CIMName, Hash, std::equal_to<>> names;
};

}  // namespace Pegasus
