#include "common/Console.h"
#include "support/Fakes.h"
#include "support/QtPrinting.h"

#include <QTemporaryFile>

#include <gtest/gtest.h>

#include <cstdio>
#include <functional>
#include <poll.h>
#include <pty.h>
#include <unistd.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

// What the work writes to a standard stream (1 or 2), read back from a file or, when asked, from
// a terminal standing in for the stream.
QByteArray written(int stream, const std::function<void()>& work, bool terminal = false)
{
    std::fflush(nullptr);
    const int saved = ::dup(stream);
    int reader = -1;
    QTemporaryFile file;
    if (terminal) {
        int writer = -1;
        ::openpty(&reader, &writer, nullptr, nullptr, nullptr);
        ::dup2(writer, stream);
        ::close(writer);
    } else {
        file.open();
        ::dup2(file.handle(), stream);
    }
    work();
    std::fflush(nullptr);
    ::dup2(saved, stream);
    ::close(saved);
    if (!terminal)
        return file.seek(0) ? file.readAll() : QByteArray();
    QByteArray bytes;
    pollfd ready{reader, POLLIN, 0};
    char buffer[512];
    while (::poll(&ready, 1, 200) > 0) {
        const ssize_t size = ::read(reader, buffer, sizeof buffer);
        if (size <= 0)
            break;
        bytes.append(buffer, size);
    }
    ::close(reader);
    return bytes;
}

TEST(Console, MessagesGoToStandardErrorWithTheirTitlesAndACriticalOneFailsTheCommand)
{
    ConsoleMessages messages(true);
    EXPECT_EQ(written(2,
                      [&] {
                          EXPECT_TRUE(messages.question(u"שאלה חשובה"_s, u"להתחיל?"_s)) << "--yes answers yes";
                          messages.information(u"הודעה"_s, u"מוכן"_s);
                          messages.plain(u"שורה"_s);
                      }),
              QByteArray("הודעה: מוכן\nשורה\n"));
    EXPECT_FALSE(messages.failed());
    written(2, [&] { messages.critical(u"תקלה"_s, u"x"_s); });
    EXPECT_TRUE(messages.failed());
}

TEST(Console, OnlyAnAnswerThatSaysYesIsYes)
{
    for (const QString& yes : {u"y"_s, u"Y"_s, u" yes \n"_s, u"YES"_s, u"כ"_s, u"כן"_s})
        EXPECT_TRUE(isYesAnswer(yes)) << yes.toStdString();
    for (const QString& no : {u""_s, u"n"_s, u"no"_s, u"yess"_s, u"y y"_s, u"לא"_s})
        EXPECT_FALSE(isYesAnswer(no)) << no.toStdString();
}

TEST(Console, TheBrowserPrintsThePathAndOpensTheFileOnlyWhenAsked)
{
    FakeBrowser real;
    EXPECT_EQ(written(1, [&] { ConsoleBrowser(real, false).open(u"/tmp/a.htm"_s); }), QByteArray("/tmp/a.htm\n"));
    EXPECT_TRUE(real.opened.isEmpty());
    written(1, [&] { ConsoleBrowser(real, true).open(u"/tmp/a.htm"_s); });
    EXPECT_EQ(real.opened, QStringList{u"/tmp/a.htm"_s});
}

TEST(Console, TheProgressLineIsRewrittenInPlaceOnATerminalAndNotWrittenElsewhere)
{
    EXPECT_EQ(written(2,
                      [] {
                          ConsoleProgress progress;
                          progress.report(u"שולח"_s, 0.5);
                          progress.report({}, 0);
                      }),
              QByteArray());
    const QByteArray line = written(
        2,
        [] {
            ConsoleProgress progress;
            progress.report(u"שולח 1"_s, 0.25);
            progress.report(u"שולח 2"_s, 0.5);
            progress.report({}, 0);
        },
        true);
    EXPECT_EQ(line, QByteArray("\rשולח 1  25%\x1b[K\rשולח 2  50%\x1b[K\r\n"));
}

}  // namespace
}  // namespace pelmar::test
