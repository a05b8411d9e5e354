#include "cli/Cli.h"
#include "common/SessionState.h"
#include "control/MainCard.h"
#include "control/RealServices.h"

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QLibraryInfo>
#include <QLocale>
#include <QMainWindow>
#include <QTranslator>

#include <unistd.h>

using namespace Qt::StringLiterals;

namespace {

void nameTheApplication()
{
    QCoreApplication::setApplicationName(u"Pelmar"_s);
    QCoreApplication::setOrganizationName(u"Pelmar"_s);
    QCoreApplication::setApplicationVersion(QStringLiteral(PELMAR_VERSION));
}

// Qt warns on every start when the session has no runtime folder (a scheduled job, a container);
// give it the private folder it would pick itself.
void ensureRuntimeFolder()
{
    if (!qEnvironmentVariableIsEmpty("XDG_RUNTIME_DIR"))
        return;
    const QString folder = QDir::tempPath() + u"/runtime-"_s + QString::number(::getuid());
    QDir().mkpath(folder);
    QFile::setPermissions(folder, QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner);
    qputenv("XDG_RUNTIME_DIR", folder.toLocal8Bit());
}

// Qt's own texts (the buttons of the message boxes, the file dialogs) in Hebrew, from Qt's
// translations (Debian's qt6-translations-l10n); without them they stay in English.
void translateQt(QTranslator& translator)
{
    if (translator.load(QLocale(QLocale::Hebrew), u"qtbase"_s, u"_"_s,
                        QLibraryInfo::path(QLibraryInfo::TranslationsPath)))
        QCoreApplication::installTranslator(&translator);
}

// The window: the mailing control on a host window titled "Pelmar".
int runWindow(int argc, char* argv[])
{
    QApplication app(argc, argv);
    nameTheApplication();
    QTranslator translator;
    translateQt(translator);
    QApplication::setLayoutDirection(Qt::RightToLeft);
    pelmar::RealServices real;
    pelmar::SessionState state;
    QMainWindow window;
    window.setWindowTitle(u"Pelmar"_s);
    auto* card = new pelmar::MainCard(real.services(), state, &window);
    window.setCentralWidget(card);
    card->UserControl_Initialize();
    window.resize(1024, 720);
    window.show();
    return QApplication::exec();
}

}  // namespace

// Any argument makes a command, which runs without a window and without Qt's GUI platform.
int main(int argc, char* argv[])
{
    ensureRuntimeFolder();
    if (argc <= 1)
        return runWindow(argc, argv);
    QCoreApplication app(argc, argv);
    nameTheApplication();
    return pelmar::runCommandLine(QCoreApplication::arguments().mid(1));
}
