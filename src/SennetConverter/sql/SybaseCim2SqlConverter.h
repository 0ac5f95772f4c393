#pragma once

#include "SennetConverter/sql/Cim2SqlConverter.h"

namespace Pegasus {

/// The schema for Sybase.
class SybaseCim2SqlConverter : public Cim2SqlConverter {
  public:
    using Cim2SqlConverter::Cim2SqlConverter;

    void PrintRDBMS(CimScriptParser& parser, Array<CIMClass>& classes,
                    CimInstanceLists& instanceLists) override;
};

}  // namespace Pegasus
