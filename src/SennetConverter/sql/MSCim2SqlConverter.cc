#include "SennetConverter/sql/MSCim2SqlConverter.h"

#include "SennetConverter/sql/SqlDialect.h"

namespace Pegasus {

void MSCim2SqlConverter::PrintRDBMS(CimScriptParser& parser, Array<CIMClass>& classes,
                                    CimInstanceLists& /*instanceLists*/) {
    writeSchema(kTransactSqlDialect, parser, classes);
}

}  // namespace Pegasus
