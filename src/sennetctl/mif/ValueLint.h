#pragma once

// Checks single values against their types.

#include "mif/LintReport.h"
#include "mifreader/Document.h"

namespace sennetctl {

/// Adds what is wrong with a value of an attribute of this type.
void checkValue(const Mif::Value& value, const Mif::Type& type, LintReport& report);

/// Adds what old readers stumble over in a text, if there is anything. `what` names the text.
void checkText(const std::string& text, const std::string& what, Mif::Position position,
               LintReport& report);

}  // namespace sennetctl
