#include "control/MainCardControls.h"
#include "control/pages/Pages.h"
#include "options/Lists.h"
#include "widgets/ClickableLabel.h"
#include "widgets/Widgets.h"

#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

// The label lines in the order they stand on a standard label, with the text of each line's box.
struct LineRow {
    int line;
    QString box;
    QString caption;
};

const QList<LineRow>& lineRows()
{
    static const QList<LineRow> rows = {
        {0, u" לכבוד"_s, {}},
        {11, u"להציג טקסט קבוע מעל שם כרטיס?"_s, {}},
        {1, u"להציג שם כרטיס?"_s, u" שם כרטיס"_s},
        {12, u"להציג טקסט קבוע מתחת לשם כרטיס?"_s, {}},
        {2, u" קוד כרטיס:"_s, {}},
        {3, u" לידי: איש קשר"_s, {}},
        {6, u"להציג מחלקה/תפקיד?"_s, {}},
        {4, u" כתובת"_s, {}},
        {7, u" גוש"_s, {}},
        {5, u" עיר"_s, u"מיקוד "_s},
        {8, u" מחוז"_s, {}},
        {9, u" מדינה"_s, {}},
        {10, u" ארץ"_s, {}},
    };
    return rows;
}

QGroupBox* buildLines(MainCardControls& c)
{
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"תוכן המדבקה: (סמן את השורות הרצויות)"_s, grid);
    int row = 0;
    for (const LineRow& line : lineRows()) {
        QCheckBox* box = checkBox(arrayName("ChkTitle", line.line), line.box);
        grid->addWidget(box, row, 0);
        if (line.line == 6) {
            c.LblDept = new ClickableLabel(u"מחלקה"_s);
            c.LblDept->setObjectName(u"LblDept"_s);
            c.LblDept->setToolTip(u"תקתק להחלפת שדה"_s);
            c.LblDept->setCursor(Qt::PointingHandCursor);
            // It looks like what it is, a link that switches the field, not a plain caption.
            QFont link = c.LblDept->font();
            link.setUnderline(true);
            c.LblDept->setFont(link);
            c.LblDept->setForegroundRole(QPalette::Link);
            grid->addWidget(c.LblDept, row, 1);
        } else if (!line.caption.isEmpty()) {
            grid->addWidget(caption(line.caption), row, 1);
        }
        ++row;
    }
    auto* chkShowAttn = checkBox(u"chkShowAttn"_s, u"להציג כותרת לידי"_s);
    auto* chkDeptNewLine = checkBox(u"chkDeptNewLine"_s, u"להציג בשורה חדשה?"_s);
    grid->addWidget(chkShowAttn, row++, 0, 1, 2);
    grid->addWidget(chkDeptNewLine, row++, 0, 1, 2);
    grid->setColumnStretch(2, 1);
    return group;
}

QGroupBox* buildPageLayout()
{
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"מבנה הדף:"_s, grid);
    auto* txtRows = textBox(u"txtRows"_s, u"8"_s);
    auto* txtCols = textBox(u"txtCols"_s, u"3"_s);
    auto* txtCopies = textBox(u"txtCopies"_s, u"1"_s);
    auto* txtStartFrom = textBox(u"txtStartFrom"_s, u"1"_s);
    auto* cmbLabFormat = listBox(u"cmbLabFormat"_s, labelTemplateEntries());
    auto* cmbAddressFrom = listBox(u"cmbAddressFrom"_s, addressSourceEntries());
    grid->addWidget(caption(u"שורות"_s), 0, 0);
    grid->addWidget(txtRows, 0, 1);
    grid->addWidget(caption(u"עמודות"_s), 1, 0);
    grid->addWidget(txtCols, 1, 1);
    grid->addWidget(caption(u"עותקים:"_s), 2, 0);
    grid->addWidget(txtCopies, 2, 1);
    grid->addWidget(caption(u"התחל ממדבקה:"_s), 3, 0);
    grid->addWidget(txtStartFrom, 3, 1);
    grid->addWidget(caption(u"תבנית המדבקה:"_s), 4, 0);
    grid->addWidget(cmbLabFormat, 4, 1);
    grid->addWidget(caption(u"כתובות:"_s), 5, 0);
    grid->addWidget(cmbAddressFrom, 5, 1);
    return group;
}

QGroupBox* buildAddressOptions()
{
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"אנשי קשר וכתובת"_s, grid);
    auto* ChkAllContact = checkBox(u"ChkAllContact"_s, u"דיוור נפרד לכל איש קשר?"_s);
    auto* chkUseCntctAddrss = checkBox(u"chkUseCntctAddrss"_s, u"אם כן, עדיפות ראשונה לכתובתו?"_s);
    auto* ChkAddressBySQL = checkBox(u"ChkAddressBySQL"_s, u"כתובת לפי ביטוי SQL:"_s);
    auto* txtSQLAddress = textBox(u"txtSQLAddress"_s);
    txtSQLAddress->setLayoutDirection(Qt::LeftToRight);
    grid->addWidget(ChkAllContact, 0, 0, 1, 2);
    grid->addWidget(chkUseCntctAddrss, 1, 0, 1, 2);
    grid->addWidget(ChkAddressBySQL, 2, 0);
    grid->addWidget(txtSQLAddress, 2, 1);
    return group;
}

}  // namespace

QWidget* buildLabelPage(MainCardControls& c)
{
    auto* page = new QWidget;
    auto* columns = new QHBoxLayout(page);
    columns->addWidget(buildLines(c));
    auto* side = new QVBoxLayout;
    side->addWidget(buildPageLayout());
    side->addWidget(buildAddressOptions());
    c.CmdLabDef = button(u"CmdLabDef"_s, u"הגדרות מדבקה"_s);
    side->addWidget(c.CmdLabDef, 0, Qt::AlignLeading);
    side->addStretch(1);
    columns->addLayout(side);
    return page;
}

}  // namespace pelmar
