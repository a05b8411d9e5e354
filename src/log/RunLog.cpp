#include "log/RunLog.h"

#include "common/BrowserWindow.h"
#include "common/Failure.h"
#include "common/Messages.h"
#include "common/TempFolder.h"
#include "common/Windows1255.h"

#include <QFile>

using namespace Qt::StringLiterals;

namespace pelmar {

QString runLogPath()
{
    return tempFile(u"pelmar.log"_s);
}

QString runLogViewPath()
{
    return tempFile(u"pmlog.htm"_s);
}

void InitLog()
{
    QFile::remove(runLogPath());
}

namespace {

// The characters a browser would take as markup; quotes are left as they are.
QString markupEscaped(const QString& text)
{
    QString escaped = text;
    return escaped.replace(u'&', u"&amp;"_s).replace(u'<', u"&lt;"_s).replace(u'>', u"&gt;"_s);
}

}  // namespace

void WriteLog(const QString& text, const QString& title, const QDateTime& now)
{
    QString entry = u">>"_s + now.toString(u"dd-MM-yy+HH:mm"_s) + u"<br>\r\n"_s;
    if (!title.isEmpty())
        entry += markupEscaped(title) + u"<br>\r\n"_s;
    entry += markupEscaped(text) + u"<br>\r\n"_s;
    QFile log(runLogPath());
    if (log.open(QIODevice::Append))
        log.write(toWindows1255(entry, true));
}

void ShowLog(BrowserWindow& browser, Messages& messages)
{
    if (!QFile::exists(runLogPath())) {
        messages.critical(u"הודעה"_s, u"היומן אינו נמצא"_s);
        return;
    }
    QFile::remove(runLogViewPath());
    QFile::copy(runLogPath(), runLogViewPath());
    try {
        browser.open(runLogViewPath());
    } catch (const Failure& failure) {
        messages.critical(u"תקלה"_s, failure.description());
    }
}

}  // namespace pelmar
