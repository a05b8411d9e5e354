#include "common/DesktopBrowser.h"

#include "common/Failure.h"

#include <QProcess>

using namespace Qt::StringLiterals;

namespace pelmar {

void DesktopBrowser::open(const QString& path)
{
    const QString command = qEnvironmentVariable("PELMAR_BROWSER");
    if (!command.isEmpty()) {
        QStringList arguments = QProcess::splitCommand(command);
        const QString program = arguments.takeFirst();
        if (!QProcess::startDetached(program, arguments << path))
            throw Failure(u"לא ניתן להפעיל את הדפדפן \"%1\" (PELMAR_BROWSER)."_s.arg(program));
        return;
    }
    if (!QProcess::startDetached(u"xdg-open"_s, {path}))
        throw Failure(u"לא ניתן לפתוח את הקובץ %1 בדפדפן: הפקודה xdg-open אינה מותקנת. יש להתקין את xdg-utils "
                      "או להגדיר את המשתנה PELMAR_BROWSER."_s.arg(path));
}

}  // namespace pelmar
