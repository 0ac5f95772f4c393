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

}  // namespace sennetctl
