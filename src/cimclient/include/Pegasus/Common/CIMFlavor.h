// The flavors of a qualifier (DSP0004, "Qualifier flavors"): how it passes on to subclasses.
#pragma once

#include <Pegasus/Common/Config.h>

namespace Pegasus {

class CIMFlavor {
  public:
    enum Bit : Uint8 { OVERRIDABLE = 1, TOSUBCLASS = 2, TOINSTANCE = 4, TRANSLATABLE = 8 };

    /// What holds when a declaration says nothing: overridable and passed on to subclasses.
    constexpr CIMFlavor() = default;

    constexpr Boolean has(Bit bit) const { return (bits & bit) != 0; }
    constexpr void set(Bit bit, Boolean on) {
        bits = static_cast<Uint8>(on ? bits | bit : bits & ~bit);
    }

  private:
    Uint8 bits = OVERRIDABLE | TOSUBCLASS;
};

}  // namespace Pegasus
