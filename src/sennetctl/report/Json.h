#pragma once

// JSON documents of the commands.

#include <nlohmann/json.hpp>

#include "report/Output.h"

namespace sennetctl {

/// Members stay in the order in which they are added.
using Json = nlohmann::ordered_json;

/// Writes the document, indented, and a line end. Octets that are not UTF-8 become U+FFFD.
void printJson(const Json& document, const Output& output);

}  // namespace sennetctl
