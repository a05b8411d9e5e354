#pragma once

#include "db/Recordset.h"

#include <QString>

#include <memory>

namespace pelmar {

// Opens the connection strings of BuildConnString: SQL Server strings through ODBC with the
// chosen SQL Server driver, "DSN=" strings through unixODBC's data sources, and servers written
// "sqlite:<folder>" on the embedded engine (read-only, with SQL Server literals adapted).
// Every recordset gets a connection of its own, as the classic client gave each its own.
class DatabaseClient {
public:
    static constexpr int kDefaultLoginTimeout = 15;

    // sqlServerDriver: the ODBC driver for SQL Server strings (see chooseSqlServerDriver).
    explicit DatabaseClient(QString sqlServerDriver);

    // Opens sql forward-only and read-only. Throws Failure when the server cannot be reached
    // within loginTimeoutSeconds, the login is refused or the statement fails.
    std::unique_ptr<Recordset> open(const QString& sql, const QString& connString,
                                    int loginTimeoutSeconds = kDefaultLoginTimeout) const;

    // Opens a connection and releases it at once. Throws Failure as open() does.
    void connect(const QString& connString, int loginTimeoutSeconds) const;

    const QString& sqlServerDriver() const { return sqlServerDriver_; }

private:
    std::unique_ptr<DatabaseConnection> openConnection(const QString& connString, int loginTimeoutSeconds) const;

    QString sqlServerDriver_;
};

}  // namespace pelmar
