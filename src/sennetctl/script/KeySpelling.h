#pragma once

// Keys of the resource properties that miss what sennet looks up by the case of a letter.

#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "report/Finding.h"
#include "script/ScriptModel.h"

namespace sennetctl {

class KeySpelling {
  public:
    /// Takes the keys of the octets of such a file, which is named in the findings.
    KeySpelling(std::string file, std::string_view octets);

    /// Appends a finding for each key that is meant for a column of the script, unless the right
    /// key is there, too. Each key is told once, also when several scripts have the column. Classes
    /// are looked up as the server writes them; those that no server told are passed over.
    void check(const ScriptModel& model, std::vector<Finding>& findings);

  private:
    struct Key {
        std::string text;
        unsigned line = 0;
        unsigned column = 0;
        bool isTold = false;
    };

    void checkKey(const std::string& wanted, std::vector<Finding>& findings);

    std::string file;
    std::multimap<std::string, Key> keys;  // by their text in small letters
};

}  // namespace sennetctl
