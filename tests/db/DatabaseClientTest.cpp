#include "common/Failure.h"
#include "db/ConnString.h"
#include "db/DatabaseConnection.h"
#include "support/Engines.h"
#include "support/FailureOf.h"
#include "support/PgCluster.h"
#include "support/QtPrinting.h"

#include <QElapsedTimer>

#include <gtest/gtest.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

const QString kPastTheEnd = u"Either BOF or EOF is True, or the current record has been deleted."_s;

class DatabaseClientTest : public ::testing::TestWithParam<EngineFactory> {
protected:
    void SetUp() override
    {
        engine = GetParam()();
        engine->createDatabase(u"clienttest"_s,
                               {u"CREATE TABLE OCRD (CardCode VARCHAR(15) PRIMARY KEY, CardName VARCHAR(100), "
                                "Phone1 VARCHAR(20), DocDate DATE)"_s,
                                u"INSERT INTO OCRD VALUES ('C001', 'אבג בע\"מ', NULL, '2005-03-01')"_s,
                                u"INSERT INTO OCRD VALUES ('C002', 'O''Brien & <Sons>', '04-1234567', '2005-04-01')"_s,
                                u"INSERT INTO OCRD VALUES ('C003', 'Third', '', '2006-01-01')"_s});
    }

    std::unique_ptr<Recordset> open(const QString& sql)
    {
        return engine->client().open(sql, engine->connString(u"clienttest"_s));
    }

    std::unique_ptr<Engine> engine;
};

TEST_P(DatabaseClientTest, ASecondPassAfterMoveFirstReadsTheSameRows)
{
    auto rows = open(u"SELECT CardCode, CardName FROM OCRD ORDER BY CardCode"_s);
    ASSERT_FALSE(rows->bof());
    QStringList first, second;
    for (; !rows->eof(); rows->moveNext())
        first << rows->value(u"cardcode"_s).toString();
    rows->moveFirst();
    for (; !rows->eof(); rows->moveNext())
        second << rows->value(u"CARDNAME"_s).toString();
    EXPECT_EQ(first, (QStringList{u"C001"_s, u"C002"_s, u"C003"_s}));
    EXPECT_EQ(second, (QStringList{u"אבג בע\"מ"_s, u"O'Brien & <Sons>"_s, u"Third"_s}));
    EXPECT_EQ(failureOf([&] { rows->moveNext(); }), kPastTheEnd) << "moving past the end is an error";
    rows->close();
    EXPECT_TRUE(rows->eof());
    EXPECT_EQ(failureOf([&] { rows->moveFirst(); }), u"The recordset is closed."_s);
}

TEST_P(DatabaseClientTest, NullsEmptyTextAndAliasesReadAsTheyAre)
{
    auto rows = open(u"SELECT OCRD.Phone1 AS Tel, '' MailBlock FROM OCRD WHERE OCRD.CardCode BETWEEN N'C001' And "
                     "N'C003' ORDER BY CardCode"_s);
    EXPECT_TRUE(rows->value(u"tel"_s).isNull());
    EXPECT_EQ(rows->value(u"MailBlock"_s).toString(), QString());
    EXPECT_FALSE(rows->value(u"MailBlock"_s).isNull());
    rows->moveNext();
    EXPECT_EQ(rows->value(u"TEL"_s).toString(), u"04-1234567"_s);
    rows->moveNext();
    EXPECT_FALSE(rows->value(u"Tel"_s).isNull());
    EXPECT_TRUE(rows->hasColumn(u"tel"_s));
    EXPECT_FALSE(rows->hasColumn(u"Fax"_s));
    try {
        rows->value(u"Fax"_s);
        FAIL() << "a column the row does not have must be an error";
    } catch (const Failure& failure) {
        EXPECT_TRUE(failure.description().contains(u"Fax"_s));
    }
}

TEST_P(DatabaseClientTest, SqlServerDateLiteralsSelectByDate)
{
    auto rows = open(u"SELECT CardCode FROM OCRD WHERE OCRD.DocDate Between '03/01/2005' And '03/31/2005'"_s);
    ASSERT_FALSE(rows->eof());
    EXPECT_EQ(rows->value(u"CardCode"_s).toString(), u"C001"_s);
    rows->moveNext();
    EXPECT_TRUE(rows->eof());
}

TEST_P(DatabaseClientTest, AnEmptyResultIsAtBeginningAndEndAtOnce)
{
    auto rows = open(u"SELECT * FROM OCRD WHERE CardCode = N'none'"_s);
    EXPECT_TRUE(rows->bof());
    EXPECT_TRUE(rows->eof());
    EXPECT_EQ(failureOf([&] { rows->value(u"CardCode"_s); }), kPastTheEnd);
}

TEST_P(DatabaseClientTest, ABadStatementCarriesTheDriversDescription)
{
    try {
        open(u"SELECT * FROM NoSuchTable"_s);
        FAIL() << "the statement must fail";
    } catch (const Failure& failure) {
        EXPECT_TRUE(failure.description().contains(u"nosuchtable"_s, Qt::CaseInsensitive))
            << failure.description().toStdString();
        EXPECT_NE(failure.number(), 0);
    }
}

TEST_P(DatabaseClientTest, AMissingDatabaseIsRefusedWithADescription)
{
    try {
        engine->client().open(u"SELECT 1"_s, engine->connString(u"nosuchdb"_s));
        FAIL() << "the open must fail";
    } catch (const Failure& failure) {
        EXPECT_TRUE(failure.description().contains(u"nosuchdb"_s)) << failure.description().toStdString();
    }
}

TEST_P(DatabaseClientTest, AStatementThatFailsOnItsThirdRowThrowsInsteadOfEndingThere)
{
    // Each engine's own error on the row of C003 alone: an integer overflow, a division by zero.
    const bool postgres = QLatin1String(engine->name()) == u"PostgreSQL"_s;
    const QString failing = postgres ? u"1 / (CASE WHEN CardCode = 'C003' THEN 0 ELSE 1 END)"_s
                                     : u"CASE WHEN CardCode = 'C003' THEN abs(-9223372036854775807 - 1) ELSE 1 END"_s;
    QStringList read;
    try {
        for (auto rows = open(u"SELECT CardCode, %1 AS X FROM OCRD ORDER BY CardCode"_s.arg(failing)); !rows->eof();
             rows->moveNext())
            read << rows->value(u"CardCode"_s).toString();
        ADD_FAILURE() << "the rows ended quietly after " << read.size();
    } catch (const Failure& failure) {
        EXPECT_TRUE(failure.description().contains(postgres ? u"division by zero"_s : u"integer overflow"_s))
            << failure.description().toStdString();
    }
    // PostgreSQL fetches the rows in batches, so its error comes with the first.
    EXPECT_EQ(read, postgres ? QStringList{} : (QStringList{u"C001"_s, u"C002"_s}));
}

TEST(DatabaseErrors, TheDescriptionIsTheDatabasesElseTheDriversAndTheNumberTheNativeCode)
{
    const Failure database
        = pelmar::failureOf(QSqlError(u"driver says"_s, u" database says "_s, QSqlError::StatementError, u"3022"_s));
    EXPECT_EQ(database.description(), u"database says"_s);
    EXPECT_EQ(database.number(), 3022);
    const Failure driver = pelmar::failureOf(QSqlError(u"driver says"_s, {}, QSqlError::ConnectionError, u"HY000"_s));
    EXPECT_EQ(driver.description(), u"driver says"_s);
    EXPECT_EQ(driver.number(), Failure::kUnspecified) << "a code that is no number";
    const Failure none = pelmar::failureOf(QSqlError({}, {}, QSqlError::UnknownError, u"0"_s));
    EXPECT_EQ(none.description(), u"The database reported an error without a description."_s);
    EXPECT_EQ(none.number(), Failure::kUnspecified);
}

INSTANTIATE_TEST_SUITE_P(Engines, DatabaseClientTest, ::testing::Values(&makeSqliteEngine, &makePostgresEngine),
                         engineName);

TEST(DatabaseClientServers, AServerThatNeverAnswersFailsWithinTheLoginTimeout)
{
    SilentServer silent;
    const DatabaseClient client(QLatin1String(PgCluster::kDriver));
    const QString connString = BuildConnString(u"127.0.0.1,%1"_s.arg(silent.port()), u"sa"_s, u"pw"_s, u"SBO"_s);
    QElapsedTimer timer;
    timer.start();
    EXPECT_THROW(client.connect(connString, 2), Failure);
    EXPECT_LT(timer.elapsed(), 6000);
}

TEST(DatabaseClientServers, ARefusedConnectionCarriesTheDriversDescription)
{
    const DatabaseClient client(QLatin1String(PgCluster::kDriver));
    const QString connString = BuildConnString(u"127.0.0.1,%1"_s.arg(freeLoopbackPort()), u"sa"_s, u"pw"_s, u"SBO"_s);
    try {
        client.open(u"SELECT 1"_s, connString, 4);
        FAIL() << "nothing listens there";
    } catch (const Failure& failure) {
        EXPECT_FALSE(failure.description().isEmpty());
    }
}

}  // namespace
}  // namespace pelmar::test
