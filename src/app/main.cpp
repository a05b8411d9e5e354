#include "common/SessionState.h"
#include "control/MainCard.h"
#include "control/RealServices.h"

#include <QApplication>
#include <QMainWindow>

using namespace Qt::StringLiterals;

int main(int argc, char* argv[])
{
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
