#include "demo/SqliteCompanyWriter.h"

#include "common/Failure.h"
#include "db/DatabaseConnection.h"
#include "demo/CompanySchema.h"

#include <QFile>
#include <QSqlDriver>

using namespace Qt::StringLiterals;

namespace pelmar {

SqliteCompanyWriter::SqliteCompanyWriter(const QString& path, const QList<TableSchema>& schema)
    : path_(path), partPath_(path + u".part"_s), schema_(schema)
{
    QFile::remove(partPath_);
    connection_ = std::make_unique<DatabaseConnection>(u"QSQLITE"_s, partPath_, QString(), false);
    execute(u"PRAGMA journal_mode=OFF"_s);
    execute(u"PRAGMA synchronous=OFF"_s);
    for (const QString& statement : createStatements(schema_))
        execute(statement);
    if (!connection_->database().transaction())
        throw failureOf(connection_->database().lastError());
}

SqliteCompanyWriter::~SqliteCompanyWriter()
{
    inserts_.clear();
    connection_.reset();
    if (!committed_)
        QFile::remove(partPath_);
}

void SqliteCompanyWriter::execute(const QString& statement)
{
    QSqlQuery query(connection_->database());
    if (!query.exec(statement))
        throw failureOf(query.lastError());
}

QSqlQuery& SqliteCompanyWriter::insertFor(const TableSchema& table)
{
    auto found = inserts_.find(table.name);
    if (found != inserts_.end())
        return *found;
    QSqlQuery query(connection_->database());
    const QString marks = QStringList(QList<QString>(table.columns.size(), u"?"_s)).join(u", "_s);
    if (!query.prepare(u"INSERT INTO %1 (%2) VALUES (%3)"_s.arg(table.name, table.columns.join(u", "_s), marks)))
        throw failureOf(query.lastError());
    return *inserts_.insert(table.name, query);
}

// Dates are stored as ISO text, the form the embedded engine compares correctly.
namespace {

// A value as the embedded engine stores it: a date as ISO text, and an empty text as empty text
// (the driver would take an empty QString for Null, which the row does not mean).
QVariant stored(const QVariant& value)
{
    if (value.typeId() == QMetaType::QDate)
        return value.toDate().toString(Qt::ISODate);
    if (!value.isNull() && value.typeId() == QMetaType::QString && value.toString().isEmpty())
        return QString(u""_s);
    return value;
}

}  // namespace

void SqliteCompanyWriter::add(const TableSchema& table, const QVariantList& values)
{
    QSqlQuery& insert = insertFor(table);
    for (int i = 0; i < values.size(); ++i) {
        const QVariant& value = values.at(i);
        insert.bindValue(i, stored(value));
    }
    if (!insert.exec())
        throw failureOf(insert.lastError());
}

void SqliteCompanyWriter::commit()
{
    for (const QString& statement : indexStatements(schema_))
        execute(statement);
    if (!connection_->database().commit())
        throw failureOf(connection_->database().lastError());
    inserts_.clear();
    connection_.reset();
    QFile::remove(path_);
    if (!QFile::rename(partPath_, path_))
        throw Failure(u"Cannot move the new company database to %1."_s.arg(path_));
    committed_ = true;
}

void writeSqliteCompany(const QString& path, const CompanyOptions& options)
{
    SqliteCompanyWriter writer(path, companyTables());
    generateCompany(options, writer);
    writer.commit();
}

void writeSqliteCommon(const QString& path, const QList<QPair<QString, QString>>& companies)
{
    SqliteCompanyWriter writer(path, {companyRegistryTable()});
    for (const auto& [database, company] : companies)
        writer.add(companyRegistryTable(), {database, company, u"9.0"_s});
    writer.commit();
}

}  // namespace pelmar
