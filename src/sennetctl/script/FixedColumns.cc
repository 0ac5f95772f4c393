#include "script/FixedColumns.h"

#include <algorithm>
#include <initializer_list>

namespace sennetctl {

using Pegasus::String;

namespace {

bool isAmong(std::initializer_list<const char*> columns, const String& name) {
    return std::any_of(columns.begin(), columns.end(), [&](const char* column) {
        return String::equalNoCase(name, String(column));
    });
}

}  // namespace

bool isRowNumberName(const String& name) {
    return String::equal(name, String("Index"));
}

bool isQveColumn(const String& name) {
    return isAmong({"Row_Index", "HARDWARE_SYSTEM_ID", "CONFIG_CHANGE_TYPE", "CONFIG_CHANGE_TIME"},
                   name);
}

bool isLumoColumn(const String& name) {
    return isAmong({"Row_Index", "HWARE_SYS_ID", "CFG_CHG_TYPE", "CFG_CHG_TIME"}, name);
}

bool isSqlWord(const String& name) {
    return isAmong(
        {"Access",    "Add",       "All",        "Alter",      "Any",     "Asc",        "Audit",
         "Backup",    "Begin",     "By",         "Cascade",    "Case",    "Check",      "Column",
         "Comment",   "Condition", "Constraint", "Create",     "Current", "Cursor",     "Database",
         "Date",      "Default",   "Delete",     "Desc",       "Disk",    "Drop",       "End",
         "File",      "From",      "Full",       "Function",   "Grant",   "Group",      "Identity",
         "Initial",   "Interval",  "Key",        "Keys",       "Left",    "Limit",      "Lines",
         "Load",      "Lock",      "Long",       "Mode",       "Number",  "Offline",    "Online",
         "Open",      "Option",    "Order",      "Percent",    "Plan",    "Precision",  "Primary",
         "Procedure", "Public",    "Range",      "Raw",        "Read",    "References", "Release",
         "Right",     "Row",       "Rows",       "Rule",       "Schema",  "Select",     "Session",
         "Set",       "Share",     "Start",      "Statistics", "Table",   "To",         "Trigger",
         "Union",     "Unique",    "Update",     "Usage",      "Use",     "User",       "Values",
         "View",      "When",      "Where",      "With",       "Write"},
        name);
}

}  // namespace sennetctl
