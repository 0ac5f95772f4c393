#include "QveFixture.h"

namespace qvetest {

std::string lumoSchema(const std::string& stem, const std::string& columns) {
    return crlf("drop table KWX_" + stem + ";\n\ncreate table KWX_" + stem + " (\n" +
                "   HWARE_SYS_ID varchar(64) NOT NULL,\n"
                "   CFG_CHG_TYPE varchar(12) NOT NULL,\n"
                "   CFG_CHG_TIME varchar(32) NOT NULL,\n"
                "   Row_Index varchar(5) NOT NULL," +
                columns + " );\n\nalter table KWX_" + stem +
                " add primary key ( HWARE_SYS_ID, CFG_CHG_TYPE, Row_Index );\n"
                "\ndrop view KWX_V" +
                stem + ";\n\ncreate view KWX_V" + stem +
                "\nas\nselect\n   COMPUTER_SYS.QVE_OBJECT_ID,\n   COMPUTER_SYS.QVE_OBJECT_LABEL,\n"
                "   KWX_" +
                stem + ".*\nfrom\n   COMPUTER_SYS, KWX_" + stem +
                "\nwhere\n   COMPUTER_SYS.HWARE_SYS_ID =\n   KWX_" + stem +
                ".HWARE_SYS_ID;\n\ninsert into QUERY_VIEWS (VIEW_NAME) values ('KWX_V" + stem +
                "');\n");
}

std::string transactSchema(const std::string& stem, const std::string& columns) {
    return crlf("drop table KWX_" + stem + "\ngo\n\ncreate table KWX_" + stem + " (\n" +
                "   HARDWARE_SYSTEM_ID varchar(64) NOT NULL,\n"
                "   CONFIG_CHANGE_TYPE varchar(12) NOT NULL,\n"
                "   CONFIG_CHANGE_TIME varchar(32) NOT NULL,\n"
                "   Row_Index varchar(5) NOT NULL," +
                columns + " )\ngo\n\nalter table KWX_" + stem +
                " add primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index )\ngo\n"
                "\ndrop view KWX_V" +
                stem + "\ngo\n\ncreate view KWX_V" + stem +
                "\nas\nselect\n   COMPUTER_SYSTEM.QVE_OBJECT_ID,\n"
                "   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,\n   KWX_" +
                stem + ".*\nfrom\n   COMPUTER_SYSTEM, KWX_" + stem +
                "\nwhere\n   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =\n   KWX_" + stem +
                ".HARDWARE_SYSTEM_ID\ngo\n\ninsert into QUERY_VIEWS (VIEW_NAME) values ('KWX_V" +
                stem + "')\ngo\n");
}

std::string oracleSchema(const std::string& stem, const std::string& columns) {
    return crlf("drop table KWX_" + stem + " cascade constraints ;\n\ncreate table KWX_" + stem +
                " (\n   HARDWARE_SYSTEM_ID varchar2(64) NOT NULL,\n"
                "   CONFIG_CHANGE_TYPE varchar2(12) NOT NULL,\n"
                "   CONFIG_CHANGE_TIME varchar2(32) NOT NULL,\n"
                "   Row_Index varchar2(5) NOT NULL," +
                columns + " );\n\ncreate unique index KWX_I" + stem + " on KWX_" + stem +
                "\n(\n   HARDWARE_SYSTEM_ID,\n   CONFIG_CHANGE_TYPE,\n   CONFIG_CHANGE_TIME,\n"
                "   Row_Index\n);\n\nalter table KWX_" +
                stem +
                " add ( primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index ));\n"
                "\ndrop view KWX_V" +
                stem + ";\n\ncreate view KWX_V" + stem +
                "\nas\nselect\n   COMPUTER_SYSTEM.QVE_OBJECT_ID,\n"
                "   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,\n   KWX_" +
                stem + ".*\nfrom\n   COMPUTER_SYSTEM, KWX_" + stem +
                "\nwhere\n   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =\n   KWX_" + stem +
                ".HARDWARE_SYSTEM_ID;\n\ninsert into QUERY_VIEWS (VIEW_NAME) values ('KWX_V" +
                stem + "');\n");
}

std::string queryScript(const std::string& displayTitle, const std::string& viewStem,
                        const std::vector<std::string>& columns, const std::string& title) {
    const std::string echo = "echo \"Creating query '" + displayTitle + "' in $QUERY_LIB...\"";
    std::string text = echo + " \n" + echo + " >> $DBDIR/tmp/kwvinstall.log \n" +
                       "qvmkquery -d \"" + displayTitle + "\" -r inventory -v KWX_V" + viewStem +
                       " \\\n   -c QVE_OBJECT_LABEL \\\n";
    for (const std::string& column : columns) {
        text += "   -c " + column + " \\\n";
    }
    return crlf(text + "\"$QUERY_LIB\" \"" + title +
                "\" 2>> $DBDIR/tmp/kwvinstall.log\nERR=$?\nif [ $ERR -ne 0 ] ; then\n   echo \"'" +
                title + "' query already exists.\"\nfi\n");
}

std::string scriptOf(const std::string& propertyList) {
    return "[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=" + propertyList + "\n";
}

std::string titled(const std::string& title) {
    return "[DEFAULT]\ntitle=" + title + "\n[CIM]\nG[0]=CIM_X\nA[0]=P\n";
}

Answer QveFixture::described(const CIMClass& cimClass) {
    return {cimClass, {CIMInstance(cimClass.getClassName())}};
}

Answer QveFixture::plain() {
    return described(cimClass("CIM_X", {property("P", null(CIMTYPE_STRING), {maxLen(8)})}));
}

Answer QveFixture::texts(std::initializer_list<const char*> names) {
    CIMClass result{CIMName("CIM_X")};
    for (const char* name : names) {
        result.addProperty(property(name, null(CIMTYPE_STRING)));
    }
    return described(result);
}

}  // namespace qvetest
