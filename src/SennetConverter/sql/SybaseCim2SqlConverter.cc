#include "SennetConverter/sql/SybaseCim2SqlConverter.h"

#include "SennetConverter/sql/SqlDialect.h"

namespace Pegasus {

void SybaseCim2SqlConverter::PrintRDBMS(CimScriptParser& parser, Array<CIMClass>& classes,
                                        CimInstanceLists& /*instanceLists*/) {
    writeSchema(kTransactSqlDialect, parser, classes);
}

}  // namespace Pegasus
