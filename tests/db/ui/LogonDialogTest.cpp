#include "common/SessionState.h"
#include "db/CompanyList.h"
#include "db/ui/LogonDialog.h"
#include "settings/SettingsStore.h"
#include "support/Engines.h"
#include "support/Fakes.h"
#include "support/Isolated.h"

#include <QComboBox>
#include <QLabel>
#include <QLineEdit>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class LogonDialogTest : public Isolated, public ::testing::WithParamInterface<EngineFactory> {
protected:
    void SetUp() override
    {
        Isolated::SetUp();
        engine = GetParam()();
        store = std::make_unique<SettingsStore>(configFolder());
        state.ConnServer = engine->server();
        state.ConnUID = engine->user();
        state.ConnPWD = engine->password();
        state.ConnDataBase = u"typed by hand"_s;
        dialog = std::make_unique<LogonDialog>(Services{messages, browser, files, *store, engine->client()}, state);
    }

    std::unique_ptr<Engine> engine;
    FakeMessages messages;
    FakeBrowser browser;
    FakeFileDialogs files;
    std::unique_ptr<SettingsStore> store;
    SessionState state;
    std::unique_ptr<LogonDialog> dialog;
};

TEST_P(LogonDialogTest, TheCompanyListIsAscendingAndKeepsTheTypedName)
{
    engine->createCommon({{u"SBO_Zeta"_s, u"Z"_s}, {u"SBO_Alpha"_s, u"A"_s}, {u"SBO_Mid"_s, u"M"_s}});
    dialog->cmdRefresh_Click();
    ASSERT_EQ(dialog->cmbDataBase->count(), 3);
    EXPECT_EQ(dialog->cmbDataBase->itemText(0), u"SBO_Alpha"_s);
    EXPECT_EQ(dialog->cmbDataBase->itemText(2), u"SBO_Zeta"_s);
    EXPECT_EQ(dialog->cmbDataBase->currentIndex(), 0);
    EXPECT_EQ(dialog->txtConnDatabase->text(), u"typed by hand"_s);
    dialog->cmbDataBase_Click(1);
    EXPECT_EQ(dialog->txtConnDatabase->text(), u"SBO_Mid"_s);
    EXPECT_TRUE(messages.boxes.isEmpty());
}

TEST_P(LogonDialogTest, AServerWithoutTheCommonDatabaseIsReported)
{
    dialog->txtConnUID->setText(u"nobody"_s);
    dialog->txtConnServer->setText(engine->server() + u"-missing"_s);
    dialog->cmdRefresh_Click();
    EXPECT_EQ(dialog->cmbDataBase->count(), 0);
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_EQ(messages.boxes[0].title, u"תקלה"_s);
}

TEST_P(LogonDialogTest, TheCheckTriesEachNameInOrderAndStopsAtTheFirstFailure)
{
    engine->createDatabase(u"good1"_s, {u"CREATE TABLE OCRD (CardCode VARCHAR(15))"_s});
    engine->createDatabase(u"good2"_s, {u"CREATE TABLE OCRD (CardCode VARCHAR(15))"_s});
    dialog->txtConnDatabase->setText(u" good1;good2 "_s);
    dialog->CmdCheck_Click();
    EXPECT_EQ(dialog->LblMsg->text(), u"הבדיקה הסתיימה בהצלחה"_s);
    EXPECT_TRUE(messages.boxes.isEmpty());

    dialog->txtConnDatabase->setText(u"missing1;good1;missing2"_s);
    dialog->CmdCheck_Click();
    EXPECT_EQ(dialog->LblMsg->text(), u"הבדיקה לא הסתיימה בהצלחה"_s);
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_EQ(messages.boxes[0].kind, u"critical"_s);
    EXPECT_TRUE(messages.boxes[0].text.contains(u"missing1"_s)) << messages.boxes[0];
}

TEST_P(LogonDialogTest, OkStoresTheBoxesAsTheyAreAndCancelStoresNothing)
{
    dialog->txtConnServer->setText(u"srv2"_s);
    dialog->txtConnPWD->setText(u"plain; text"_s);
    dialog->cmdCancel_Click();
    EXPECT_EQ(state.ConnServer, engine->server());
    EXPECT_FALSE(store->contains(u"Pelmar"_s, u"Params"_s, u"ConnServer"_s));

    dialog->cmdOK_Click();
    EXPECT_EQ(state.ConnServer, u"srv2"_s);
    EXPECT_EQ(state.ConnPWD, u"plain; text"_s);
    EXPECT_EQ(store->value(u"Pelmar"_s, u"Params"_s, u"ConnPWD"_s, {}), u"plain; text"_s);
    EXPECT_EQ(store->value(u"Pelmar"_s, u"Params"_s, u"ConnDataBase"_s, {}), u"typed by hand"_s);
}

INSTANTIATE_TEST_SUITE_P(Engines, LogonDialogTest, ::testing::Values(&makeSqliteEngine, &makePostgresEngine),
                         engineName);

}  // namespace
}  // namespace pelmar::test
