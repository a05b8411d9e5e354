#include "db/ConnString.h"
#include "db/ConnectionTarget.h"
#include "db/OdbcDrivers.h"
#include "support/FailureOf.h"
#include "support/QtPrinting.h"

#include <gtest/gtest.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

struct ConnCase {
    QString uid;
    QVariant pwd;
    QString database;
    short kind;
    QString expected;
};

TEST(BuildConnString, PicksTheKindFromUserAndDatabase)
{
    const QString longName = u"."_s + QString(40, u'd');
    const ConnCase cases[] = {
        {u"sa"_s, u"pw"_s, u"SBODemo"_s, 2,
         u"Provider=sqloledb;Data Source=srv;User Id=sa;Password=pw;Initial Catalog=SBODemo"_s},
        {u""_s, u"pw"_s, u"SBODemo"_s, 3,
         u"Provider=sqloledb;Data Source=srv;Integrated Security=SSPI;Persist Security Info=False;Initial Catalog=SBODemo"_s},
        {u"sa"_s, u"pw"_s, u".SBODemo"_s, 4, u"Provider=SQLNCLI;Server=srv;UID=sa;PWD=pw;Database=SBODemo"_s},
        {u""_s, u"pw"_s, u".SBODemo"_s, 5, u"Provider=SQLNCLI;Server=srv;Trusted_Connection=yes;Database=SBODemo"_s},
        {u"sa"_s, u"pw"_s, u""_s, 6, u"DSN=srv;Uid=sa;Pwd=pw"_s},
        {u"sa"_s, u"pw"_s, u"."_s, 6, u"DSN=srv;Uid=sa;Pwd=pw"_s},
        {u""_s, u"pw"_s, u""_s, 6, u"DSN=srv;Uid=;Pwd=pw"_s},
        {u"sa"_s, u"pw"_s, longName, 4, u"Provider=SQLNCLI;Server=srv;UID=sa;PWD=pw;Database="_s + QString(30, u'd')},
        {u"sa"_s, QVariant(), u"SBODemo"_s, 2,
         u"Provider=sqloledb;Data Source=srv;User Id=sa;Password=;Initial Catalog=SBODemo"_s},
        {u"sa"_s, QVariant(), u""_s, 6, u"DSN=srv;Uid=sa;Pwd="_s},
    };
    for (const ConnCase& c : cases) {
        QVariant pwd = c.pwd;
        short kind = 2;
        const QString database = c.database;
        EXPECT_EQ(BuildConnString(u"srv"_s, c.uid, pwd, database, kind), c.expected) << c.database.toStdString();
        EXPECT_EQ(kind, c.kind) << c.expected.toStdString();
        EXPECT_FALSE(pwd.isNull()) << "a null password becomes empty in the caller's variable too";
        EXPECT_EQ(database, c.database);
    }
}

TEST(BuildConnString, AKindOutsideTheTableGivesNothing)
{
    QVariant pwd = u"pw"_s;
    short kind = 9;
    EXPECT_EQ(BuildConnString(u"srv"_s, u"sa"_s, pwd, u"db"_s, kind), QString());
}

struct TargetCase {
    QString connString;
    QString driver;
    QString odbc;
};

TEST(ConnectionTarget, EveryKindBecomesAnOdbcStringThatQuotesWhatNeedsIt)
{
    const QString pg = u"PostgreSQL Unicode"_s;
    const TargetCase cases[] = {
        {BuildConnString(u"127.0.0.1,5433"_s, u"sa"_s, u"p;w}d=1"_s, u"SBO"_s), pg,
         u"DRIVER={PostgreSQL Unicode};SERVER=127.0.0.1;PORT=5433;DATABASE=SBO;UID=sa;PWD={p;w}}d=1};"
         "UseDeclareFetch=1;Fetch=1000"_s},
        {BuildConnString(u"db.local"_s, u"sa"_s, u"x;Initial Catalog=y"_s, u"SBO"_s), u"FreeTDS"_s,
         u"DRIVER={FreeTDS};SERVER=db.local;DATABASE=SBO;UID=sa;PWD={x;Initial Catalog=y};TDS_Version=7.4;"
         "ClientCharset=UTF-8"_s},
        {BuildConnString(u"db,1433"_s, u""_s, u""_s, u"SBO"_s), u"ODBC Driver 18 for SQL Server"_s,
         u"DRIVER={ODBC Driver 18 for SQL Server};SERVER=db,1433;DATABASE=SBO;Trusted_Connection=yes"_s},
        {BuildConnString(u"db"_s, u""_s, u"pw"_s, u".SBO"_s), u"ODBC Driver 18 for SQL Server"_s,
         u"DRIVER={ODBC Driver 18 for SQL Server};SERVER=db;DATABASE=SBO;Trusted_Connection=yes"_s},
        {BuildConnString(u"db\\SQL2019"_s, u"sa"_s, u"pw"_s, u".SBO"_s), u"ODBC Driver 17 for SQL Server"_s,
         u"DRIVER={ODBC Driver 17 for SQL Server};SERVER=db\\SQL2019;DATABASE=SBO;UID=sa;PWD=pw"_s},
        {BuildConnString(u"MyDsn"_s, u"u=1"_s, u"pw"_s, u""_s), pg, u"DSN=MyDsn;UID={u=1};PWD=pw"_s},
        {BuildConnString(u"db"_s, u"sa"_s, u" pw "_s, u"SBO"_s), u"FreeTDS"_s,
         u"DRIVER={FreeTDS};SERVER=db;DATABASE=SBO;UID=sa;PWD={ pw };TDS_Version=7.4;ClientCharset=UTF-8"_s},
        {BuildConnString(u"db"_s, u"sa"_s, u"{pw"_s, u"SBO"_s), u"FreeTDS"_s,
         u"DRIVER={FreeTDS};SERVER=db;DATABASE=SBO;UID=sa;PWD={{pw};TDS_Version=7.4;ClientCharset=UTF-8"_s},
    };
    for (const TargetCase& c : cases)
        EXPECT_EQ(ConnectionTarget::parse(c.connString).odbcString(c.driver), c.odbc) << c.connString.toStdString();
}

TEST(SqlServerDriver, TheEnvironmentThenTheSettingThenMicrosoftsNewestThenFreeTds)
{
    const QString ms18 = u"ODBC Driver 18 for SQL Server"_s;
    const QString ms17 = u"ODBC Driver 17 for SQL Server"_s;
    qunsetenv("PELMAR_SQLSERVER_DRIVER");
    EXPECT_EQ(chooseSqlServerDriver({}, {u"PostgreSQL Unicode"_s}), u"FreeTDS"_s);
    EXPECT_EQ(chooseSqlServerDriver({}, {ms17, u"FreeTDS"_s}), ms17);
    EXPECT_EQ(chooseSqlServerDriver({}, {ms17, ms18}), ms18);
    EXPECT_EQ(chooseSqlServerDriver(u"Mine"_s, {ms18}), u"Mine"_s);
    qputenv("PELMAR_SQLSERVER_DRIVER", "From the environment");
    EXPECT_EQ(chooseSqlServerDriver(u"Mine"_s, {ms18}), u"From the environment"_s);
    qunsetenv("PELMAR_SQLSERVER_DRIVER");
}

TEST(ConnectionTarget, ASqliteServerNamesTheEmbeddedFolder)
{
    const auto target = ConnectionTarget::parse(BuildConnString(u"sqlite:/data/co"_s, u"sa"_s, u""_s, u"demo"_s));
    EXPECT_EQ(target.kind, ConnectionTarget::Kind::Embedded);
    EXPECT_EQ(target.embeddedFile(), u"/data/co/demo.sqlite"_s);
}

TEST(ConnectionTarget, AStringOfNoKnownKindIsRefused)
{
    for (const QString& text : {QString(), u"Server=x;Database=y"_s, u"Provider=sqloledb;Data Source=x"_s})
        EXPECT_EQ(failureOf([&] { ConnectionTarget::parse(text); }),
                  u"The connection string is not of a kind this program can open."_s)
            << text.toStdString();
}

}  // namespace
}  // namespace pelmar::test
