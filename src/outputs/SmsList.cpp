#include "outputs/SmsList.h"

#include "common/Fields.h"
#include "common/TextFileWriter.h"
#include "db/DatabaseClient.h"

using namespace Qt::StringLiterals;

namespace pelmar {

void writeSmsList(const QString& path, const ListQuery& query)
{
    TextFileWriter file(path, false);
    auto rows = query.client.open(query.statement, query.connString);
    if (rows->eof())
        return file.close();
    const int contactMobile = rows->requiredColumn(u"CMobile"_s);
    const int cardMobile = rows->requiredColumn(u"Mobile"_s);
    for (; !rows->eof(); rows->moveNext()) {
        if (query.wanted && !query.wanted(FieldText(rows->value(u"CardCode"_s))))
            continue;
        const QString number = FieldText(ValueOrDefault(rows->valueAt(contactMobile), rows->valueAt(cardMobile)));
        if (!number.isEmpty())
            file.line(number);
    }
    file.close();
}

}  // namespace pelmar
