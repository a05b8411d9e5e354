#pragma once

#include <QString>

namespace pelmar {

// What a connection string of BuildConnString names, taken apart again so that it can be
// opened through ODBC or the embedded engine.
struct ConnectionTarget {
    enum class Kind { SqlServer, DataSourceName, Embedded };

    Kind kind = Kind::SqlServer;
    QString host;  // SQL Server host (may carry "\instance"); the data source name
    int port = 0;  // 0 when the server names no port
    QString user;
    QString password;
    QString database;
    bool integrated = false;  // Windows authentication
    QString folder;  // Embedded: the folder of the "<database>.sqlite" files

    // Reads a string of any kind BuildConnString makes. A server written "sqlite:<folder>"
    // names the embedded engine. Throws Failure for any other string.
    static ConnectionTarget parse(const QString& connString);

    // The ODBC connection string for the given driver. Values are brace-quoted where needed,
    // so a ";", "}" or "=" in a password cannot change the string. Not for Embedded targets.
    QString odbcString(const QString& driver) const;

    // The file of the embedded database.
    QString embeddedFile() const;
};

// Quotes an ODBC attribute value that needs it (one holding ";", "{", "}", "=" or leading or
// trailing blanks): {value} with every "}" doubled. Other values are left as they are, since
// some drivers take the braces of a plain value literally.
QString odbcQuoted(const QString& value);

}  // namespace pelmar
