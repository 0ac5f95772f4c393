#pragma once

// What readers of MIF files, shells and databases have against a title or the name of a column,
// all of which take it as it is.

#include <string>
#include <vector>

#include "report/Finding.h"

namespace sennetctl {

/// The message goes on behind the text that it is about.
struct NameFault {
    Severity severity;
    std::string message;
};

/// Of a text in UTF-8 between the quotes of a literal.
std::vector<NameFault> literalFaults(const std::string& text);

/// Of a title as the files show it.
std::vector<NameFault> groupNameFaults(const std::string& name);

/// Of a script's own title, as a part of a MIF class. Its literal is not looked at.
std::vector<NameFault> classFaults(const std::string& title);

/// Of a text between double quotes in QVE's query script.
std::vector<NameFault> shellTextFaults(const std::string& text);

/// Of a part of a name in QVE's scripts, which has no quotes there.
std::vector<NameFault> sqlNameFaults(const std::string& name);

}  // namespace sennetctl
