#pragma once

#include <QList>
#include <QString>

#include <optional>

namespace pelmar {

class DatabaseClient;

struct SalesEmployee {
    QString name;  // OSLP.SlpName without leading and trailing blanks
    int code = 0;  // OSLP.SlpCode
};

// The sales employees of OSLP in the order the table gives them, leaving out those without a
// name. std::nullopt when the table has no rows (the caller then keeps the list it has).
// Throws Failure when the database cannot be read.
std::optional<QList<SalesEmployee>> readSalesEmployees(const DatabaseClient& client, const QString& connString);

}  // namespace pelmar
