#pragma once

namespace Pegasus {

/// The pieces in which the schema scripts differ, in the order of the script. Each holds its own
/// CR LF line ends.
struct SqlDialect {
    const char* dropTableEnd;
    const char* fixedColumns;
    const char* typeOpener;
    const char* columnCloser;
    const char* createTableEnd;
    /// Columns of a unique index, or null for no index.
    const char* uniqueIndexColumns;
    const char* primaryKey;
    const char* dropViewEnd;
    const char* viewColumns;
    const char* fromClause;
    const char* whereClause;
    const char* joinColumn;
    const char* insertOpener;
    const char* insertEnd;
};

extern const SqlDialect kLumoDialect;
/// Sybase and Microsoft SQL Server.
extern const SqlDialect kTransactSqlDialect;
extern const SqlDialect kOracleDialect;

}  // namespace Pegasus
