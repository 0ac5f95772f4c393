#include "SennetConverter/shell/Cim2ShConverter.h"

#include "CimScriptParser/CimScriptParser.h"
#include "SennetConverter/framework/CimInstanceLists.h"
#include "SennetConverter/framework/NameRules.h"
#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

void Cim2ShConverter::printOutput(CimScriptParser& parser, Array<CIMClass>& classes,
                                  CimInstanceLists& instanceLists) {
    if (holdsData(classes, instanceLists)) {
        openFileIfNeeded();
        PrintBashScript(parser, classes, instanceLists);
    }
}

String Cim2ShConverter::hashString(String text) {
    return SennetUtilities::hashString(text, maxNameLength);
}

void Cim2ShConverter::PrintBashScript(CimScriptParser& parser, Array<CIMClass>& classes,
                                      CimInstanceLists& /*instanceLists*/) {
    const String title = parser.getTitle();
    const String displayTitle = translatedTitle(properties, title);
    const String viewStem =
        SennetUtilities::substituteValues(hashString(SennetUtilities::trim(displayTitle)));

    const String echo = String("echo \"Creating query '") + displayTitle + "' in $QUERY_LIB...\"";
    String header = echo + " \r\n" + echo + " >> $DBDIR/tmp/kwvinstall.log \r\n";
    header.append(String("qvmkquery -d \"") + displayTitle + "\" -r inventory -v KWX_V");
    header.append(viewStem + " \\\r\n   -c QVE_OBJECT_LABEL");
    header.append(classes.size() > 0 ? " \\\r\n" : "");
    Output(header.getCString());

    const auto format = [this](const String& name) {
        return SennetUtilities::formatPropertyName4quvelle(name, maxNameLength);
    };
    forEachColumn(parser, classes, format, [this](const Column& column) {
        Output((String("   -c ") + substituteValues(column.name) + " \\\r\n").getCString());
    });

    String trailer = String("\"$QUERY_LIB\" \"") + title + "\" 2>> $DBDIR/tmp/kwvinstall.log\r\n";
    trailer.append("ERR=$?\r\nif [ $ERR -ne 0 ] ; then\r\n");
    trailer.append(String("   echo \"'") + title + "' query already exists.\"\r\nfi\r\n");
    Output(trailer.getCString());
}

}  // namespace Pegasus
