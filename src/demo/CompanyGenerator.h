#pragma once

#include <QString>
#include <QVariantList>

#include <cstdint>

namespace pelmar {

struct TableSchema;

// Receives the rows of a generated company, table by table interleaved, each row's values in
// the table's column order; a null QVariant is a database Null.
class RowSink {
public:
    virtual ~RowSink() = default;
    virtual void add(const TableSchema& table, const QVariantList& values) = 0;
};

struct CompanyOptions {
    std::uint64_t seed = 1;
    int cards = 300;
    int schemaLevel = 1;  // 1 writes a newer CINF.Version, 0 an older one
    int properties = 64;  // rows of OCQG (property numbers 1..properties)
    QString companyName = QStringLiteral("פלמר הדגמה בע\"מ");
};

// Writes a whole company database, deterministic for a seed: groups of each card type, sales
// employees, countries and states, properties, cards with zero to several contacts and a main
// contact, address rows, documents of every type across several years with invoice and credit
// note lines. Hebrew and English names, phones written with dashes and blanks, and on purpose a
// share of awkward values: Null and empty columns, apostrophes, "<" and "&" in names, long
// names, addresses with commas and line breaks, e-mail addresses without "@".
// Rows are produced one card at a time, so memory stays flat for any number of cards.
void generateCompany(const CompanyOptions& options, RowSink& sink);

}  // namespace pelmar
