#pragma once

// The words of MOF (DSP0004) that name types, scopes and flavors. All ignore case.

#include <Pegasus/Common/CIMType.h>

#include <optional>
#include <string_view>

#include "mof/MofFlavor.h"
#include "repository/QualifierScope.h"

namespace cimomd {

/// Nothing when the word names none.
std::optional<Pegasus::CIMType> typeNamed(std::string_view word);
std::optional<QualifierScopes> scopeNamed(std::string_view word);
std::optional<FlavorWord> flavorNamed(std::string_view word);

}  // namespace cimomd
