#include "selection/SalesEmployees.h"

#include "common/Fields.h"
#include "db/DatabaseClient.h"

using namespace Qt::StringLiterals;

namespace pelmar {

std::optional<QList<SalesEmployee>> readSalesEmployees(const DatabaseClient& client, const QString& connString)
{
    auto rows = client.open(u"SELECT * FROM OSLP"_s, connString);
    if (rows->eof())
        return std::nullopt;
    QList<SalesEmployee> employees;
    for (; !rows->eof(); rows->moveNext()) {
        const QString name = TrimField(rows->value(u"SlpName"_s));
        if (!name.isEmpty())
            employees.append({name, rows->value(u"SlpCode"_s).toInt()});
    }
    return employees;
}

}  // namespace pelmar
