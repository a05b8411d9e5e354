#include "support/CompanyRows.h"
#include "support/Engines.h"
#include "support/SmtpSink.h"
#include "support/ui/WindowFixture.h"

#include <QComboBox>
#include <QLineEdit>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

using Box = FakeMessages::Box;

// The e-mail run started from the window, against two cards on the embedded engine.
class EmailRun : public MainCardTest {
protected:
    void SetUp() override
    {
        MainCardTest::SetUp();
        const auto mailCard = [](const QString& code, const QString& mail) {
            return insertRow(
                u"OCRD"_s,
                {{u"CardCode"_s, code}, {u"CardName"_s, code}, {u"CardType"_s, u"C"_s}, {u"E_Mail"_s, mail}});
        };
        engine->createDatabase(
            u"mail"_s,
            handMadeCompany(900000,
                            {mailCard(u"E1"_s, u"e1@example.test"_s), mailCard(u"E2"_s, u"e2@example.test"_s)}));
        for (const auto& [key, value] :
             {std::pair{u"ConnServer"_s, engine->server()}, std::pair{u"ConnUID"_s, engine->user()},
              std::pair{u"ConnDataBase"_s, u"mail"_s}})
            store->setValue(u"Pelmar"_s, u"Params"_s, key, value);
        card = makeCard();
        card->UserControl_Initialize();
        control<QComboBox>(u"cmbOutType"_s)->setCurrentIndex(2);
    }

    void type(const QString& name, const QString& text) { control<QLineEdit>(name)->setText(text); }

    std::unique_ptr<Engine> engine = makeSqliteEngine();
};

TEST_F(EmailRun, TheRunButtonSendsThroughTheServerOfThePageAndSaysHowItWent)
{
    SmtpSink sink;
    type(u"txtSmtpServer"_s, u"127.0.0.1"_s);
    type(u"txtSmtpPort"_s, QString::number(sink.port()));
    type(u"txtEmailHTMLBody"_s, {});
    type(u"txtEmailAttachFile"_s, {});
    card->CmdLabPrev_Click();
    ASSERT_EQ(sink.messages().size(), 2);
    EXPECT_EQ(messages.boxes.last(),
              (Box{u"information"_s, u"הודעה"_s,
                   u"הדיוור האלקטרוני הסתיים\nנשלחו 2 הודעות; 0 נמענים לא קיבלו את ההודעה."_s}));
}

TEST_F(EmailRun, AMissingOptionIsAnErrorAndTheFinishMessageStillFollows)
{
    card->CmdLabPrev_Click();
    ASSERT_EQ(messages.boxes.size(), 3);
    EXPECT_EQ(messages.boxes[1], (Box{u"critical"_s, u"שגיאה"_s, u"הקובץ המצורף אינו נמצא"_s}));
    EXPECT_EQ(messages.boxes[2], (Box{u"information"_s, u"הודעה"_s, u"הדיוור האלקטרוני הסתיים"_s}));
}

TEST_F(EmailRun, TheServerOptionsAreStoredWithTheOthers)
{
    type(u"txtSmtpServer"_s, u"mail.pelmar.test"_s);
    type(u"txtSmtpPassword"_s, u"secret"_s);
    control<QComboBox>(u"cmbSmtpSecurity"_s)->setCurrentIndex(2);
    EXPECT_EQ(control<QLineEdit>(u"txtSmtpPassword"_s)->echoMode(), QLineEdit::Password);
    card->CmdDef_Click();
    EXPECT_EQ(store->value(u"Pelmar"_s, u"Params"_s, u"SmtpServer"_s, {}), u"mail.pelmar.test"_s);
    EXPECT_EQ(store->value(u"Pelmar"_s, u"Params"_s, u"SmtpSecurity"_s, {}), u"2"_s);
    EXPECT_EQ(store->value(u"Pelmar"_s, u"Params"_s, u"SmtpPassword"_s, {}), u"secret"_s);
}

}  // namespace
}  // namespace pelmar::test
