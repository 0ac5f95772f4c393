#pragma once

// Holds a provider against the shipped schema.

#include "providers/Provider.h"

namespace cimomd {

/// Expects that the provider has instances, each with all keys, and that what they have is declared
/// with the same type and the reverse: what the class declares, they have.
void expectServesItsClass(const Provider& provider);

}  // namespace cimomd
