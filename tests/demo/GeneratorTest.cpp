#include "demo/CompanySchema.h"
#include "support/Engines.h"
#include "support/MemoryCompany.h"
#include "support/QtPrinting.h"

#include <QCryptographicHash>
#include <QDate>
#include <QRegularExpression>
#include <QSet>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

// A fingerprint of every row of every table, in the order produced.
class Fingerprint : public RowSink {
public:
    void add(const TableSchema& table, const QVariantList& values) override
    {
        hash.addData(table.name.toUtf8());
        for (const QVariant& value : values)
            hash.addData((value.isNull() ? u"<null>"_s : value.toString()).toUtf8() + '\x1f');
    }
    QByteArray result() { return hash.result(); }
    QCryptographicHash hash{QCryptographicHash::Sha256};
};

QByteArray fingerprintOf(std::uint64_t seed)
{
    Fingerprint fingerprint;
    CompanyOptions options;
    options.seed = seed;
    generateCompany(options, fingerprint);
    return fingerprint.result();
}

TEST(CompanyGenerator, TheSameSeedGivesTheSameCompany)
{
    EXPECT_EQ(fingerprintOf(7), fingerprintOf(7));
    EXPECT_NE(fingerprintOf(7), fingerprintOf(8));
}

bool anyText(const QList<QVariantMap>& rows, const QString& column, const std::function<bool(const QString&)>& test)
{
    return std::any_of(rows.begin(), rows.end(), [&](const QVariantMap& row) {
        return !row.value(column).isNull() && test(row.value(column).toString());
    });
}

bool anyNull(const QList<QVariantMap>& rows, const QString& column)
{
    return std::any_of(rows.begin(), rows.end(), [&](const QVariantMap& row) { return row.value(column).isNull(); });
}

TEST(CompanyGenerator, TheDataHoldsTheAwkwardValuesOnPurpose)
{
    CompanyOptions options;
    options.cards = 1000;
    const MemoryCompany company(options);
    const auto& cards = company.rows(u"OCRD"_s);
    ASSERT_EQ(cards.size(), 1000);

    EXPECT_TRUE(anyText(cards, u"CardName"_s, [](const QString& s) { return s.contains(u'\''); }));
    EXPECT_TRUE(anyText(cards, u"CardName"_s, [](const QString& s) { return s.contains(u'<') && s.contains(u'&'); }));
    EXPECT_TRUE(anyText(cards, u"CardName"_s, [](const QString& s) { return s.size() > 30; }));
    EXPECT_TRUE(anyText(cards, u"CardCode"_s, [](const QString& s) { return s.contains(u'\''); }));
    EXPECT_TRUE(
        anyText(cards, u"CardName"_s, [](const QString& s) { return s.contains(QRegularExpression(u"[א-ת]"_s)); }));
    EXPECT_TRUE(
        anyText(cards, u"CardName"_s, [](const QString& s) { return s.contains(QRegularExpression(u"^[A-Za-z]"_s)); }));
    EXPECT_TRUE(anyText(cards, u"Phone1"_s, [](const QString& s) { return s.contains(u'-'); }));
    EXPECT_TRUE(anyText(cards, u"Phone1"_s, [](const QString& s) { return s.contains(u' '); }));
    EXPECT_TRUE(anyText(cards, u"Phone1"_s, [](const QString& s) { return s.isEmpty(); }));
    EXPECT_TRUE(anyNull(cards, u"Phone1"_s));
    EXPECT_TRUE(anyNull(cards, u"MailAddres"_s));
    EXPECT_TRUE(anyText(cards, u"MailAddres"_s, [](const QString& s) { return s.contains(u"\r\n"_s); }));
    EXPECT_TRUE(anyText(cards, u"E_Mail"_s, [](const QString& s) { return !s.isEmpty() && !s.contains(u'@'); }));
    EXPECT_TRUE(anyNull(cards, u"CntctPrsn"_s));
    for (const char16_t* type : {u"C", u"S", u"L"})
        EXPECT_TRUE(anyText(cards, u"CardType"_s, [&](const QString& s) { return s == QString::fromUtf16(type); }));

    QHash<QString, int> contactsPerCard;
    for (const QVariantMap& contact : company.rows(u"OCPR"_s))
        ++contactsPerCard[contact.value(u"CardCode"_s).toString()];
    EXPECT_LT(contactsPerCard.size(), cards.size()) << "some cards have no contact";
    EXPECT_TRUE(std::any_of(contactsPerCard.begin(), contactsPerCard.end(), [](int n) { return n >= 3; }));
    EXPECT_TRUE(anyText(company.rows(u"OCPR"_s), u"Address"_s,
                        [](const QString& s) { return s.size() > 5 && s.contains(u','); }));
    EXPECT_TRUE(anyText(company.rows(u"OCPR"_s), u"Address"_s, [](const QString& s) { return s.size() <= 5; }));

    for (const char16_t* table :
         {u"OINV", u"ORIN", u"ODLN", u"OPOR", u"OQUT", u"ORCT", u"OCHO", u"OVPM", u"OCRV", u"INV1", u"RIN1"})
        EXPECT_FALSE(company.rows(QString::fromUtf16(table)).isEmpty()) << QString::fromUtf16(table).toStdString();
    QSet<int> years;
    for (const QVariantMap& invoice : company.rows(u"OINV"_s))
        years.insert(invoice.value(u"DocDate"_s).toDate().year());
    EXPECT_GT(years.size(), 5);
    EXPECT_EQ(company.rows(u"OCQG"_s).size(), 64);
    EXPECT_EQ(company.rows(u"CINF"_s).first().value(u"Version"_s).toInt() / 1000, 900);
}

class GeneratedCompanyTest : public ::testing::TestWithParam<EngineFactory> {};

TEST_P(GeneratedCompanyTest, AGeneratedCompanyLoadsWithEveryRowIntact)
{
    auto engine = GetParam()();
    CompanyOptions options;
    options.cards = 250;
    options.schemaLevel = 0;
    const MemoryCompany expected(options);
    engine->createCompany(u"gen"_s, options);
    for (const char16_t* table : {u"OCRD", u"OCPR", u"CRD1", u"OINV", u"INV1", u"OCHO", u"OSLP"}) {
        const QString name = QString::fromUtf16(table);
        auto rows = engine->client().open(u"SELECT COUNT(*) AS N FROM "_s + name, engine->connString(u"gen"_s));
        EXPECT_EQ(rows->value(u"N"_s).toInt(), expected.rows(name).size()) << name.toStdString();
    }
    auto card
        = engine->client().open(u"SELECT CardName, MailAddres, Phone2 FROM OCRD WHERE CardCode LIKE N'_''0000211'"_s,
                                engine->connString(u"gen"_s));
    ASSERT_FALSE(card->eof()) << "the code with an apostrophe is stored as it is";
    auto version = engine->client().open(u"SELECT Version FROM CINF"_s, engine->connString(u"gen"_s));
    EXPECT_EQ(version->value(u"Version"_s).toInt() / 1000, 61);
}

INSTANTIATE_TEST_SUITE_P(Engines, GeneratedCompanyTest, ::testing::Values(&makeSqliteEngine, &makePostgresEngine),
                         engineName);

}  // namespace
}  // namespace pelmar::test
