#include "SennetConverter/sql/SqlDialect.h"

namespace Pegasus {

namespace {

// The computer table and its key have short names in Lumo databases only.
constexpr char kViewColumns[] =
    "   COMPUTER_SYSTEM.QVE_OBJECT_ID,\r\n"
    "   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,\r\n";
constexpr char kFromClause[] = ".*\r\nfrom\r\n   COMPUTER_SYSTEM, KWX_";
constexpr char kWhereClause[] = "where\r\n   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =\r\n   KWX_";
constexpr char kJoinColumn[] = ".HARDWARE_SYSTEM_ID";

}  // namespace

const SqlDialect kLumoDialect = {
    .dropTableEnd = ";\r\n\r\n",
    .fixedColumns =
        "   HWARE_SYS_ID varchar(64) NOT NULL,\r\n"
        "   CFG_CHG_TYPE varchar(12) NOT NULL,\r\n"
        "   CFG_CHG_TIME varchar(32) NOT NULL,\r\n"
        "   Row_Index varchar(5) NOT NULL,",
    .typeOpener = " varchar(",
    .columnCloser = ")",
    .createTableEnd = " );\r\n\r\n",
    .uniqueIndexColumns = nullptr,
    .primaryKey = "primary key ( HWARE_SYS_ID, CFG_CHG_TYPE, Row_Index );\r\n\r\n",
    .dropViewEnd = ";\r\n\r\n",
    .viewColumns =
        "   COMPUTER_SYS.QVE_OBJECT_ID,\r\n"
        "   COMPUTER_SYS.QVE_OBJECT_LABEL,\r\n",
    .fromClause = ".*\r\nfrom\r\n   COMPUTER_SYS, KWX_",
    .whereClause = "where\r\n   COMPUTER_SYS.HWARE_SYS_ID =\r\n   KWX_",
    .joinColumn = ".HWARE_SYS_ID",
    .insertOpener = ";\r\n\r\ninsert into QUERY_VIEWS (VIEW_NAME) values ('KWX_V",
    .insertEnd = "');\r\n",
};

const SqlDialect kTransactSqlDialect = {
    .dropTableEnd = "\r\ngo\r\n\r\n",
    .fixedColumns =
        "   HARDWARE_SYSTEM_ID varchar(64) NOT NULL,\r\n"
        "   CONFIG_CHANGE_TYPE varchar(12) NOT NULL,\r\n"
        "   CONFIG_CHANGE_TIME varchar(32) NOT NULL,\r\n"
        "   Row_Index varchar(5) NOT NULL,",
    .typeOpener = " varchar(",
    .columnCloser = ") NULL",
    .createTableEnd = " )\r\ngo\r\n\r\n",
    .uniqueIndexColumns = nullptr,
    .primaryKey =
        "primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index )\r\n"
        "go\r\n\r\n",
    .dropViewEnd = "\r\ngo\r\n\r\n",
    .viewColumns = kViewColumns,
    .fromClause = kFromClause,
    .whereClause = kWhereClause,
    .joinColumn = kJoinColumn,
    .insertOpener = "\r\ngo\r\n\r\ninsert into QUERY_VIEWS (VIEW_NAME) values ('KWX_V",
    .insertEnd = "')\r\ngo\r\n",
};

const SqlDialect kOracleDialect = {
    .dropTableEnd = " cascade constraints ;\r\n\r\n",
    .fixedColumns =
        "   HARDWARE_SYSTEM_ID varchar2(64) NOT NULL,\r\n"
        "   CONFIG_CHANGE_TYPE varchar2(12) NOT NULL,\r\n"
        "   CONFIG_CHANGE_TIME varchar2(32) NOT NULL,\r\n"
        "   Row_Index varchar2(5) NOT NULL,",
    .typeOpener = " varchar2(",
    .columnCloser = ") NULL",
    .createTableEnd = " );\r\n\r\n",
    .uniqueIndexColumns =
        "   HARDWARE_SYSTEM_ID,\r\n"
        "   CONFIG_CHANGE_TYPE,\r\n"
        "   CONFIG_CHANGE_TIME,\r\n"
        "   Row_Index\r\n",
    .primaryKey = "( primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index ));\r\n\r\n",
    .dropViewEnd = ";\r\n\r\n",
    .viewColumns = kViewColumns,
    .fromClause = kFromClause,
    .whereClause = kWhereClause,
    .joinColumn = kJoinColumn,
    .insertOpener = ";\r\n\r\ninsert into QUERY_VIEWS (VIEW_NAME) values ('KWX_V",
    .insertEnd = "');\r\n",
};

}  // namespace Pegasus
