#pragma once

// What becomes of the titles of scripts, each by itself and beside those of the others.

#include <Velm/Properties.h>

#include <string>
#include <vector>

#include "report/Finding.h"
#include "script/ScriptModel.h"

namespace sennetctl {

class TitleCheck {
  public:
    /// Appends the findings about a script's title, and remembers it for the scripts to come.
    void check(const ScriptModel& model, const Velm::Properties& texts,
               std::vector<Finding>& findings);

  private:
    struct Known {
        std::string file;
        std::string title;  // as in the script
        std::string shown;
    };

    void compare(const Known& title, const ScriptModel& model,
                 std::vector<Finding>& findings) const;

    std::vector<Known> known;
};

}  // namespace sennetctl
