#include "db/DatabaseConnection.h"

#include "common/Failure.h"
#include "db/SqliteLiterals.h"

#include <atomic>

namespace pelmar {

namespace {

QString uniqueName()
{
    static std::atomic<unsigned> counter{0};
    return QStringLiteral("pelmar-%1").arg(++counter);
}

}  // namespace

Failure failureOf(const QSqlError& error)
{
    QString description = error.databaseText().trimmed();
    if (description.isEmpty())
        description = error.driverText().trimmed();
    if (description.isEmpty())
        description = QStringLiteral("The database reported an error without a description.");
    bool numeric = false;
    const long number = error.nativeErrorCode().toLong(&numeric);
    return Failure(description, numeric && number != 0 ? number : Failure::kUnspecified);
}

DatabaseConnection::DatabaseConnection(const QString& driverType, const QString& databaseName, const QString& options,
                                       bool embedded)
    : name_(uniqueName()), embedded_(embedded)
{
    QSqlDatabase db = QSqlDatabase::addDatabase(driverType, name_);
    db.setDatabaseName(databaseName);
    db.setConnectOptions(options);
    if (!db.open()) {
        const QSqlError error = db.lastError();
        db = QSqlDatabase();
        QSqlDatabase::removeDatabase(name_);
        throw failureOf(error);
    }
}

DatabaseConnection::~DatabaseConnection()
{
    {
        QSqlDatabase db = QSqlDatabase::database(name_, false);
        db.close();
    }
    QSqlDatabase::removeDatabase(name_);
}

QSqlDatabase DatabaseConnection::database() const
{
    return QSqlDatabase::database(name_, false);
}

QString DatabaseConnection::adapt(const QString& sql) const
{
    return embedded_ ? adaptLiteralsForSqlite(sql) : sql;
}

}  // namespace pelmar
