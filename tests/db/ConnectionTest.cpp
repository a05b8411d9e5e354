#include "common/Failure.h"
#include "common/SessionState.h"
#include "db/CompanyList.h"
#include "db/Connection.h"
#include "support/Engines.h"
#include "support/PgCluster.h"

#include <QElapsedTimer>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class ConnectionTest : public ::testing::TestWithParam<EngineFactory> {
protected:
    void SetUp() override { engine = GetParam()(); }

    short levelOf(const QStringList& statements)
    {
        engine->createDatabase(u"versiontest"_s, statements);
        return GetSboVersionLevel(engine->client(), engine->connString(u"versiontest"_s));
    }

    SessionState stateFor(const QString& database) const
    {
        SessionState state;
        state.ConnServer = engine->server();
        state.ConnUID = engine->user();
        state.ConnPWD = engine->password();
        state.ConnDataBase = database;
        return state;
    }

    // The description of the failure reading the level; empty when it was read.
    QString failureOf(const QStringList& statements)
    {
        try {
            levelOf(statements);
        } catch (const Failure& failure) {
            return failure.description();
        }
        return {};
    }

    std::unique_ptr<Engine> engine;
};

TEST_P(ConnectionTest, TheSchemaLevelFollowsTheVersionInThousands)
{
    const std::pair<int, short> cases[] = {{900045, 1}, {62001, 1}, {61999, 0}, {60100, 0}, {59000, 0}};
    for (const auto& [version, level] : cases) {
        EXPECT_EQ(levelOf({u"CREATE TABLE CINF (Version INTEGER)"_s, u"INSERT INTO CINF VALUES (%1)"_s.arg(version)}),
                  level)
            << version;
    }
    EXPECT_EQ(levelOf({u"CREATE TABLE CINF (Version DECIMAL(10,1))"_s, u"INSERT INTO CINF VALUES (930000.0)"_s}), 1)
        << "a version stored as a decimal number";
}

TEST_P(ConnectionTest, AnUnreadableVersionIsAFailureThatSaysWhy)
{
    EXPECT_TRUE(failureOf({u"CREATE TABLE OCRD (CardCode VARCHAR(15))"_s}).contains(u"cinf"_s, Qt::CaseInsensitive));
    for (const QString& version : {u"'nine'"_s, u"3000000000"_s, u"-3000000000"_s})
        EXPECT_EQ(
            failureOf({u"CREATE TABLE CINF (Version VARCHAR(12))"_s, u"INSERT INTO CINF VALUES (%1)"_s.arg(version)}),
            u"Type mismatch: the company database's version is not a number."_s)
            << version.toStdString();
}

TEST_P(ConnectionTest, TheStartUpTestOpensTheSavedCompanyOrAnotherNamedOne)
{
    engine->createDatabase(u"company1"_s, {u"CREATE TABLE OCRD (CardCode VARCHAR(15))"_s});
    const SessionState state = stateFor(u"company1"_s);
    EXPECT_TRUE(TestConnection(engine->client(), state, QString()));
    EXPECT_TRUE(TestConnection(engine->client(), stateFor(u"other"_s), u"company1"_s));
    EXPECT_FALSE(TestConnection(engine->client(), state, u"nosuchcompany"_s));
}

TEST(LogonCheck, AnEmptyDatabaseBoxIsOneEmptyNameAndSemicolonsKeepEmptyPieces)
{
    EXPECT_EQ(databasesToCheck(u"  "_s), QStringList{QString()});
    EXPECT_EQ(databasesToCheck(u"a;;b"_s), (QStringList{u"a"_s, QString(), u"b"_s}));
}

INSTANTIATE_TEST_SUITE_P(Engines, ConnectionTest, ::testing::Values(&makeSqliteEngine, &makePostgresEngine),
                         engineName);

TEST(StartUpTest, AServerThatNeverAnswersIsGivenUpAfterFourSeconds)
{
    SilentServer silent;
    SessionState state;
    state.ConnServer = u"127.0.0.1,%1"_s.arg(silent.port());
    state.ConnUID = u"sa"_s;
    state.ConnDataBase = u"SBO"_s;
    const DatabaseClient client(QLatin1String(PgCluster::kDriver));
    QElapsedTimer timer;
    timer.start();
    EXPECT_FALSE(TestConnection(client, state, QString()));
    EXPECT_GE(timer.elapsed(), 3500);
    EXPECT_LT(timer.elapsed(), 4900) << "four seconds, not five";
}

}  // namespace
}  // namespace pelmar::test
