#include "support/MemoryCompany.h"

#include "demo/CompanySchema.h"

namespace pelmar::test {

MemoryCompany::MemoryCompany(const CompanyOptions& options)
{
    generateCompany(options, *this);
}

void MemoryCompany::add(const TableSchema& table, const QVariantList& values)
{
    QVariantMap row;
    for (int i = 0; i < values.size(); ++i)
        row.insert(table.columns.at(i), values.at(i));
    tables_[table.name].append(row);
}

const QList<QVariantMap>& MemoryCompany::rows(const QString& table) const
{
    static const QList<QVariantMap> none;
    const auto found = tables_.find(table);
    return found == tables_.end() ? none : *found;
}

}  // namespace pelmar::test
