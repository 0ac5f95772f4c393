#pragma once

// Keys of the resource properties that miss what sennet looks up by the case of a letter.

#include <map>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "properties/PropertiesEntries.h"
#include "report/Finding.h"
#include "script/ScriptModel.h"

namespace sennetctl {

class KeySpelling {
  public:
    /// Takes the keys of the octets of such a file, which is named in the findings.
    KeySpelling(std::string file, std::string_view octets);

    /// Remembers what sennet looks up for the script: its title, and the columns of the classes
    /// that the server told, as it writes them.
    void look(const ScriptModel& model);

    /// Appends a finding for each key that differs from one that a script needs in the case of
    /// letters only, unless a script needs it as it is or the right key is there, too.
    /// @param areAll  whether all scripts were looked at, so that no other one may need the key
    void tell(bool areAll, std::vector<Finding>& findings) const;

  private:
    std::string file;
    std::map<std::string, Velm::PropertiesEntry> keys;
    std::set<std::string> wanted;
};

}  // namespace sennetctl
