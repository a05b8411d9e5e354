#include "outputs/LabelFixture.h"

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class SmsListTest : public LabelCompanyTest {
protected:
    QByteArray numbers()
    {
        const QString path = tempPath(u"sms.txt"_s);
        EXPECT_TRUE(card->CreateSMSFile(path));
        return readFile(path);
    }
};

TEST_F(SmsListTest, ContactMobileFirstNumbersAsStoredAndRecipientsWithoutOneLeftOut)
{
    EXPECT_EQ(numbers(), QByteArray("052-999\r\n050-222\r\n054 777\r\n"));
    c().ChkSelectAccount->setChecked(true);
    state.WantedCrd = {u"C5"_s};
    EXPECT_EQ(numbers(), QByteArray("054 777\r\n"));
}

TEST_F(SmsListTest, TheCardMobileStandsWhenTheContactsIsEmptyAndNoRowsLeaveAnEmptyFile)
{
    c().ChkAccKey->setChecked(true);
    c().TxtFromCrd->setText(u"C2"_s);
    c().TxtToCrd->setText(u"C2"_s);
    EXPECT_EQ(numbers(), QByteArray("050-222\r\n"));
    c().TxtFromCrd->setText(u"Z"_s);
    c().TxtToCrd->setText(u"Z"_s);
    EXPECT_EQ(numbers(), QByteArray());
}

TEST_F(SmsListTest, TheRunAsksForTheFileReplacesItAndSaysTheListIsReady)
{
    const QString path = tempPath(u"mine.txt"_s);
    writeFile(path, "old content that is longer than the list\r\n");
    files.answers = {path};
    c().cmbOutType->setCurrentIndex(3);
    card->CmdLabPrev_Click();
    ASSERT_EQ(files.calls.size(), 1);
    EXPECT_EQ(files.calls[0].filter, u"Text Files (*.txt)|*.txt|All Files (*.*)|*.*"_s);
    EXPECT_EQ(files.calls[0].filterIndex, 1);
    EXPECT_EQ(files.calls[0].defaultName, u"smslist"_s);
    EXPECT_EQ(readFile(path), QByteArray("052-999\r\n050-222\r\n054 777\r\n"));
    ASSERT_EQ(messages.boxes.size(), 2);
    EXPECT_EQ(messages.boxes[1], (FakeMessages::Box{u"information"_s, u"הודעה"_s, u"קובץ רשימת הטלפונים הניידים מוכן"_s}));
}

TEST_F(SmsListTest, ACancelledDialogIsReportedAndWritesNothing)
{
    c().cmbOutType->setCurrentIndex(3);
    card->CmdLabPrev_Click();
    ASSERT_EQ(messages.boxes.size(), 2);
    EXPECT_EQ(messages.boxes[1].kind, u"critical"_s);
    EXPECT_EQ(messages.boxes[1].title, u"תקלה"_s);
}

TEST_F(SmsListTest, AnUnreadableCompanyWritesNothingAndSaysNothingIsReady)
{
    state.ConnDataBase = u"missing"_s;
    const QString path = tempPath(u"mine.txt"_s);
    writeFile(path, "kept");
    files.answers = {path};
    c().cmbOutType->setCurrentIndex(3);
    card->CmdLabPrev_Click();
    EXPECT_EQ(readFile(path), QByteArray("kept"));
    ASSERT_EQ(messages.boxes.size(), 2);
    EXPECT_EQ(messages.boxes[1].kind, u"critical"_s) << "the schema level's own message, and no 'ready'";
}

}  // namespace
}  // namespace pelmar::test
