#pragma once

#include "SennetConverter/sql/Cim2SqlConverter.h"

namespace Pegasus {

/// The schema for Microsoft SQL Server, which takes the one for Sybase.
class MSCim2SqlConverter : public Cim2SqlConverter {
  public:
    using Cim2SqlConverter::Cim2SqlConverter;

    void PrintRDBMS(CimScriptParser& parser, Array<CIMClass>& classes,
                    CimInstanceLists& instanceLists) override;
};

}  // namespace Pegasus
