#include "common/SessionState.h"
#include "control/MainCard.h"
#include "control/RealServices.h"

#include "common/Failure.h"
#include "demo/DemoCompany.h"
#include "settings/SettingsStore.h"

#include <QApplication>
#include <QTextStream>
#include <QMainWindow>

using namespace Qt::StringLiterals;

namespace {

// "pelmar demo [--force]": creates the demo company without opening a window.
int runDemo(const QStringList& arguments)
{
    pelmar::SettingsStore store = pelmar::SettingsStore::forCurrentUser();
    try {
        const auto result = pelmar::createDemoCompany(store, pelmar::embeddedCompaniesFolder(),
                                                      arguments.contains(u"--force"_s));
        QTextStream(stdout) << result.message << Qt::endl;
        return 0;
    } catch (const pelmar::Failure& failure) {
        QTextStream(stderr) << u"תקלה: "_s << failure.description() << Qt::endl;
        return 1;
    }
}

}  // namespace

int main(int argc, char* argv[])
{
    if (argc > 1 && qstrcmp(argv[1], "demo") == 0) {
        QCoreApplication core(argc, argv);
        return runDemo(QCoreApplication::arguments().mid(2));
    }
    QApplication app(argc, argv);
    QApplication::setApplicationName(u"Pelmar"_s);
    QApplication::setOrganizationName(u"Pelmar"_s);
    QApplication::setApplicationVersion(QStringLiteral(PELMAR_VERSION));
    QApplication::setLayoutDirection(Qt::RightToLeft);

    pelmar::RealServices real;
    pelmar::SessionState state;
    QMainWindow window;
    window.setWindowTitle(u"Pelmar"_s);
    auto* card = new pelmar::MainCard(real.services(), state, &window);
    window.setCentralWidget(card);
    card->UserControl_Initialize();
    window.resize(1000, 720);
    window.show();
    return QApplication::exec();
}
