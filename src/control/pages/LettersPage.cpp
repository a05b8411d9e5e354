#include "control/MainCardControls.h"
#include "control/pages/Pages.h"
#include "options/Lists.h"
#include "widgets/Widgets.h"

#include <QApplication>
#include <QButtonGroup>
#include <QCheckBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QRadioButton>
#include <QStyle>
#include <QToolButton>
#include <QVBoxLayout>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

QGroupBox* buildMergeRows()
{
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"נתונים לשילוב במכתב (Word בלבד):"_s, grid);
    grid->addWidget(caption(u"לשלב?"_s), 0, 0);
    grid->addWidget(caption(u"שם השדה במסמך"_s), 0, 1);
    grid->addWidget(caption(u"נתון לשילוב"_s), 0, 2);
    // A fixed row shows the data it merges; a free row a box for its SQL expression.
    for (int i = 0; i < mergeRows().size(); ++i) {
        const MergeRow& row = mergeRows().at(i);
        auto* formField = caption(row.formField, arrayName("LblFaxFormField", i));
        formField->setLayoutDirection(Qt::LeftToRight);
        QWidget* data = caption(row.caption, arrayName("LblFaxField", i));
        if (row.free) {
            auto* expression = textBox(arrayName("txtFaxExpr", i));
            expression->setLayoutDirection(Qt::LeftToRight);
            data = expression;
        }
        grid->addWidget(checkBox(arrayName("chkFaxField", i)), i + 1, 0);
        grid->addWidget(formField, i + 1, 1);
        grid->addWidget(data, i + 1, 2);
    }
    grid->setColumnStretch(2, 1);
    return group;
}

QGroupBox* buildFaxSettings()
{
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"הגדרות לפקס:"_s, grid);
    QGridLayout* serverGrid = nullptr;
    auto* FaxServerType = groupBox(u"שרת פקסים:"_s, serverGrid);
    FaxServerType->setObjectName(u"FaxServerType"_s);
    auto* transports = new QButtonGroup(FaxServerType);
    QRadioButton* OptOLE[] = {nullptr, new QRadioButton(u"WinFax Pro 10"_s),
                              new QRadioButton(u"MS Fax Service (Win 2000 sp3 or Win XP)"_s)};
    for (int i = 1; i <= 2; ++i) {
        OptOLE[i]->setObjectName(arrayName("OptOLE", i));
        transports->addButton(OptOLE[i], i);
        serverGrid->addWidget(OptOLE[i], i - 1, 0);
    }
    auto* txtFaxSubject = textBox(u"txtFaxSubject"_s);
    auto* txtFaxDelay = textBox(u"txtFaxDelay"_s);
    auto* TxtLocalAreaPrefix = textBox(u"TxtLocalAreaPrefix"_s);
    grid->addWidget(FaxServerType, 0, 0, 1, 2);
    grid->addWidget(caption(u"נושא הפקס:"_s), 1, 0);
    grid->addWidget(txtFaxSubject, 1, 1);
    grid->addWidget(caption(u"דחיית המשלוח בדקות:"_s), 2, 0);
    grid->addWidget(txtFaxDelay, 2, 1);
    grid->addWidget(caption(u"אזור חיוג מקומי:"_s), 3, 0);
    grid->addWidget(TxtLocalAreaPrefix, 3, 1);
    return group;
}

}  // namespace

QToolButton* folderButton(int index, const QString& toolTip)
{
    auto* pick = new QToolButton;
    pick->setObjectName(arrayName("CmdDir", index));
    pick->setIcon(QApplication::style()->standardIcon(QStyle::SP_DirOpenIcon));
    pick->setToolTip(toolTip);
    return pick;
}

QWidget* buildLettersPage(MainCardControls& c)
{
    auto* page = new QWidget;
    auto* layout = new QVBoxLayout(page);
    auto* templateRow = new QHBoxLayout;
    c.txtFaxFile = textBox(u"txtFaxFile"_s);
    c.txtFaxFile->setLayoutDirection(Qt::LeftToRight);
    c.CmdDir[3] = folderButton(3, u"בחירת מסמך"_s);
    templateRow->addWidget(caption(u"קובץ לתוכן המכתב:"_s));
    templateRow->addWidget(c.txtFaxFile, 1);
    templateRow->addWidget(c.CmdDir[3]);
    layout->addLayout(templateRow);
    auto* columns = new QHBoxLayout;
    columns->addWidget(buildMergeRows(), 3);
    columns->addWidget(buildFaxSettings(), 2);
    layout->addLayout(columns);
    layout->addStretch(1);
    return page;
}

}  // namespace pelmar
