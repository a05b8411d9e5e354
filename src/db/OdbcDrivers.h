#pragma once

#include <QString>
#include <QStringList>

namespace pelmar {

// The names of the ODBC drivers unixODBC knows on this machine.
QStringList installedOdbcDrivers();

// The driver for SQL Server connection strings: the environment variable
// PELMAR_SQLSERVER_DRIVER when set, else configured when not empty, else Microsoft's
// "ODBC Driver 18 for SQL Server" or "ODBC Driver 17 for SQL Server" when installed, else
// "FreeTDS".
QString chooseSqlServerDriver(const QString& configured, const QStringList& installed);

}  // namespace pelmar
