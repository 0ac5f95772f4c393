#pragma once

#include "SennetConverter/shell/Cim2ShConverter.h"

namespace Pegasus {

/// The query script for Lumo databases, whose names are short: words are abbreviated.
class LumoCim2ShConverter : public Cim2ShConverter {
  public:
    using Cim2ShConverter::Cim2ShConverter;

    String substituteValues(String text) override;
};

}  // namespace Pegasus
