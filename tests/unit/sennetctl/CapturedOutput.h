#pragma once

// What a command prints, caught in strings.

#include <sstream>
#include <string>

#include "report/Json.h"
#include "report/Output.h"

namespace sennetctl {

class CapturedOutput {
  public:
    Output plain() { return {out, err}; }
    Output json() { return {out, err, true}; }
    Output coloured() { return {out, err, false, true}; }

    std::string text() const { return out.str(); }
    std::string errors() const { return err.str(); }
    /// Throws when the text is no JSON document.
    Json document() const { return Json::parse(out.str()); }

  private:
    std::ostringstream out;
    std::ostringstream err;
};

}  // namespace sennetctl
