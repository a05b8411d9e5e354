#pragma once

#include <QString>
#include <QStringList>

#include <functional>

namespace pelmar {

class DatabaseClient;

// Lists the company databases of "sbo-common" (SRGC.dbName, ascending), handing each name to
// add as it is read, with a 10-second login timeout. Throws Failure when the server cannot be
// reached, the login is refused or there is no "sbo-common"; names handed over before stay.
void listCompanyDatabases(const DatabaseClient& client, const QString& server, const QString& uid, const QString& pwd,
                          const std::function<void(const QString&)>& add);

// The databases the logon check tries, in order: the text without leading and trailing blanks
// split at every ";" (empty pieces kept); an empty text is one empty name.
QStringList databasesToCheck(const QString& text);

// Opens "SELECT * FROM OCRD" on database with the given server, user and password.
// Throws Failure when it cannot.
void checkCompanyDatabase(const DatabaseClient& client, const QString& server, const QString& uid, const QString& pwd,
                          const QString& database);

}  // namespace pelmar
