#pragma once

// Names of columns that are taken: each table has columns besides those of its script, and
// databases have words of their own. Databases take no two names that differ in case only, MIF
// readers do.

#include <Pegasus/Common/String.h>

namespace sennetctl {

/// Whether SMS, LANDesk and CA get the numbers of rows by this name.
bool isRowNumberName(const Pegasus::String& name);

/// Whether a table of QVE has a column of this name, which is as QVE writes it.
bool isQveColumn(const Pegasus::String& name);

/// The same for QVE with Lumo.
bool isLumoColumn(const Pegasus::String& name);

/// Whether one of Oracle, SQL Server, Sybase, MariaDB and SQLite takes no column of this name when
/// it has no quotes. Of their words only those that a property may be called.
bool isSqlWord(const Pegasus::String& name);

}  // namespace sennetctl
