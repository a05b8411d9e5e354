#include "common/Failure.h"
#include "outputs/Runs.h"
#include "support/LabelCompany.h"
#include "support/FailureOf.h"

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class SmsListTest : public LabelCompanyTest {
protected:
    QByteArray numbers()
    {
        const QString path = tempPath(u"sms.txt"_s);
        RunContext run = context();
        CreateSMSFile(path, run);
        return readFile(path);
    }
};

TEST_F(SmsListTest, ContactMobileFirstNumbersAsStoredAndRecipientsWithoutOneLeftOut)
{
    EXPECT_EQ(numbers(), QByteArray("052-999\r\n050-222\r\n054 777\r\n"));
    options.selectAccount = true;
    state.WantedCrd = {u"C5"_s};
    EXPECT_EQ(numbers(), QByteArray("054 777\r\n"));
}

TEST_F(SmsListTest, TheCardMobileStandsWhenTheContactsIsEmptyAndNoRowsLeaveAnEmptyFile)
{
    options.codeRange = true;
    options.fromCard = u"C2"_s;
    options.toCard = u"C2"_s;
    EXPECT_EQ(numbers(), QByteArray("050-222\r\n"));
    options.fromCard = u"Z"_s;
    options.toCard = u"Z"_s;
    EXPECT_EQ(numbers(), QByteArray());
}

TEST_F(SmsListTest, TheRunAsksForTheFileReplacesItAndSaysTheListIsReady)
{
    const QString path = tempPath(u"mine.txt"_s);
    writeFile(path, "old content that is longer than the list\r\n");
    files.answers = {path};
    run(u"sms"_s);
    ASSERT_EQ(files.calls.size(), 1);
    EXPECT_EQ(files.calls[0].filter, u"Text Files (*.txt)|*.txt|All Files (*.*)|*.*"_s);
    EXPECT_EQ(files.calls[0].filterIndex, 1);
    EXPECT_EQ(files.calls[0].defaultName, u"smslist"_s);
    EXPECT_EQ(readFile(path), QByteArray("052-999\r\n050-222\r\n054 777\r\n"));
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_EQ(messages.boxes[0],
              (FakeMessages::Box{u"information"_s, u"הודעה"_s, u"קובץ רשימת הטלפונים הניידים מוכן"_s}));
}

TEST_F(SmsListTest, ACancelledDialogIsReportedAndWritesNothing)
{
    EXPECT_EQ(failureOf([&] { run(u"sms"_s); }), u"בחירת הקובץ בוטלה; רשימת הטלפונים לא נכתבה."_s);
    EXPECT_TRUE(messages.boxes.isEmpty());
}

TEST_F(SmsListTest, AnUnreadableCompanyWritesNothingAndSaysNothingIsReady)
{
    state.ConnDataBase = u"missing"_s;
    const QString path = tempPath(u"mine.txt"_s);
    writeFile(path, "kept");
    files.answers = {path};
    EXPECT_TRUE(failureOf([&] { run(u"sms"_s); }).startsWith(u"Cannot open database \"missing\""_s));
    EXPECT_EQ(readFile(path), QByteArray("kept"));
    EXPECT_TRUE(messages.boxes.isEmpty()) << "no 'ready'";
}

}  // namespace
}  // namespace pelmar::test
