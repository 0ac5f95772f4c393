#pragma once

// The words by which MOF sets the flavors of a qualifier (DSP0004).

#include <Pegasus/Common/CIMFlavor.h>

#include "mof/MofPosition.h"

namespace cimomd {

/// Ignored: a word of other versions of MOF that means nothing here.
enum class FlavorWord {
    EnableOverride,
    DisableOverride,
    ToSubclass,
    Restricted,
    Translatable,
    Ignored
};

struct MofFlavor {
    FlavorWord word;
    MofPosition position;
};

/// Sets in `flavor` what `word` means.
inline void applyFlavor(FlavorWord word, Pegasus::CIMFlavor& flavor) {
    using Pegasus::CIMFlavor;
    switch (word) {
        case FlavorWord::EnableOverride:
            flavor.set(CIMFlavor::OVERRIDABLE, true);
            break;
        case FlavorWord::DisableOverride:
            flavor.set(CIMFlavor::OVERRIDABLE, false);
            break;
        case FlavorWord::ToSubclass:
            flavor.set(CIMFlavor::TOSUBCLASS, true);
            break;
        case FlavorWord::Restricted:
            flavor.set(CIMFlavor::TOSUBCLASS, false);
            break;
        case FlavorWord::Translatable:
            flavor.set(CIMFlavor::TRANSLATABLE, true);
            break;
        case FlavorWord::Ignored:
            break;
    }
}

}  // namespace cimomd
