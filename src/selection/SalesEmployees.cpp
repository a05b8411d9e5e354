#include "selection/SalesEmployees.h"

#include "common/Failure.h"
#include "common/Fields.h"
#include "db/DatabaseClient.h"
#include "options/MailingOptions.h"

using namespace Qt::StringLiterals;

namespace pelmar {

void FillCmbAgent(const DatabaseClient& client, const QString& connString, MailingOptions& options)
{
    try {
        auto rows = client.open(u"SELECT * FROM OSLP"_s, connString);
        if (rows->eof())
            return;
        // Everything is read before the list changes, so a failure part-way keeps the old list.
        QList<SalesEmployee> employees;
        for (; !rows->eof(); rows->moveNext()) {
            const QString name = TrimField(rows->value(u"SlpName"_s));
            if (!name.isEmpty())
                employees.append({name, rows->value(u"SlpCode"_s).toInt()});
        }
        options.agents = employees;
        options.agentIndex = -1;
    } catch (const Failure&) {}
}

}  // namespace pelmar
