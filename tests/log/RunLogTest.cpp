#include "common/Windows1255.h"
#include "log/RunLog.h"
#include "support/Fakes.h"
#include "support/Isolated.h"

#include <QFile>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class RunLogTest : public Isolated {
protected:
    QString logText() const { return fromWindows1255(readFile(runLogPath())); }
};

const QDateTime kMorning(QDate(2026, 12, 5), QTime(14, 7));

TEST_F(RunLogTest, EntriesFollowOneAnotherWithTheirDateTitleAndText)
{
    WriteLog(u"SELECT 1"_s, u"רשימת מעקב"_s, kMorning);
    WriteLog(u"SELECT 2"_s, u"הפקת מדבקות"_s, kMorning.addSecs(60));
    EXPECT_EQ(logText(),
              u">>05-12-26+14:07<br>\r\nרשימת מעקב<br>\r\nSELECT 1<br>\r\n"
              ">>05-12-26+14:08<br>\r\nהפקת מדבקות<br>\r\nSELECT 2<br>\r\n"_s);
    EXPECT_TRUE(readFile(runLogPath()).contains("\xf8\xf9\xe9\xee\xfa")) << "the log is windows-1255";
}

TEST_F(RunLogTest, AnEntryWithoutTitleHasTwoLinesAndAnEmptyTextStillItsLine)
{
    WriteLog(QString(), QString(), kMorning);
    EXPECT_EQ(logText(), u">>05-12-26+14:07<br>\r\n<br>\r\n"_s);
}

TEST_F(RunLogTest, MarkupInAStatementIsEscapedSoTheViewShowsItAsRun)
{
    WriteLog(u"SELECT * FROM OCRD WHERE a < 5 AND b = N'A&B \"q\"'"_s, u"t"_s, kMorning);
    EXPECT_TRUE(logText().contains(u"SELECT * FROM OCRD WHERE a &lt; 5 AND b = N'A&amp;B \"q\"'<br>"_s));
}

TEST_F(RunLogTest, InitialisationEmptiesTheLogAndShowLogThenReportsItMissing)
{
    FakeBrowser browser;
    WriteLog(u"SELECT 1"_s, u"t"_s);
    EXPECT_TRUE(ShowLog(browser));
    ASSERT_EQ(browser.opened, QStringList{runLogViewPath()});
    EXPECT_EQ(readFile(runLogViewPath()), readFile(runLogPath()));

    InitLog();
    EXPECT_FALSE(ShowLog(browser));
    EXPECT_EQ(browser.opened.size(), 1);
}

}  // namespace
}  // namespace pelmar::test
