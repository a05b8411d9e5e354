#include "demo/CompanySchema.h"

#include <stdexcept>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

TableSchema table(const QString& name, const QList<QPair<QString, QString>>& columns, const QString& key,
                  const QStringList& indexed = {})
{
    TableSchema schema{name, {}, {}, key, {}};
    for (const auto& [column, type] : columns) {
        schema.columns << column;
        schema.definitions << column + u' ' + type;
    }
    for (const QString& columnList : indexed) {
        const QString indexName = u"IX_"_s + name + u'_' + QString(columnList).remove(u' ').replace(u',', u'_');
        schema.indexes << u"CREATE INDEX %1 ON %2 (%3)"_s.arg(indexName, name, columnList);
    }
    return schema;
}

const QString kText = u"VARCHAR(100)"_s;
const QString kShort = u"VARCHAR(20)"_s;
const QString kCode = u"VARCHAR(15)"_s;
const QString kFlag = u"CHAR(1)"_s;

QList<QPair<QString, QString>> cardColumns()
{
    QList<QPair<QString, QString>> columns = {{u"CardCode"_s, kCode},
                                              {u"CardName"_s, kText},
                                              {u"CardFName"_s, kText},
                                              {u"CardType"_s, kFlag},
                                              {u"GroupCode"_s, u"INTEGER"_s},
                                              {u"CntctPrsn"_s, kText},
                                              {u"Address"_s, kText},
                                              {u"ZipCode"_s, kShort},
                                              {u"City"_s, kText},
                                              {u"County"_s, kText},
                                              {u"Country"_s, u"VARCHAR(3)"_s},
                                              {u"State1"_s, u"VARCHAR(3)"_s},
                                              {u"Block"_s, kText},
                                              {u"MailAddres"_s, kText},
                                              {u"MailZipCod"_s, kShort},
                                              {u"MailCity"_s, kText},
                                              {u"MailCounty"_s, kText},
                                              {u"MailCountr"_s, u"VARCHAR(3)"_s},
                                              {u"State2"_s, u"VARCHAR(3)"_s},
                                              {u"MailBlock"_s, kText},
                                              {u"Phone1"_s, kShort},
                                              {u"Phone2"_s, kShort},
                                              {u"Cellular"_s, kShort},
                                              {u"Fax"_s, kShort},
                                              {u"E_Mail"_s, kText},
                                              {u"SlpCode"_s, u"INTEGER"_s},
                                              {u"LicTradNum"_s, u"VARCHAR(32)"_s},
                                              {u"Notes"_s, kText},
                                              {u"Free_Text"_s, u"TEXT"_s}};
    for (int n = 1; n <= 64; ++n)
        columns.append({u"QryGroup"_s + QString::number(n), kFlag});
    return columns;
}

TableSchema documentTable(const QString& name, const QString& cardField, const QString& nameField,
                          const QString& dateField)
{
    return table(name,
                 {{u"DocEntry"_s, u"INTEGER"_s},
                  {u"DocNum"_s, u"INTEGER"_s},
                  {cardField, kCode},
                  {nameField, kText},
                  {dateField, u"DATE"_s},
                  {u"CntctCode"_s, u"INTEGER"_s},
                  {u"Address"_s, u"VARCHAR(254)"_s}},
                 u"DocEntry"_s, {cardField, dateField});
}

TableSchema lineTable(const QString& name)
{
    return table(name, {{u"DocEntry"_s, u"INTEGER"_s}, {u"LineNum"_s, u"INTEGER"_s}, {u"ItemCode"_s, u"VARCHAR(20)"_s}},
                 u"DocEntry, LineNum"_s, {u"ItemCode"_s});
}

QList<TableSchema> buildCompanyTables()
{
    QList<TableSchema> tables = {
        table(u"CINF"_s, {{u"CompnyName"_s, kText}, {u"Version"_s, u"INTEGER"_s}}, u"CompnyName"_s),
        table(u"OCRG"_s, {{u"GroupCode"_s, u"INTEGER"_s}, {u"GroupName"_s, kText}, {u"GroupType"_s, kFlag}},
              u"GroupCode"_s),
        table(u"OCQG"_s, {{u"GroupCode"_s, u"INTEGER"_s}, {u"GroupName"_s, kText}}, u"GroupCode"_s),
        table(u"OSLP"_s, {{u"SlpCode"_s, u"INTEGER"_s}, {u"SlpName"_s, kText}}, u"SlpCode"_s),
        table(u"OCRY"_s, {{u"Code"_s, u"VARCHAR(3)"_s}, {u"Name"_s, kText}}, u"Code"_s),
        table(u"OCST"_s, {{u"Code"_s, u"VARCHAR(3)"_s}, {u"Country"_s, u"VARCHAR(3)"_s}, {u"Name"_s, kText}},
              u"Code, Country"_s),
        table(u"OCRD"_s, cardColumns(), u"CardCode"_s, {u"CardName"_s, u"CardType, GroupCode"_s}),
        table(u"OCPR"_s,
              {{u"CntctCode"_s, u"INTEGER"_s},
               {u"CardCode"_s, kCode},
               {u"Name"_s, kText},
               {u"Position"_s, kText},
               {u"Address"_s, u"VARCHAR(254)"_s},
               {u"Tel1"_s, kShort},
               {u"Tel2"_s, kShort},
               {u"Cellolar"_s, kShort},
               {u"Fax"_s, kShort},
               {u"E_MailL"_s, kText},
               {u"Pager"_s, kShort},
               {u"Notes1"_s, kText},
               {u"Notes2"_s, kText}},
              u"CntctCode"_s, {u"CardCode, Name"_s}),
        table(u"CRD1"_s,
              {{u"CardCode"_s, kCode},
               {u"Address"_s, kText},
               {u"AdresType"_s, kFlag},
               {u"Street"_s, kText},
               {u"Block"_s, kText},
               {u"City"_s, kText},
               {u"ZipCode"_s, kShort},
               {u"County"_s, kText},
               {u"State"_s, u"VARCHAR(3)"_s},
               {u"Country"_s, u"VARCHAR(3)"_s}},
              u"CardCode, Address, AdresType"_s),
    };
    for (const char16_t* name : {u"OINV", u"ORIN", u"ODLN", u"OPOR", u"OQUT", u"ORCT", u"OVPM"})
        tables << documentTable(QString::fromUtf16(name), u"CardCode"_s, u"CardName"_s, u"DocDate"_s);
    tables << documentTable(u"OCHO"_s, u"VendorCode"_s, u"VendorName"_s, u"PmntDate"_s);
    tables << documentTable(u"OCRV"_s, u"CardCode"_s, u"CardName"_s, u"PayDate"_s);
    tables << lineTable(u"INV1"_s) << lineTable(u"RIN1"_s);
    return tables;
}

}  // namespace

const QList<TableSchema>& companyTables()
{
    static const QList<TableSchema> tables = buildCompanyTables();
    return tables;
}

const TableSchema& companyRegistryTable()
{
    static const TableSchema registry
        = table(u"SRGC"_s, {{u"dbName"_s, kText}, {u"cmpName"_s, kText}, {u"versStr"_s, kShort}}, u"dbName"_s);
    return registry;
}

const TableSchema& tableNamed(const QString& name)
{
    for (const TableSchema& schema : companyTables()) {
        if (schema.name == name)
            return schema;
    }
    if (name == companyRegistryTable().name)
        return companyRegistryTable();
    throw std::invalid_argument("no such company table");
}

QStringList createStatements(const QList<TableSchema>& tables)
{
    QStringList statements;
    for (const TableSchema& schema : tables)
        statements << u"CREATE TABLE %1 (%2, PRIMARY KEY (%3))"_s.arg(schema.name, schema.definitions.join(u", "_s),
                                                                      schema.primaryKey);
    return statements;
}

QStringList indexStatements(const QList<TableSchema>& tables)
{
    QStringList statements;
    for (const TableSchema& schema : tables)
        statements << schema.indexes;
    return statements;
}

}  // namespace pelmar
