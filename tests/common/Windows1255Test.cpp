#include "common/DesktopBrowser.h"
#include "common/Failure.h"
#include "common/TextFileWriter.h"
#include "common/UserText.h"
#include "common/Windows1255.h"
#include "support/FailureOf.h"
#include "support/Isolated.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QThread>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

TEST(Windows1255, HebrewTakesOneByteAndOtherCharactersBecomeReferencesNeverQuestionMarks)
{
    EXPECT_EQ(toWindows1255(u"אבת"_s, true), QByteArray("\xe0\xe1\xfa"));
    EXPECT_EQ(toWindows1255(u"₪ € ?"_s, true), QByteArray("\xa4 \x80 ?"));
    EXPECT_EQ(toWindows1255(u"日本"_s, true), QByteArray("&#26085;&#26412;"));
    EXPECT_EQ(toWindows1255(u"😀"_s, true), QByteArray("&#128512;")) << "a surrogate pair is one character";
    EXPECT_EQ(toWindows1255(u"日"_s, false), QByteArray("?"));
    EXPECT_EQ(toWindows1255(u"😀"_s, false), QByteArray("?"));
    EXPECT_EQ(fromWindows1255("\xf9\xec\xe5\xed"), u"שלום"_s);
}

TEST(Windows1255, TheEdgesOfTheCodePage)
{
    EXPECT_EQ(windows1255Byte(0x7F), 0x7F) << "the last ASCII character is itself";
    EXPECT_EQ(windows1255Byte(0x80), 0) << "U+0080 has no byte: 0x80 is the euro sign";
    EXPECT_EQ(windows1255Byte(0x20AC), 0x80);
    EXPECT_EQ(windows1255Byte(0x05D0), 0xE0) << "alef";
    EXPECT_EQ(windows1255Byte(0x05EA), 0xFA) << "tav";
    EXPECT_EQ(windows1255Byte(0x05EB), 0) << "one past tav";
    EXPECT_EQ(toWindows1255(u"\u0080"_s, true), QByteArray("&#128;"));
    EXPECT_EQ(toWindows1255(QString(QChar(0xD83D)), true), QByteArray("&#55357;")) << "a lone half of a pair";
    EXPECT_EQ(toWindows1255(u"\uFFFD"_s, true), QByteArray("&#65533;")) << "the bytes the code page leaves undefined";
}

TEST(UserText, Utf8WithOrWithoutItsMarkElseWindows1255)
{
    EXPECT_EQ(decodeUserText("\xEF\xBB\xBF\xD7\x90"), u"א"_s) << "the mark is not part of the text";
    EXPECT_EQ(decodeUserText("\xD7\x90"), u"א"_s);
    EXPECT_EQ(decodeUserText("\xE0"), u"א"_s) << "not UTF-8";
}

TEST(DesktopBrowser, TheCommandOfTheEnvironmentGetsThePathOrItsFailureIsNamed)
{
    QTemporaryDir folder;
    const QString copy = folder.filePath(u"copy"_s);
    const QString page = folder.filePath(u"page.htm"_s);
    writeFile(page, "<p>");
    const QString browser = folder.filePath(u"browser"_s);
    writeFile(browser, "#!/bin/sh\ncp \"$2\" \"" + copy.toUtf8() + "\"\n");
    QFile::setPermissions(browser, QFileDevice::ReadOwner | QFileDevice::ExeOwner);
    qputenv("PELMAR_BROWSER", browser.toUtf8() + " --new-window");
    DesktopBrowser().open(page);
    for (int waited = 0; waited < 100 && readFile(copy).isEmpty(); ++waited)
        QThread::msleep(50);
    EXPECT_EQ(readFile(copy), "<p>") << "the path is the command's last argument";

    qputenv("PELMAR_BROWSER", "/no/such/browser --new-window");
    EXPECT_EQ(failureOf([&] { DesktopBrowser().open(page); }),
              u"לא ניתן להפעיל את הדפדפן \"/no/such/browser\" (PELMAR_BROWSER)."_s);
    qunsetenv("PELMAR_BROWSER");
}

class TextFileWriterTest : public Isolated {
protected:
    QByteArray written(bool html, const std::function<void(TextFileWriter&)>& write)
    {
        const QString file = path(u"out.txt"_s);
        TextFileWriter writer(file, html);
        write(writer);
        writer.close();
        return readFile(file);
    }
};

TEST_F(TextFileWriterTest, ValuesAreEscapedAsTheirModeSaysAndMarkupIsNot)
{
    EXPECT_EQ(written(true,
                      [](TextFileWriter& file) {
                          file.put(u"<b>"_s);
                          file.put(u"a&b <c> \"d\", e\rf😀g"_s, Html::Text);
                          file.endLine();
                          file.put(u"1,2\r3"_s, Html::TextCrBr);
                          file.endLine();
                          file.put(u"1,2\r3"_s, Html::TextCrCommaBr);
                          file.endLine();
                      }),
              QByteArray("<b>a&amp;b &lt;c&gt; &quot;d&quot;, e\rf&#128512;g\r\n1,2<br>3\r\n1<br>2<br>3\r\n"));
    EXPECT_EQ(written(false, [](TextFileWriter& file) { file.line(u"05😀2 日"_s); }), QByteArray("05?2 ?\r\n"));
    EXPECT_EQ(written(true, [](TextFileWriter& file) { file.put(u"日<"_s, Html::Text); }), QByteArray("&#26085;&lt;"))
        << "a character after one the code page lacks is escaped still";
}

TEST_F(TextFileWriterTest, AnEarlierFileIsReplacedAndLongOutputsKeepEveryByte)
{
    writeFile(path(u"out.txt"_s), QByteArray(200000, 'x'));
    const QByteArray lines = written(true, [](TextFileWriter& file) {
        for (int i = 0; i < 20000; ++i)
            file.line(u"שורה %1"_s.arg(i));
    });
    EXPECT_TRUE(lines.startsWith("\xf9\xe5\xf8\xe4 0\r\n"));
    EXPECT_TRUE(lines.endsWith("\xf9\xe5\xf8\xe4 19999\r\n"));
    EXPECT_EQ(lines.count("\r\n"), 20000);
}

TEST_F(TextFileWriterTest, AFileThatCannotBeMadeIsAFailureNamingIt)
{
    const QString folder = path(u"folder"_s);
    QDir().mkpath(folder);
    try {
        TextFileWriter writer(folder, true);
        ADD_FAILURE();
    } catch (const Failure& failure) {
        EXPECT_TRUE(failure.description().contains(folder)) << failure.description().toStdString();
    }
}

}  // namespace
}  // namespace pelmar::test
