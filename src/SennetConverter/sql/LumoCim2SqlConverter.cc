#include "SennetConverter/sql/LumoCim2SqlConverter.h"

#include "SennetConverter/framework/SennetUtilities.h"
#include "SennetConverter/sql/SqlDialect.h"

namespace Pegasus {

String LumoCim2SqlConverter::substituteValues(String text) {
    return SennetUtilities::substituteValues(text);
}

void LumoCim2SqlConverter::PrintRDBMS(CimScriptParser& parser, Array<CIMClass>& classes,
                                      CimInstanceLists& /*instanceLists*/) {
    writeSchema(kLumoDialect, parser, classes);
}

}  // namespace Pegasus
