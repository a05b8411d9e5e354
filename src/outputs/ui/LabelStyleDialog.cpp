#include "outputs/ui/LabelStyleDialog.h"

#include "common/Failure.h"
#include "common/Messages.h"
#include "widgets/Widgets.h"

#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

struct StyleRow {
    int line;
    const char16_t* caption;
};

constexpr StyleRow kRows[]
    = {{0, u"לכבוד"},         {11, u"טקסט קבוע"}, {1, u"שם כרטיס"}, {12, u"טקסט קבוע"}, {2, u"קוד כרטיס:"},
       {3, u"לידי: איש קשר"}, {6, u"מחלקה"},      {4, u"כתובת"},    {7, u"גוש"},        {5, u"עיר  ומיקוד"},
       {8, u"מחוז"},          {9, u"מדינה"},      {10, u"ארץ"}};

bool hasFixedText(int line)
{
    return line == 11 || line == 12;
}

}  // namespace

LabelStyleDialog::LabelStyleDialog(SettingsStore& store, Messages& messages, LabelDefTable& defs, QWidget* parent)
    : QDialog(parent), store_(store), messages_(messages), defs_(defs)
{
    setObjectName(u"frmLabDef"_s);
    setWindowTitle(u"הגדרות צורה וגודל"_s);
    buildRows();
    SetGetLabelDefs(2, store_, defs_);
    try {
        GetSetFormLabDefs(1);
    } catch (const Failure&) {
        // A stored index the list cannot show stops the filling; the dialog opens all the same.
    }
}

void LabelStyleDialog::buildRows()
{
    auto* grid = new QGridLayout;
    const QStringList headings = {{}, u"גופן"_s, u"גודל"_s, u"עובי"_s, u"קו תחתי?"_s, u"נטוי?"_s, u"תוכן"_s};
    for (int column = 1; column < headings.size(); ++column)
        grid->addWidget(caption(headings[column]), 0, column);
    int row = 1;
    for (const StyleRow& style : kRows) {
        const int i = style.line;
        CmbFont[i] = listBox(arrayName("CmbFont", i), {u"Arial"_s, u"David"_s, u"Miriam"_s});
        txtFontSize[i] = textBox(arrayName("txtFontSize", i));
        txtFontSize[i]->setMaximumWidth(50);
        CmbWeight[i] = listBox(arrayName("CmbWeight", i), {u"רגיל"_s, u"מודגש"_s, u"עבה"_s});
        ChkUL[i] = checkBox(arrayName("ChkUL", i));
        ChkItalic[i] = checkBox(arrayName("ChkItalic", i));
        grid->addWidget(caption(QString::fromUtf16(style.caption)), row, 0);
        grid->addWidget(CmbFont[i], row, 1);
        grid->addWidget(txtFontSize[i], row, 2);
        grid->addWidget(CmbWeight[i], row, 3);
        grid->addWidget(ChkUL[i], row, 4);
        grid->addWidget(ChkItalic[i], row, 5);
        if (hasFixedText(i)) {
            txtFixed[i] = textBox(arrayName("txtFixed", i));
            grid->addWidget(txtFixed[i], row, 6);
        }
        ++row;
    }
    cmdOK = button(u"cmdOK"_s, u"אישור"_s);
    cmdCancel = button(u"cmdCancel"_s, u"ביטול"_s);
    connect(cmdOK, &QPushButton::clicked, this, &LabelStyleDialog::cmdOK_Click);
    connect(cmdCancel, &QPushButton::clicked, this, &LabelStyleDialog::cmdCancel_Click);
    auto* buttons = new QHBoxLayout;
    buttons->addStretch(1);
    buttons->addWidget(cmdOK);
    buttons->addWidget(cmdCancel);
    auto* layout = new QVBoxLayout(this);
    layout->addLayout(grid);
    layout->addLayout(buttons);
}

void LabelStyleDialog::toForm(int i)
{
    const LabelDefRec& def = defs_[i];
    if (def.Font >= CmbFont[i]->count())
        throw Failure(u"Invalid property value"_s, 380);
    CmbFont[i]->setCurrentIndex(def.Font);
    txtFontSize[i]->setText(QString::number(def.FontSize));
    if (def.FontWeight >= CmbWeight[i]->count())
        throw Failure(u"Invalid property value"_s, 380);
    CmbWeight[i]->setCurrentIndex(def.FontWeight);
    ChkUL[i]->setChecked(def.FontUL == 1);
    ChkItalic[i]->setChecked(def.FontItalic == 1);
    if (hasFixedText(i))
        txtFixed[i]->setText(def.FixedText);
}

void LabelStyleDialog::fromForm(int i)
{
    LabelDefRec& def = defs_[i];
    def.Font = static_cast<unsigned char>(std::max(0, CmbFont[i]->currentIndex()));
    const auto size = byteValue(txtFontSize[i]->text());
    if (!size)
        throw Failure(u"Overflow"_s, 6);
    def.FontSize = *size;
    def.FontWeight = static_cast<unsigned char>(std::max(0, CmbWeight[i]->currentIndex()));
    def.FontUL = ChkUL[i]->isChecked() ? 1 : 0;
    def.FontItalic = ChkItalic[i]->isChecked() ? 1 : 0;
    if (hasFixedText(i))
        def.FixedText = txtFixed[i]->text();
}

void LabelStyleDialog::GetSetFormLabDefs(unsigned char action)
{
    for (int line = 0; line < 13; ++line) {
        if (action == 1)
            toForm(line);
        else if (action == 2)
            fromForm(line);
    }
}

void LabelStyleDialog::cmdOK_Click()
{
    for (const StyleRow& style : kRows) {
        QLineEdit* size = txtFontSize[style.line];
        if (!byteValue(size->text())) {
            messages_.critical(u"שגיאה"_s,
                               u"הגודל \"%1\" בשורה \"%2\" אינו מספר שלם בין 0 ל-255. יש לתקן אותו."_s.arg(
                                   size->text(), QString::fromUtf16(style.caption)));
            size->setFocus();
            size->selectAll();
            return;
        }
    }
    GetSetFormLabDefs(2);
    SetGetLabelDefs(1, store_, defs_);
    accept();
}

void LabelStyleDialog::cmdCancel_Click()
{
    reject();
}

}  // namespace pelmar
