#include "control/MainCardControls.h"
#include "control/pages/Pages.h"
#include "widgets/ClickableLabel.h"
#include "widgets/Widgets.h"

#include <QPushButton>
#include <QVBoxLayout>

using namespace Qt::StringLiterals;

namespace pelmar {

QWidget* buildGeneralPage(MainCardControls& c)
{
    auto* page = new QWidget;
    auto* layout = new QVBoxLayout(page);
    c.CmdConnect = button(u"CmdConnect"_s, u"הגדרות התחברות ל-SAP Business One"_s);
    c.Label56 = new ClickableLabel(u"https://pelmar.co.il"_s);
    c.Label56->setObjectName(u"Label56"_s);
    c.Label56->setToolTip(u"לחיצה כפולה מציגה את יומן ההרצות"_s);
    layout->addWidget(c.CmdConnect, 0, Qt::AlignLeading);
    layout->addStretch(1);
    layout->addWidget(c.Label56, 0, Qt::AlignHCenter);
    return page;
}

}  // namespace pelmar
