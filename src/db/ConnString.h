#pragma once

#include <QString>
#include <QVariant>

namespace pelmar {

// Connection kinds of BuildConnString. Every caller asks for kind 2; the builder changes it.
enum ConnKind : short {
    kSqlServerLogin = 2,  // sqloledb with user and password
    kSqlServerIntegrated = 3,  // sqloledb with Windows authentication
    kNativeClientLogin = 4,  // SQLNCLI with user and password
    kNativeClientTrusted = 5,  // SQLNCLI with Windows authentication
    kDataSourceName = 6,  // an ODBC data source named by the server setting
};

// Builds the connection string of the company connection.
// - An empty uid selects integrated security (kind 3).
// - A database name beginning with "." selects the native client (4 with a user, 5 without)
//   and keeps at most the 30 characters after the dot; database itself is left unchanged.
// - An empty database name (also after the dot) selects the data source kind 6.
// A null password is replaced by the empty string, also in pwd. kind receives the kind used;
// a kind outside 2 to 6 gives the empty string. Values are inserted as they are, unquoted.
QString BuildConnString(const QString& server, const QString& uid, QVariant& pwd, const QString& database, short& kind);

// BuildConnString for a caller that does not need the kind or the password variable back.
QString BuildConnString(const QString& server, const QString& uid, const QString& pwd, const QString& database);

}  // namespace pelmar
