#include "control/MainCardControls.h"
#include "control/Tag.h"
#include "control/Widgets.h"
#include "control/pages/Pages.h"

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

constexpr int kFixedRows = 4;
const QString kFreeRowTag = u"5"_s;
const QString kFixedRowTag = u"1"_s;

// The merge rows: the form field each fills and, for the fixed rows, the caption and the
// recipient column behind it.
struct MergeRow {
    QString formField;
    QString caption;
    QString column;
};

const QList<MergeRow>& mergeRows()
{
    static const QList<MergeRow> rows = {
        {u"CustomerName"_s, u"שם לקוח"_s, u"CardName"_s},
        {u"ContactName"_s, u"איש קשר"_s, u"Attn"_s},
        {u"Position"_s, u"תפקיד"_s, u"Position"_s},
        {u"Department"_s, u"מחלקה"_s, u"Notes1"_s},
        {u"Field4"_s, {}, {}},
        {u"Field5"_s, {}, {}},
        {u"Field6"_s, {}, {}},
        {u"Field7"_s, {}, {}},
    };
    return rows;
}

QGroupBox* buildMergeRows(MainCardControls& c)
{
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"נתונים לשילוב במכתב (Word בלבד):"_s, grid);
    grid->addWidget(caption(u"לשלב?"_s), 0, 0);
    grid->addWidget(caption(u"שם השדה במסמך"_s), 0, 1);
    grid->addWidget(caption(u"נתון לשילוב"_s), 0, 2);
    for (int i = 0; i < 8; ++i) {
        const MergeRow& row = mergeRows().at(i);
        const bool free = i >= kFixedRows;
        c.chkFaxField[i] = checkBox(arrayName("chkFaxField", i));
        setTag(c.chkFaxField[i], free ? kFreeRowTag : kFixedRowTag);
        c.LblFaxFormField[i] = caption(row.formField, arrayName("LblFaxFormField", i));
        c.LblFaxFormField[i]->setLayoutDirection(Qt::LeftToRight);
        c.LblFaxField[i] = caption(row.caption, arrayName("LblFaxField", i));
        setTag(c.LblFaxField[i], row.column);
        c.txtFaxExpr[i] = textBox(arrayName("txtFaxExpr", i));
        setTag(c.txtFaxExpr[i], free ? row.formField : QString());
        c.txtFaxExpr[i]->setLayoutDirection(Qt::LeftToRight);
        grid->addWidget(c.chkFaxField[i], i + 1, 0);
        grid->addWidget(c.LblFaxFormField[i], i + 1, 1);
        grid->addWidget(free ? static_cast<QWidget*>(c.txtFaxExpr[i]) : c.LblFaxField[i], i + 1, 2);
        (free ? static_cast<QWidget*>(c.LblFaxField[i]) : c.txtFaxExpr[i])->hide();
    }
    grid->setColumnStretch(2, 1);
    return group;
}

QGroupBox* buildFaxSettings(MainCardControls& c)
{
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"הגדרות לפקס:"_s, grid);
    QGridLayout* serverGrid = nullptr;
    c.FaxServerType = groupBox(u"שרת פקסים:"_s, serverGrid);
    c.FaxServerType->setObjectName(u"FaxServerType"_s);
    auto* transports = new QButtonGroup(c.FaxServerType);
    c.OptOLE[1] = new QRadioButton(u"WinFax Pro 10"_s);
    c.OptOLE[2] = new QRadioButton(u"MS Fax Service (Win 2000 sp3 or Win XP)"_s);
    for (int i = 1; i <= 2; ++i) {
        c.OptOLE[i]->setObjectName(arrayName("OptOLE", i));
        transports->addButton(c.OptOLE[i], i);
        serverGrid->addWidget(c.OptOLE[i], i - 1, 0);
    }
    c.txtFaxSubject = textBox(u"txtFaxSubject"_s);
    c.txtFaxDelay = textBox(u"txtFaxDelay"_s);
    c.TxtLocalAreaPrefix = textBox(u"TxtLocalAreaPrefix"_s);
    grid->addWidget(c.FaxServerType, 0, 0, 1, 2);
    grid->addWidget(caption(u"נושא הפקס:"_s), 1, 0);
    grid->addWidget(c.txtFaxSubject, 1, 1);
    grid->addWidget(caption(u"דחיית המשלוח בדקות:"_s), 2, 0);
    grid->addWidget(c.txtFaxDelay, 2, 1);
    grid->addWidget(caption(u"אזור חיוג מקומי:"_s), 3, 0);
    grid->addWidget(c.TxtLocalAreaPrefix, 3, 1);
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
    columns->addWidget(buildMergeRows(c), 3);
    columns->addWidget(buildFaxSettings(c), 2);
    layout->addLayout(columns);
    layout->addStretch(1);
    return page;
}

}  // namespace pelmar
