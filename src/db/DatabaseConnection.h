#pragma once

#include <QSqlDatabase>
#include <QSqlError>
#include <QString>

namespace pelmar {

class Failure;

// One open database connection under a name of its own; closed and unregistered on destruction.
class DatabaseConnection {
public:
    // Opens the connection; throws Failure with the driver's description when it cannot.
    // embedded: the statements must be adapted to the embedded engine's literals.
    DatabaseConnection(const QString& driverType, const QString& databaseName, const QString& options, bool embedded);
    ~DatabaseConnection();
    DatabaseConnection(const DatabaseConnection&) = delete;
    DatabaseConnection& operator=(const DatabaseConnection&) = delete;

    QSqlDatabase database() const;
    // The statement as this connection's engine must read it.
    QString adapt(const QString& sql) const;

private:
    QString name_;
    bool embedded_;
};

// The Failure that describes a database error as the driver reported it.
Failure failureOf(const QSqlError& error);

}  // namespace pelmar
