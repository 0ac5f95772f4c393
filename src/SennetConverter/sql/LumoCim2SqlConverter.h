#pragma once

#include "SennetConverter/sql/Cim2SqlConverter.h"

namespace Pegasus {

/// The schema for Lumo databases, whose names are short: words are abbreviated.
class LumoCim2SqlConverter : public Cim2SqlConverter {
  public:
    using Cim2SqlConverter::Cim2SqlConverter;

    String substituteValues(String text) override;
    void PrintRDBMS(CimScriptParser& parser, Array<CIMClass>& classes,
                    CimInstanceLists& instanceLists) override;
};

}  // namespace Pegasus
