#include "control/MainCardControls.h"
#include "control/pages/Pages.h"
#include "options/Lists.h"
#include "widgets/Widgets.h"

#include <QComboBox>
#include <QFrame>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

QWidget* buildProgress(MainCardControls& c)
{
    c.ProgressFrame = new QFrame;
    c.ProgressFrame->setObjectName(u"ProgressFrame"_s);
    c.ProgressFrame->setFrameShape(QFrame::Box);
    c.ProgressFrame->setFixedHeight(14);
    c.ProgressFrame->setMinimumWidth(200);
    // The fill is placed by hand: its width is the share of the frame's width a run has done.
    c.ProgressFill = new QFrame(c.ProgressFrame);
    c.ProgressFill->setObjectName(u"ProgressFill"_s);
    c.ProgressFill->setAutoFillBackground(true);
    c.ProgressFill->setStyleSheet(u"background-color: #3a6ea5;"_s);
    c.ProgressFill->setGeometry(0, 0, 0, 14);
    return c.ProgressFrame;
}

}  // namespace

QWidget* buildCommandStrip(MainCardControls& c)
{
    auto* strip = new QWidget;
    auto* grid = new QGridLayout(strip);
    auto* cmbOutType = listBox(u"cmbOutType"_s, outputTypeEntries());
    c.CmdLabPrev = button(u"CmdLabPrev"_s, u"הפעל דיוור"_s);
    c.CmdPreview = button(u"CmdPreview"_s, u"הצג רשימת מעקב"_s);
    c.CmdDef = button(u"CmdDef"_s, u"שמור הגדרות"_s);
    c.CmdDef->setToolTip(u"שומר את הגדרות הדפים לפעם הבאה. אינם נשמרים: תוכן ההודעה, התחלה ממדבקה, מספרי "
                         "המסמכים, הפריטים, המאפיינים והכרטיסים שנבחרו."_s);
    c.cmdStop = button(u"cmdStop"_s, u"עצור"_s);
    c.Message1 = caption({}, u"Message1"_s);

    auto* buttons = new QHBoxLayout;
    buttons->addWidget(caption(u"סוג הדיוור:"_s));
    buttons->addWidget(cmbOutType);
    buttons->addWidget(c.CmdLabPrev);
    buttons->addWidget(c.CmdPreview);
    buttons->addWidget(c.CmdDef);
    buttons->addWidget(c.cmdStop);
    buttons->addStretch(1);
    grid->addLayout(buttons, 0, 0, 1, 2);
    grid->addWidget(c.Message1, 1, 0);
    grid->addWidget(buildProgress(c), 1, 1);
    grid->setColumnStretch(0, 1);
    return strip;
}

}  // namespace pelmar
