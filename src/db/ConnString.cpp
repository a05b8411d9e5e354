#include "db/ConnString.h"

namespace pelmar {

namespace {

constexpr qsizetype kMaxDatabaseName = 30;

QString stringOfKind(short kind, const QString& s, const QString& u, const QString& p, const QString& d)
{
    switch (kind) {
    case kSqlServerLogin:
        return QStringLiteral("Provider=sqloledb;Data Source=") + s + QStringLiteral(";User Id=") + u
            + QStringLiteral(";Password=") + p + QStringLiteral(";Initial Catalog=") + d;
    case kSqlServerIntegrated:
        return QStringLiteral("Provider=sqloledb;Data Source=") + s
            + QStringLiteral(";Integrated Security=SSPI;Persist Security Info=False;Initial Catalog=") + d;
    case kNativeClientLogin:
        return QStringLiteral("Provider=SQLNCLI;Server=") + s + QStringLiteral(";UID=") + u + QStringLiteral(";PWD=")
            + p + QStringLiteral(";Database=") + d;
    case kNativeClientTrusted:
        return QStringLiteral("Provider=SQLNCLI;Server=") + s + QStringLiteral(";Trusted_Connection=yes;Database=") + d;
    case kDataSourceName: return QStringLiteral("DSN=") + s + QStringLiteral(";Uid=") + u + QStringLiteral(";Pwd=") + p;
    default: return {};
    }
}

}  // namespace

QString BuildConnString(const QString& server, const QString& uid, QVariant& pwd, const QString& database, short& kind)
{
    if (pwd.isNull())
        pwd = QString();
    QString name = database;
    if (uid.isEmpty())
        kind = kSqlServerIntegrated;
    if (name.startsWith(u'.')) {
        name = name.mid(1, kMaxDatabaseName);
        kind = uid.isEmpty() ? kNativeClientTrusted : kNativeClientLogin;
    }
    if (name.isEmpty())
        kind = kDataSourceName;
    return stringOfKind(kind, server, uid, pwd.toString(), name);
}

QString BuildConnString(const QString& server, const QString& uid, const QString& pwd, const QString& database)
{
    QVariant password(pwd);
    short kind = kSqlServerLogin;
    return BuildConnString(server, uid, password, database, kind);
}

}  // namespace pelmar
