#include "db/OdbcDrivers.h"

#include <sql.h>
#include <sqlext.h>

namespace pelmar {

QStringList installedOdbcDrivers()
{
    QStringList names;
    SQLHENV env = SQL_NULL_HENV;
    if (!SQL_SUCCEEDED(SQLAllocHandle(SQL_HANDLE_ENV, SQL_NULL_HANDLE, &env)))
        return names;
    SQLSetEnvAttr(env, SQL_ATTR_ODBC_VERSION, reinterpret_cast<SQLPOINTER>(SQL_OV_ODBC3), 0);
    SQLCHAR description[512];
    SQLCHAR attributes[2048];
    SQLSMALLINT descriptionLength = 0;
    SQLSMALLINT attributesLength = 0;
    SQLUSMALLINT direction = SQL_FETCH_FIRST;
    while (SQL_SUCCEEDED(SQLDrivers(env, direction, description, sizeof description, &descriptionLength, attributes,
                                    sizeof attributes, &attributesLength))) {
        names << QString::fromUtf8(reinterpret_cast<const char*>(description));
        direction = SQL_FETCH_NEXT;
    }
    SQLFreeHandle(SQL_HANDLE_ENV, env);
    return names;
}

QString chooseSqlServerDriver(const QString& configured, const QStringList& installed)
{
    const QString fromEnvironment = qEnvironmentVariable("PELMAR_SQLSERVER_DRIVER");
    if (!fromEnvironment.isEmpty())
        return fromEnvironment;
    if (!configured.isEmpty())
        return configured;
    for (const char* microsoft : {"ODBC Driver 18 for SQL Server", "ODBC Driver 17 for SQL Server"}) {
        if (installed.contains(QLatin1String(microsoft)))
            return QLatin1String(microsoft);
    }
    return QStringLiteral("FreeTDS");
}

}  // namespace pelmar
