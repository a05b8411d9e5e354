#pragma once

#include "demo/CompanyGenerator.h"

#include <QHash>
#include <QList>
#include <QString>
#include <QVariantMap>

namespace pelmar::test {

// Keeps a generated company in memory, each row as a map from column name to value, so that
// tests can work out independently what a statement must return.
class MemoryCompany : public RowSink {
public:
    explicit MemoryCompany(const CompanyOptions& options);
    MemoryCompany() = default;
    void add(const TableSchema& table, const QVariantList& values) override;

    const QList<QVariantMap>& rows(const QString& table) const;

private:
    QHash<QString, QList<QVariantMap>> tables_;
};

}  // namespace pelmar::test
