#include "log/RunLog.h"

#include "common/BrowserWindow.h"
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

bool ShowLog(BrowserWindow& browser)
{
    if (!QFile::exists(runLogPath()))
        return false;
    QFile::remove(runLogViewPath());
    QFile::copy(runLogPath(), runLogViewPath());
    browser.open(runLogViewPath());
    return true;
}

}  // namespace pelmar
