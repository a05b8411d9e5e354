#pragma once

#include "demo/CompanyGenerator.h"

#include <QFile>
#include <QHash>
#include <QString>
#include <QStringList>

#include <memory>

namespace pelmar::test {

// Writes generated rows as PostgreSQL COPY text files, one per table, in a folder, and lists
// the psql "\copy" commands that load them.
class PgCopyWriter : public RowSink {
public:
    explicit PgCopyWriter(QString folder);
    void add(const TableSchema& table, const QVariantList& values) override;
    // Closes the files; returns one "\copy" command per table written.
    QStringList finish();

private:
    QString folder_;
    QHash<QString, std::shared_ptr<QFile>> files_;
    QHash<QString, QString> columns_;
};

}  // namespace pelmar::test
