#include "app/Cli.h"
#include "common/SessionState.h"
#include "control/MainCard.h"
#include "control/RealServices.h"

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QMainWindow>

#include <unistd.h>

using namespace Qt::StringLiterals;

namespace {

// The window: the mailing control on a host window titled "Pelmar".
int runWindow()
{
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

}  // namespace

int main(int argc, char* argv[])
{
    ensureRuntimeFolder();
    // Any argument makes a command, which runs without a display: the control is built on Qt's
    // offscreen platform.
    const bool command = argc > 1;
    if (command && qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    QApplication::setApplicationName(u"Pelmar"_s);
    QApplication::setOrganizationName(u"Pelmar"_s);
    QApplication::setApplicationVersion(QStringLiteral(PELMAR_VERSION));
    QApplication::setLayoutDirection(Qt::RightToLeft);
    if (command)
        return pelmar::runCommandLine(QApplication::arguments().mid(1));
    return runWindow();
}
