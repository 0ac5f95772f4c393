#pragma once

// Turns qualifiers as MOF writes them into CIM qualifiers, by their declarations.

#include <Pegasus/Common/CIMQualifier.h>

#include <vector>

#include "mof/MofContext.h"

namespace cimomd {

/// What `declaration` says. Mistakes go to the log; nothing is declared then.
void declareQualifier(const MofQualifierDeclaration& declaration, const MofContext& context);

/// The qualifiers of an element of one of the kinds in `scopes`, which messages call `element`.
/// Those with a mistake go to the log and are left out.
std::vector<Pegasus::CIMQualifier> qualifiersOf(const std::vector<MofQualifier>& uses,
                                                QualifierScopes scopes, std::string_view element,
                                                const MofContext& context);

}  // namespace cimomd
