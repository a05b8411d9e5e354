#include "db/DatabaseClient.h"

#include "common/Failure.h"
#include "db/ConnectionTarget.h"
#include "db/DatabaseConnection.h"

#include <QFileInfo>

namespace pelmar {

DatabaseClient::DatabaseClient(QString sqlServerDriver) : sqlServerDriver_(std::move(sqlServerDriver))
{}

std::unique_ptr<DatabaseConnection> DatabaseClient::openConnection(const QString& connString,
                                                                   int loginTimeoutSeconds) const
{
    const ConnectionTarget target = ConnectionTarget::parse(connString);
    if (target.kind == ConnectionTarget::Kind::Embedded) {
        const QString file = target.embeddedFile();
        if (!QFileInfo(file).isFile())
            throw Failure(QStringLiteral("Cannot open database \"%1\" requested by the login: "
                                         "there is no file %2.")
                              .arg(target.database, file));
        return std::make_unique<DatabaseConnection>(QStringLiteral("QSQLITE"), file,
                                                    QStringLiteral("QSQLITE_OPEN_READONLY"), true);
    }
    const QString options = QStringLiteral("SQL_ATTR_LOGIN_TIMEOUT=%1").arg(loginTimeoutSeconds);
    return std::make_unique<DatabaseConnection>(QStringLiteral("QODBC"), target.odbcString(sqlServerDriver_), options,
                                                false);
}

std::unique_ptr<Recordset> DatabaseClient::open(const QString& sql, const QString& connString,
                                                int loginTimeoutSeconds) const
{
    return std::make_unique<Recordset>(openConnection(connString, loginTimeoutSeconds), sql);
}

void DatabaseClient::connect(const QString& connString, int loginTimeoutSeconds) const
{
    openConnection(connString, loginTimeoutSeconds);
}

}  // namespace pelmar
