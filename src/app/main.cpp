#include "cli/Cli.h"
#include "common/SessionState.h"
#include "control/MainCard.h"
#include "control/RealServices.h"
#include "widgets/QtTranslation.h"

#include <QApplication>
#include <QCloseEvent>
#include <QDir>
#include <QFile>
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

// The host window: it asks the mailing control before it closes.
class HostWindow : public QMainWindow {
public:
    pelmar::MainCard* card = nullptr;

protected:
    void closeEvent(QCloseEvent* event) override
    {
        if (card && !card->mayClose())
            event->ignore();
    }
};

// The window: the mailing control on a host window titled "Pelmar".
int runWindow(int argc, char* argv[])
{
    QApplication app(argc, argv);
    nameTheApplication();
    QTranslator translator;
    pelmar::installQtHebrew(translator);
    QApplication::setLayoutDirection(Qt::RightToLeft);
    pelmar::RealServices real;
    pelmar::SessionState state;
    HostWindow window;
    window.setWindowTitle(u"Pelmar"_s);
    auto* card = new pelmar::MainCard(real.services(), state, &window);
    window.card = card;
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
