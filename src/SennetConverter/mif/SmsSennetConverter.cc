#include "SennetConverter/mif/SmsSennetConverter.h"

#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

String SmsSennetConverter::mifClassHeader(CimScriptParser& parser, int n) {
    HeaderStyle style;
    style.componentName = "Machine";
    style.keyType = "Integer";
    style.keyValue = SennetUtilities::toDecimal(n + 1);
    return classHeader(parser, n, style);
}

String SmsSennetConverter::getPropertyValueForClass(CIMProperty property, CIMType type,
                                                    CIMValue value, int /*blankValues*/) {
    return SennetConverter::getPropertyValueForClass(property, type, value, 0);
}

void SmsSennetConverter::printInstances(CimScriptParser& parser, Array<CIMClass>& classes,
                                        CimInstanceLists& instanceLists) {
    TableStyle style;
    style.rowNumberCell = plainRowNumber;
    style.firstRowLast = true;
    printTable(parser, classes, instanceLists, style);
}

}  // namespace Pegasus
