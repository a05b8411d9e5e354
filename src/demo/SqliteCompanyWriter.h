#pragma once

#include "demo/CompanyGenerator.h"

#include <QHash>
#include <QSqlQuery>
#include <QString>

#include <memory>

namespace pelmar {

class DatabaseConnection;

// Writes rows into a new embedded company database file, in one transaction with one prepared
// statement per table. The file is written under a temporary name and renamed into place by
// commit(), so a failed or interrupted run never leaves a half-written company behind.
class SqliteCompanyWriter : public RowSink {
public:
    // Creates the tables of schema in a new file for path. Throws Failure when it cannot.
    SqliteCompanyWriter(const QString& path, const QList<struct TableSchema>& schema);
    ~SqliteCompanyWriter() override;

    void add(const TableSchema& table, const QVariantList& values) override;

    // Builds the indexes, commits and moves the file to its path (replacing one that is there).
    void commit();

private:
    QSqlQuery& insertFor(const TableSchema& table);
    void execute(const QString& statement);

    QString path_;
    QString partPath_;
    QList<TableSchema> schema_;
    std::unique_ptr<DatabaseConnection> connection_;
    QHash<QString, QSqlQuery> inserts_;
    bool committed_ = false;
};

// Creates an embedded company database at path from a generated company.
void writeSqliteCompany(const QString& path, const CompanyOptions& options);

// Creates the embedded common database "sbo-common" at path, listing the given companies.
void writeSqliteCommon(const QString& path, const QList<QPair<QString, QString>>& companies);

}  // namespace pelmar
