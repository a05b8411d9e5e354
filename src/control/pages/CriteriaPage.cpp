#include "control/MainCardControls.h"
#include "control/Widgets.h"
#include "control/pages/Pages.h"

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
    c.LblCatCode = caption(u"השתייכות:"_s, u"LblCatCode"_s);
    c.cmbCS = listBox(u"cmbCS"_s, {u"לקוחות"_s, u"ספקים"_s, u"לידים"_s});
    c.CmdSelectGroup = button(u"CmdSelectGroup"_s, u"בחירת קבוצות השתייכות..."_s);
    grid->addWidget(c.ChkCatCode, 0, kSwitch);
    grid->addWidget(c.LblCatCode, 0, kCaption);
    grid->addWidget(c.cmbCS, 0, kFirst);
    grid->addWidget(c.CmdSelectGroup, 0, kButton);

    c.ChkAccKey = checkBox(u"ChkAccKey"_s);
    c.TxtFromCrd = leftToRight(textBox(u"TxtFromCrd"_s));
    c.TxtToCrd = leftToRight(textBox(u"TxtToCrd"_s));
    grid->addWidget(c.ChkAccKey, 1, kSwitch);
    grid->addWidget(caption(u"מכרטיס:"_s), 1, kCaption);
    addRange(grid, 1, c.TxtFromCrd, c.TxtToCrd);

    c.ChkCity = checkBox(u"ChkCity"_s);
    c.TxtCity = textBox(u"TxtCity"_s);
    grid->addWidget(c.ChkCity, 2, kSwitch);
    grid->addWidget(caption(u"כל הערים ששמן מתחיל ב:"_s), 2, kCaption);
    grid->addWidget(c.TxtCity, 2, kFirst);

    c.ChkPhone = checkBox(u"ChkPhone"_s);
    c.cmbPhoneType = listBox(u"cmbPhoneType"_s, {u"טלפון 1"_s, u"טלפון 2"_s, u"טלפון נייד"_s, u"פקס"_s,
                                                 u"טלפון נייד - איש קשר"_s});
    c.txtPhone = leftToRight(textBox(u"txtPhone"_s));
    grid->addWidget(c.ChkPhone, 3, kSwitch);
    grid->addWidget(c.cmbPhoneType, 3, kCaption);
    grid->addWidget(caption(u"כל הטלפונים שמתחילים ב:"_s), 3, kFirst);
    grid->addWidget(c.txtPhone, 3, kSecond);

    c.ChkAgent = checkBox(u"ChkAgent"_s);
    c.CmbAgent = listBox(u"CmbAgent"_s, {});
    grid->addWidget(c.ChkAgent, 4, kSwitch);
    grid->addWidget(caption(u"סוכן:"_s), 4, kCaption);
    grid->addWidget(c.CmbAgent, 4, kFirst);
}

void buildDocumentRows(QGridLayout* grid, MainCardControls& c)
{
    c.ChkDates = checkBox(u"ChkDates"_s);
    c.TxtFromDate = leftToRight(textBox(u"TxtFromDate"_s));
    c.TxtToDate = leftToRight(textBox(u"TxtToDate"_s));
    grid->addWidget(c.ChkDates, 5, kSwitch);
    grid->addWidget(caption(u"מתאריך:"_s), 5, kCaption);
    addRange(grid, 5, c.TxtFromDate, c.TxtToDate);

    c.CmbDocType = listBox(u"CmbDocType"_s, {u"חשבוניות מס"_s, u"חש. מס זיכוי"_s, u"תעודות משלוח"_s,
                                             u"הזמנות רכש"_s, u"הצעות מחיר"_s, u"קבלות"_s, u"שיקים"_s,
                                             u"תש. לספקים"_s, u"תשלומי אשראי"_s});
    c.cmbByDoc = listBox(u"cmbByDoc"_s, {u"הופקו"_s, u"לא הופקו"_s});
    grid->addWidget(caption(u"על פי:"_s), 6, kCaption);
    grid->addWidget(c.CmbDocType, 6, kFirst);
    grid->addWidget(caption(u"כרטיסים:"_s), 6, kTo);
    grid->addWidget(c.cmbByDoc, 6, kSecond);

    c.txtFromDocNum = leftToRight(textBox(u"txtFromDocNum"_s));
    c.txtToDocNum = leftToRight(textBox(u"txtToDocNum"_s));
    grid->addWidget(caption(u"ממס' מסמך:"_s), 7, kCaption);
    addRange(grid, 7, c.txtFromDocNum, c.txtToDocNum);

    c.ChkItems = checkBox(u"ChkItems"_s, u"ע\"פ פריטים שנמכרו:"_s);
    c.txtFromItem = leftToRight(textBox(u"txtFromItem"_s));
    c.txtToItem = leftToRight(textBox(u"txtToItem"_s));
    grid->addWidget(c.ChkItems, 8, kSwitch);
    grid->addWidget(caption(u"מפריט:"_s), 8, kCaption);
    addRange(grid, 8, c.txtFromItem, c.txtToItem);
}

void buildOtherRows(QGridLayout* grid, MainCardControls& c)
{
    c.chkQryGroup = checkBox(u"chkQryGroup"_s);
    c.cmdQryGroup = button(u"cmdQryGroup"_s, u"בחירת מאפיינים..."_s);
    grid->addWidget(c.chkQryGroup, 9, kSwitch);
    grid->addWidget(caption(u"מאפיינים:"_s), 9, kCaption);
    grid->addWidget(c.cmdQryGroup, 9, kButton);

    c.ChkUseSQLW = checkBox(u"ChkUseSQLW"_s);
    c.txtSQLWhere = leftToRight(textBox(u"txtSQLWhere"_s));
    grid->addWidget(c.ChkUseSQLW, 10, kSwitch);
    grid->addWidget(caption(u"חתך SQL:"_s), 10, kCaption);
    grid->addWidget(c.txtSQLWhere, 10, kFirst, 1, 3);

    c.ChkSelectAccount = checkBox(u"ChkSelectAccount"_s);
    c.cmdSelectAccount = button(u"cmdSelectAccount"_s, u"בחירת כרטיסים..."_s);
    c.cmdSelByFile = button(u"cmdSelByFile"_s, u"בחירה ע\"פ קובץ חיצוני..."_s);
    grid->addWidget(c.ChkSelectAccount, 11, kSwitch);
    grid->addWidget(caption(u"כרטיסים נבחרים בלבד"_s), 11, kCaption);
    grid->addWidget(c.cmdSelectAccount, 11, kFirst);
    grid->addWidget(c.cmdSelByFile, 11, kSecond);

    c.CmbSortBy = listBox(u"CmbSortBy"_s, {u"מפתח לקוח"_s, u"שם לקוח"_s, u"עיר"_s, u"מיקוד"_s,
                                           u"איש קשר ומיקוד"_s, u"טלפון סלולרי"_s});
    c.CmbSortDir = listBox(u"CmbSortDir"_s, {u"עולה"_s, u"יורד"_s});
    grid->addWidget(caption(u"מיון לפי:"_s), 12, kCaption);
    grid->addWidget(c.CmbSortBy, 12, kFirst);
    grid->addWidget(c.CmbSortDir, 12, kSecond);
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
