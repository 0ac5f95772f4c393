#include "SennetConverter/mif/CaSennetConverter.h"

#include "SennetConverter/framework/CimInstanceLists.h"
#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

void CaSennetConverter::printOutput(CimScriptParser& parser, Array<CIMClass>& classes,
                                    CimInstanceLists& instanceLists) {
    GroupAttributes attributes;
    const Uint32 groups = largestListSize(instanceLists);
    for (Uint32 i = 0; i < groups; ++i) {
        openFileIfNeeded();
        printGroup(parser, classes, instanceLists, i, attributes);
        ++nextGroupId;
    }
}

String CaSennetConverter::mifClassHeader(CimScriptParser& parser, int n) {
    HeaderStyle style;
    style.groupIdLine = String("      ID = ") + SennetUtilities::toDecimal(nextGroupId) + "\r\n";
    style.keyType = "Integer";
    style.keyValue = SennetUtilities::toDecimal(n + 1);
    return classHeader(parser, n, style);
}

String CaSennetConverter::formatString(String text) {
    return escape(text, "\r\n\"");
}

String CaSennetConverter::getPropertyValueForClass(CIMProperty property, CIMType type,
                                                   CIMValue value, int /*blankValues*/) {
    return SennetConverter::getPropertyValueForClass(property, type, value, 0);
}

}  // namespace Pegasus
