#include "SennetConverter/sql/OracleCim2SqlConverter.h"

#include "SennetConverter/sql/SqlDialect.h"

namespace Pegasus {

void OracleCim2SqlConverter::PrintRDBMS(CimScriptParser& parser, Array<CIMClass>& classes,
                                        CimInstanceLists& /*instanceLists*/) {
    writeSchema(kOracleDialect, parser, classes);
}

}  // namespace Pegasus
