#include "log/RunLog.h"
#include "outputs/Initialisation.h"
#include "selection/SelectBuilder.h"
#include "support/Engines.h"
#include "support/FailureOf.h"
#include "support/OutputRun.h"
#include "support/PgCluster.h"

#include <QElapsedTimer>
#include <QFile>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class Initialisation : public OutputRunTest {
protected:
    void pointAt(const QString& server, const QString& company)
    {
        for (const auto& [key, value] : {std::pair{u"ConnServer"_s, server}, std::pair{u"ConnUID"_s, engine->user()},
                                         std::pair{u"ConnDataBase"_s, company}})
            store->setValue(u"Pelmar"_s, u"Params"_s, key, value);
    }

    void initialise() { initialiseSession(*store, engine->client(), state, options); }

    std::unique_ptr<Engine> engine = makeSqliteEngine();
};

TEST_F(Initialisation, AConfiguredCompanyFillsTheSalesEmployeesBeforeTheStoredChoiceIsLoaded)
{
    engine->createCompany(u"SBO_Test"_s, CompanyOptions{});
    pointAt(engine->server(), u"SBO_Test"_s);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"Agent"_s, u"5"_s);
    initialise();
    const QList<SalesEmployee> employees
        = {{u"-ללא איש מכירות-"_s, -1}, {u"דנה לוי"_s, 1},     {u"יוסי כהן"_s, 2},
           {u"Mark Smith"_s, 3},        {u"רונית אברהם"_s, 5}, {u"O'Neil & <Partners>"_s, 7}};
    EXPECT_EQ(options.agents, employees) << "names trimmed, the nameless left out";
    EXPECT_EQ(options.agentIndex, 5);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"Agent"_s, u"6"_s);
    initialise();
    EXPECT_EQ(options.agentIndex, -1) << "one past the refilled list: no employee is chosen";
    options.agent = true;
    EXPECT_EQ(failureOf([&] { recipientStatement(options, state, 2, true, true); }),
              u"נבחר סינון לפי סוכן, אך לא נבחר סוכן מהרשימה. יש לבחור סוכן או לבטל את הסינון."_s);

    pointAt(engine->server(), u"NoSuchCompany"_s);
    initialise();
    EXPECT_TRUE(options.agents.isEmpty()) << "the employees of a company that cannot be opened are none";
    EXPECT_EQ(options.agentIndex, -1);
}

TEST_F(Initialisation, TheUnconfiguredDatabaseIsNeverTried)
{
    engine->createCompany(u"tarvel02"_s, CompanyOptions{});
    pointAt(engine->server(), u"tarvel02"_s);
    initialise();
    EXPECT_TRUE(options.agents.isEmpty());
    EXPECT_EQ(options.agentIndex, -1);
}

TEST_F(Initialisation, AServerThatNeverAnswersIsGivenUpWithinTheStartUpTimeout)
{
    SilentServer silent;
    pointAt(u"127.0.0.1,%1"_s.arg(silent.port()), u"SBO"_s);
    const DatabaseClient client(QLatin1String(PgCluster::kDriver));
    QElapsedTimer timer;
    timer.start();
    initialiseSession(*store, client, state, options);
    EXPECT_LT(timer.elapsed(), 4900);
    EXPECT_TRUE(options.agents.isEmpty());
    EXPECT_EQ(options.rows, u"8"_s) << "the options are loaded all the same";
}

TEST_F(Initialisation, TheSessionStartsAfreshFromTheStore)
{
    WriteLog(u"SELECT 1"_s, u"t"_s);
    store->setValue(u"Pelmar"_s, u"LabelDef4"_s, u"FontSize"_s, u"14"_s);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"Rows"_s, u"10"_s);
    state.CardListSQL = u"SELECT 1"_s;
    state.SelCardGroups = {CardGroupSel{}, CardGroupSel{100, true}};
    options.rows = u"3"_s;
    initialise();
    EXPECT_FALSE(QFile::exists(runLogPath()));
    EXPECT_EQ(state.LabelDefs[4].FontSize, 14);
    EXPECT_EQ(options.rows, u"10"_s);
    EXPECT_TRUE(state.CardListSQL.isEmpty());
    EXPECT_EQ(state.SelCardGroups.size(), 1);
    EXPECT_EQ(state.ConnServer, u"server"_s);
    EXPECT_EQ(state.ConnDataBase, u"tarvel02"_s);
}

}  // namespace
}  // namespace pelmar::test
