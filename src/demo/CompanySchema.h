#pragma once

#include <QList>
#include <QString>
#include <QStringList>

namespace pelmar {

// The tables of an SAP Business One company database that this program reads, with the columns
// it uses, as one portable schema: the same statements create it on PostgreSQL and on the
// embedded engine. Names are unquoted, so each engine folds them its own way.
struct TableSchema {
    QString name;
    QStringList columns;  // in insert order
    QStringList definitions;  // "Name TYPE", same order
    QString primaryKey;  // "Col" or "Col1, Col2"
    QStringList indexes;  // "CREATE INDEX ..." statements
};

// The company tables, in an order in which they can be filled.
const QList<TableSchema>& companyTables();
// The one table of the common database "sbo-common".
const TableSchema& companyRegistryTable();

// The CREATE TABLE statements of a list of tables, with their primary keys.
QStringList createStatements(const QList<TableSchema>& tables);
// Their further indexes; made after a bulk load, which they would slow down.
QStringList indexStatements(const QList<TableSchema>& tables);

const TableSchema& tableNamed(const QString& name);

}  // namespace pelmar
