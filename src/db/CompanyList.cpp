#include "db/CompanyList.h"

#include "common/Fields.h"
#include "db/ConnString.h"
#include "db/DatabaseClient.h"

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

// The logon dialog waits at most this long for a server.
constexpr int kListLoginTimeout = 10;

}  // namespace

void listCompanyDatabases(const DatabaseClient& client, const QString& server, const QString& uid, const QString& pwd,
                          const std::function<void(const QString&)>& add)
{
    const QString connString = BuildConnString(server, uid, pwd, u"sbo-common"_s);
    auto companies = client.open(u"SELECT dbName, cmpName FROM SRGC ORDER BY dbName"_s, connString, kListLoginTimeout);
    for (; !companies->eof(); companies->moveNext())
        add(FieldText(companies->value(u"DBName"_s)));
}

QStringList databasesToCheck(const QString& text)
{
    const QString names = text.trimmed();
    if (names.isEmpty())
        return {QString()};
    return names.split(u';');
}

void checkCompanyDatabase(const DatabaseClient& client, const QString& server, const QString& uid, const QString& pwd,
                          const QString& database)
{
    client.open(u"SELECT * FROM OCRD"_s, BuildConnString(server, uid, pwd, database), kListLoginTimeout);
}

}  // namespace pelmar
