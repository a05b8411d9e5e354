#include "control/MainCardControls.h"
#include "control/pages/Pages.h"
#include "options/Lists.h"
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

// Columns of the criteria grid: switch, caption, first input, "עד:", second input, button.
enum Column { kSwitch, kCaption, kFirst, kTo, kSecond, kButton };

QLineEdit* leftToRight(QLineEdit* box)
{
    box->setLayoutDirection(Qt::LeftToRight);
    return box;
}

void addRange(QGridLayout* grid, int row, QLineEdit* from, QLineEdit* to)
{
    grid->addWidget(from, row, kFirst);
    grid->addWidget(caption(u"עד:"_s), row, kTo);
    grid->addWidget(to, row, kSecond);
}

void buildCardRows(QGridLayout* grid, MainCardControls& c)
{
    c.ChkCatCode = checkBox(u"ChkCatCode"_s);
    auto* LblCatCode = caption(u"השתייכות:"_s, u"LblCatCode"_s);
    c.cmbCS = listBox(u"cmbCS"_s, cardTypeEntries());
    c.CmdSelectGroup = button(u"CmdSelectGroup"_s, u"בחירת קבוצות השתייכות..."_s);
    grid->addWidget(c.ChkCatCode, 0, kSwitch);
    grid->addWidget(LblCatCode, 0, kCaption);
    grid->addWidget(c.cmbCS, 0, kFirst);
    grid->addWidget(c.CmdSelectGroup, 0, kButton);

    auto* ChkAccKey = checkBox(u"ChkAccKey"_s);
    auto* TxtFromCrd = leftToRight(textBox(u"TxtFromCrd"_s));
    auto* TxtToCrd = leftToRight(textBox(u"TxtToCrd"_s));
    grid->addWidget(ChkAccKey, 1, kSwitch);
    grid->addWidget(caption(u"מכרטיס:"_s), 1, kCaption);
    addRange(grid, 1, TxtFromCrd, TxtToCrd);

    auto* ChkCity = checkBox(u"ChkCity"_s);
    auto* TxtCity = textBox(u"TxtCity"_s);
    grid->addWidget(ChkCity, 2, kSwitch);
    grid->addWidget(caption(u"כל הערים ששמן מתחיל ב:"_s), 2, kCaption);
    grid->addWidget(TxtCity, 2, kFirst);

    auto* ChkPhone = checkBox(u"ChkPhone"_s);
    auto* cmbPhoneType = listBox(u"cmbPhoneType"_s, phoneTypeEntries());
    auto* txtPhone = leftToRight(textBox(u"txtPhone"_s));
    grid->addWidget(ChkPhone, 3, kSwitch);
    grid->addWidget(cmbPhoneType, 3, kCaption);
    grid->addWidget(caption(u"כל הטלפונים שמתחילים ב:"_s), 3, kFirst);
    grid->addWidget(txtPhone, 3, kSecond);

    auto* ChkAgent = checkBox(u"ChkAgent"_s);
    c.CmbAgent = listBox(u"CmbAgent"_s, {});
    grid->addWidget(ChkAgent, 4, kSwitch);
    grid->addWidget(caption(u"סוכן:"_s), 4, kCaption);
    grid->addWidget(c.CmbAgent, 4, kFirst);
}

void buildDocumentRows(QGridLayout* grid, MainCardControls& c)
{
    auto* ChkDates = checkBox(u"ChkDates"_s);
    auto* TxtFromDate = leftToRight(textBox(u"TxtFromDate"_s));
    auto* TxtToDate = leftToRight(textBox(u"TxtToDate"_s));
    grid->addWidget(ChkDates, 5, kSwitch);
    grid->addWidget(caption(u"מתאריך:"_s), 5, kCaption);
    addRange(grid, 5, TxtFromDate, TxtToDate);

    auto* CmbDocType = listBox(u"CmbDocType"_s, documentTypeEntries());
    auto* cmbByDoc = listBox(u"cmbByDoc"_s, byDocumentEntries());
    grid->addWidget(caption(u"על פי:"_s), 6, kCaption);
    grid->addWidget(CmbDocType, 6, kFirst);
    grid->addWidget(caption(u"כרטיסים:"_s), 6, kTo);
    grid->addWidget(cmbByDoc, 6, kSecond);

    auto* txtFromDocNum = leftToRight(textBox(u"txtFromDocNum"_s));
    auto* txtToDocNum = leftToRight(textBox(u"txtToDocNum"_s));
    grid->addWidget(caption(u"ממס' מסמך:"_s), 7, kCaption);
    addRange(grid, 7, txtFromDocNum, txtToDocNum);

    c.ChkItems = checkBox(u"ChkItems"_s, u"ע\"פ פריטים שנמכרו:"_s);
    auto* txtFromItem = leftToRight(textBox(u"txtFromItem"_s));
    auto* txtToItem = leftToRight(textBox(u"txtToItem"_s));
    grid->addWidget(c.ChkItems, 8, kSwitch);
    grid->addWidget(caption(u"מפריט:"_s), 8, kCaption);
    addRange(grid, 8, txtFromItem, txtToItem);
}

void buildOtherRows(QGridLayout* grid, MainCardControls& c)
{
    c.chkQryGroup = checkBox(u"chkQryGroup"_s);
    c.cmdQryGroup = button(u"cmdQryGroup"_s, u"בחירת מאפיינים..."_s);
    grid->addWidget(c.chkQryGroup, 9, kSwitch);
    grid->addWidget(caption(u"מאפיינים:"_s), 9, kCaption);
    grid->addWidget(c.cmdQryGroup, 9, kButton);

    auto* ChkUseSQLW = checkBox(u"ChkUseSQLW"_s);
    auto* txtSQLWhere = leftToRight(textBox(u"txtSQLWhere"_s));
    grid->addWidget(ChkUseSQLW, 10, kSwitch);
    grid->addWidget(caption(u"חתך SQL:"_s), 10, kCaption);
    grid->addWidget(txtSQLWhere, 10, kFirst, 1, 3);

    c.ChkSelectAccount = checkBox(u"ChkSelectAccount"_s);
    c.cmdSelectAccount = button(u"cmdSelectAccount"_s, u"בחירת כרטיסים..."_s);
    c.cmdSelByFile = button(u"cmdSelByFile"_s, u"בחירה ע\"פ קובץ חיצוני..."_s);
    grid->addWidget(c.ChkSelectAccount, 11, kSwitch);
    grid->addWidget(caption(u"כרטיסים נבחרים בלבד"_s), 11, kCaption);
    grid->addWidget(c.cmdSelectAccount, 11, kFirst);
    grid->addWidget(c.cmdSelByFile, 11, kSecond);

    auto* CmbSortBy = listBox(u"CmbSortBy"_s, sortByEntries());
    auto* CmbSortDir = listBox(u"CmbSortDir"_s, sortDirectionEntries());
    grid->addWidget(caption(u"מיון לפי:"_s), 12, kCaption);
    grid->addWidget(CmbSortBy, 12, kFirst);
    grid->addWidget(CmbSortDir, 12, kSecond);
}

}  // namespace

QWidget* buildCriteriaPage(MainCardControls& c)
{
    auto* page = new QWidget;
    auto* layout = new QVBoxLayout(page);
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"טווח הכרטיסים"_s, grid);
    buildCardRows(grid, c);
    buildDocumentRows(grid, c);
    buildOtherRows(grid, c);
    grid->setColumnStretch(kFirst, 1);
    grid->setColumnStretch(kSecond, 1);
    layout->addWidget(group);
    layout->addStretch(1);
    return page;
}

}  // namespace pelmar
