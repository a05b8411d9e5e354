#include "cli/Program.h"
#include "outputs/Initialisation.h"
#include "outputs/Output.h"
#include "outputs/Runs.h"
#include "selection/SelectBuilder.h"
#include "settings/SettingsStore.h"
#include "support/LabelCompany.h"
#include "support/SmtpSink.h"

#include <QFile>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

using Result = ProgramResult;

// The program against the hand-made company, with this test's settings and temporary folder.
class CommandLineTest : public LabelCompanyTest {
protected:
    void SetUp() override
    {
        LabelCompanyTest::SetUp();
        for (const auto& [key, value] :
             {std::pair{u"ConnServer"_s, engine->server()}, std::pair{u"ConnUID"_s, engine->user()},
              std::pair{u"ConnPWD"_s, QString()}, std::pair{u"ConnDataBase"_s, u"labels"_s}})
            store->setValue(u"Pelmar"_s, u"Params"_s, key, value);
        store->setValue(u"Pelmar"_s, u"Params"_s, u"Rows"_s, u"3"_s);
        store->setValue(u"Pelmar"_s, u"Params"_s, u"UseTitle2"_s, u"1"_s);
        store->setValue(u"Pelmar"_s, u"Params"_s, u"UseTitle5"_s, u"1"_s);
        initialiseSession(*store, engine->client(), state, options);
    }

    Result pelmar(const QStringList& arguments) { return runProgram(folder(), arguments); }

    QString setting(const QString& key)
    {
        return SettingsStore(configFolder()).value(u"Pelmar"_s, u"Params"_s, key, u"<none>"_s);
    }
};

TEST_F(CommandLineTest, EveryOutputOfTheTableRunsWithoutAWindowOrAGuiPlatform)
{
    for (const Output* output : outputTable()) {
        if (output->name().isEmpty() || output->name() == u"email"_s)  // writes no file; see below
            continue;
        QStringList arguments = {output->name(), u"-o"_s, path(u"out"_s)};
        if (output->commandLine().argument == CommandLineUse::Argument::CardCode)
            arguments << u"C1"_s;
        const Result result = pelmar(arguments);
        EXPECT_EQ(result.exit, 0) << output->name().toStdString() << ": " << result.err.toStdString();
        EXPECT_FALSE(readFile(path(u"out"_s)).isEmpty()) << output->name().toStdString();
        if (output->name() == u"sms"_s) {
            EXPECT_EQ(result.err, u"הודעה: קובץ רשימת הטלפונים הניידים מוכן\n"_s);
            EXPECT_EQ(readFile(path(u"out"_s)), QByteArray("052-999\r\n050-222\r\n054 777\r\n"));
        } else {
            EXPECT_EQ(result.out, path(u"out"_s) + u'\n') << "the file the window would show";
        }
        QFile::remove(path(u"out"_s));
    }
}

TEST_F(CommandLineTest, EmailSendsTheCampaignThroughTheServerOfTheOptionsAndSaysHowItWent)
{
    SmtpSink sink;
    const QStringList arguments = {u"email"_s,
                                   u"--set"_s,
                                   u"txtSmtpServer=127.0.0.1"_s,
                                   u"--set"_s,
                                   u"txtSmtpPort=%1"_s.arg(sink.port()),
                                   u"--set"_s,
                                   u"txtEmailHTMLBody="_s,
                                   u"--set"_s,
                                   u"txtEmailAttachFile="_s,
                                   u"--set"_s,
                                   u"OptEmailMethod_2=True"_s,
                                   u"--set"_s,
                                   u"txtEmailGroupSize=5"_s};
    const Result result = pelmar(arguments);
    EXPECT_EQ(result.exit, 0) << result.err.toStdString();
    EXPECT_EQ(result.err, u"הודעה: הדיוור האלקטרוני הסתיים\nנשלחו 1 הודעות; 0 נמענים לא קיבלו את ההודעה.\n"_s);
    ASSERT_EQ(sink.messages().size(), 1);
    EXPECT_EQ(sink.messages()[0].recipients,
              (QStringList{u"lakohot@pelmar.co.il"_s, u"info@c1.co.il"_s, u"abc@smith.com"_s}));

    const Result refused = pelmar({u"email"_s, u"--set"_s, u"txtEmailAttachFile="_s, u"--set"_s, u"txtEmailHTMLBody="_s,
                                   u"--set"_s, u"txtEmailSubject="_s});
    EXPECT_EQ(refused.exit, 1);
    EXPECT_EQ(refused.err, u"שגיאה: חובה לציין נושא להודעה\nהודעה: הדיוור האלקטרוני הסתיים\n"_s);
}

TEST_F(CommandLineTest, SqlPrintsTheStatementOfTheChosenOrTheRequestedKind)
{
    const Result chosen = pelmar({u"sql"_s, u"--set"_s, u"cmbOutType=3"_s, u"--no-order"_s});
    state.SboVersionLevel = 1;
    EXPECT_EQ(chosen.out, recipientStatement(options, state, kMobiles, false, false) + u'\n');
    const Result requested
        = pelmar({u"sql"_s, u"--set"_s, u"cmbOutType=-1"_s, u"--kind"_s, u"1"_s, u"--all-details"_s});
    EXPECT_EQ(requested.out, recipientStatement(options, state, kCardList, true, true) + u'\n');
}

TEST_F(CommandLineTest, SetChangesEachKindOfControlAndSaveStoresIt)
{
    const QStringList sets
        = {u"--set"_s,        u"txtRows=12"_s, u"--set"_s,         u"cmbLabFormat=1"_s, u"--set"_s,
           u"ChkTitle_7=1"_s, u"--set"_s,      u"OptOLE_2=true"_s, u"--set"_s,          u"LblDept=1"_s};
    EXPECT_EQ(pelmar(QStringList{u"sql"_s} + sets).exit, 0);
    EXPECT_EQ(setting(u"Rows"_s), u"3"_s) << "nothing is stored without --save";
    EXPECT_EQ(pelmar(QStringList{u"sql"_s, u"--save"_s} + sets).exit, 0);
    EXPECT_EQ(setting(u"Rows"_s), u"12"_s);
    EXPECT_EQ(setting(u"LabFormat"_s), u"1"_s);
    EXPECT_EQ(setting(u"UseTitle7"_s), u"1"_s);
    EXPECT_EQ(setting(u"OptOLE2"_s), u"True"_s);
    EXPECT_EQ(setting(u"OptOLE1"_s), u"False"_s);
    EXPECT_EQ(setting(u"DeptField"_s), u"1"_s);

    const std::pair<QString, QString> refusals[]
        = {{u"cmbLabFormat=2"_s, u"--set: cmbLabFormat cannot take \"2\""_s},
           {u"ChkTitle_7=yes"_s, u"--set: ChkTitle_7 cannot take \"yes\""_s},
           {u"NoSuchControl=1"_s, u"--set: there is no control \"NoSuchControl\" to set"_s}};
    for (const auto& [bad, message] : refusals) {
        const Result refused = pelmar({u"sql"_s, u"--set"_s, bad});
        EXPECT_EQ(refused.exit, 2) << bad.toStdString();
        EXPECT_TRUE(refused.err.startsWith(u"pelmar: "_s + message + u'\n')) << refused.err.toStdString();
    }
}

TEST_F(CommandLineTest, CardsGroupsAndPropertiesShapeTheRun)
{
    writeFile(path(u"cards.txt"_s),
              "\xEF\xBB\xBF"
              "C5\r\nC1\r\n");
    EXPECT_EQ(pelmar({u"sms"_s, u"-o"_s, path(u"n.txt"_s), u"--cards"_s, path(u"cards.txt"_s)}).exit, 0);
    EXPECT_EQ(readFile(path(u"n.txt"_s)), QByteArray("052-999\r\n054 777\r\n"));
    EXPECT_EQ(pelmar({u"sms"_s, u"-o"_s, path(u"n.txt"_s), u"--card"_s, u"C2"_s}).exit, 0);
    EXPECT_EQ(readFile(path(u"n.txt"_s)), QByteArray("050-222\r\n"));

    const QString sql
        = pelmar({u"sql"_s, u"--groups"_s, u"100,103"_s, u"--properties"_s, u"3,17"_s, u"--relation"_s, u"or"_s}).out;
    EXPECT_TRUE(sql.contains(u" AND OCRD.CardType = 'C' AND (GroupCode=100 OR GroupCode=103)"_s)) << sql.toStdString();
    EXPECT_TRUE(sql.contains(u" And (OCRD.QryGroup3='Y' OR OCRD.QryGroup17='Y')"_s));
}

TEST_F(CommandLineTest, FailuresAndUsageErrorsHaveTheirExitStatus)
{
    const Result rows = pelmar({u"labels"_s, u"--set"_s, u"txtRows=0"_s});
    EXPECT_EQ(rows.exit, 1);
    EXPECT_TRUE(rows.err.startsWith(u"תקלה: "_s)) << rows.err.toStdString();

    store->setValue(u"Pelmar"_s, u"Params"_s, u"ConnDataBase"_s, u"nosuchcompany"_s);
    const Result missing = pelmar({u"labels"_s});
    EXPECT_EQ(missing.exit, 1);
    EXPECT_TRUE(missing.err.contains(u"תקלה"_s));

    const Result absent = pelmar({u"labels"_s, u"--cards"_s, path(u"absent.txt"_s)});
    EXPECT_EQ(absent.exit, 2);
    EXPECT_TRUE(absent.err.startsWith(u"pelmar: --cards: cannot read %1"_s.arg(path(u"absent.txt"_s))))
        << absent.err.toStdString();
    const Result mistake = pelmar({u"labels"_s, u"--set"_s, u"=1"_s});
    EXPECT_EQ(mistake.exit, 2);
    EXPECT_EQ(mistake.err, u"pelmar: --set takes NAME=VALUE, not \"=1\"\nRun \"pelmar --help\" for the commands.\n"_s);
    const Result help = pelmar({u"--help"_s});
    EXPECT_EQ(help.exit, 0);
    EXPECT_TRUE(help.out.contains(u"pelmar labels"_s) || help.out.contains(u"labels [-o FILE]"_s));
    EXPECT_TRUE(pelmar({u"--version"_s}).out.startsWith(u"pelmar "_s));
}

TEST_F(CommandLineTest, DemoCreatesTheCompanyOnlyWhereNoOtherIsConfigured)
{
    const Result kept = pelmar({u"demo"_s});
    EXPECT_EQ(kept.exit, 0);
    EXPECT_TRUE(kept.out.contains(u"--force"_s));
    EXPECT_EQ(setting(u"ConnDataBase"_s), u"labels"_s);
    EXPECT_EQ(pelmar({u"demo"_s, u"--force"_s}).exit, 0);
    EXPECT_EQ(setting(u"ConnDataBase"_s), u"demo"_s);
    EXPECT_EQ(pelmar({u"labels"_s}).exit, 0);
}

}  // namespace
}  // namespace pelmar::test
