#include "control/ClickableLabel.h"
#include "support/MainCardFixture.h"
#include "control/SetGetCtrl.h"
#include "control/Tag.h"

#include <QCheckBox>
#include <QCoreApplication>
#include <QPlainTextEdit>
#include <QComboBox>
#include <QFocusEvent>
#include <QFrame>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTabWidget>
#include <QMouseEvent>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

QStringList itemsOf(const QComboBox* combo)
{
    QStringList items;
    for (int i = 0; i < combo->count(); ++i)
        items << combo->itemText(i);
    return items;
}

TEST_F(MainCardTest, ThePagesStandInOrderWithTheirCaptions)
{
    const QStringList expected = {u"הגדרות מדבקת כתובת"_s, u"הגדרות למשלוח מכתב"_s, u"הגדרות למשלוח דוא\"ל"_s,
                                  u"טווח הכרטיסים"_s, u"הגדרות כלליות"_s};
    ASSERT_EQ(c().SSTab1->count(), 5);
    for (int i = 0; i < 5; ++i)
        EXPECT_EQ(c().SSTab1->tabText(i), expected[i]);
}

// Each named control: its page (-1 below the pages), its kind and its caption.
struct ControlCase {
    const char16_t* name;
    int page;
    const char* kind;
    const char16_t* caption;
};

const ControlCase kControls[] = {
    {u"cmbOutType", -1, "QComboBox", u""},
    {u"CmdLabPrev", -1, "QPushButton", u"הפעל דיוור"},
    {u"CmdPreview", -1, "QPushButton", u"הצג רשימת מעקב"},
    {u"CmdDef", -1, "QPushButton", u"שמור הגדרות"},
    {u"cmdStop", -1, "QPushButton", u"עצור"},
    {u"Message1", -1, "QLabel", u""},
    {u"ProgressFrame", -1, "QFrame", u""},
    {u"CmdConnect", 4, "QPushButton", u"הגדרות התחברות ל-SAP Business One"},
    {u"Label56", 4, "QLabel", nullptr},
    {u"CmdLabDef", 0, "QPushButton", u"הגדרות מדבקה"},
    {u"LblDept", 0, "QLabel", u"מחלקה"},
    {u"chkShowAttn", 0, "QCheckBox", u"להציג כותרת לידי"},
    {u"chkDeptNewLine", 0, "QCheckBox", u"להציג בשורה חדשה?"},
    {u"ChkTitle_11", 0, "QCheckBox", u"להציג טקסט קבוע מעל שם כרטיס?"},
    {u"ChkTitle_12", 0, "QCheckBox", u"להציג טקסט קבוע מתחת לשם כרטיס?"},
    {u"ChkTitle_0", 0, "QCheckBox", u" לכבוד"},
    {u"txtStartFrom", 0, "QLineEdit", nullptr},
    {u"ChkAllContact", 0, "QCheckBox", u"דיוור נפרד לכל איש קשר?"},
    {u"chkUseCntctAddrss", 0, "QCheckBox", u"אם כן, עדיפות ראשונה לכתובתו?"},
    {u"CmdDir_3", 1, "QToolButton", nullptr},
    {u"txtFaxFile", 1, "QLineEdit", nullptr},
    {u"chkFaxField_7", 1, "QCheckBox", nullptr},
    {u"LblFaxFormField_0", 1, "QLabel", u"CustomerName"},
    {u"LblFaxFormField_6", 1, "QLabel", u"Field6"},
    {u"LblFaxField_3", 1, "QLabel", u"מחלקה"},
    {u"txtFaxExpr_4", 1, "QLineEdit", nullptr},
    {u"FaxServerType", 1, "QGroupBox", u"שרת פקסים:"},
    {u"OptOLE_1", 1, "QRadioButton", u"WinFax Pro 10"},
    {u"OptOLE_2", 1, "QRadioButton", u"MS Fax Service (Win 2000 sp3 or Win XP)"},
    {u"CmdDir_1", 2, "QToolButton", nullptr},
    {u"CmdDir_2", 2, "QToolButton", nullptr},
    {u"txtEmailContent", 2, "QPlainTextEdit", nullptr},
    {u"OptEmailMethod_1", 2, "QRadioButton", u"דיוור נפרד לכל נמען"},
    {u"OptEmailMethod_2", 2, "QRadioButton", u"דיוור בקבוצות של "},
    {u"txtEmailToMainDesc", 2, "QLineEdit", nullptr},
    {u"LblCatCode", 3, "QLabel", u"השתייכות:"},
    {u"cmdSelectAccount", 3, "QPushButton", u"בחירת כרטיסים..."},
    {u"CmdSelectGroup", 3, "QPushButton", u"בחירת קבוצות השתייכות..."},
    {u"cmdQryGroup", 3, "QPushButton", u"בחירת מאפיינים..."},
    {u"cmdSelByFile", 3, "QPushButton", u"בחירה ע\"פ קובץ חיצוני..."},
    {u"ChkItems", 3, "QCheckBox", u"ע\"פ פריטים שנמכרו:"},
    {u"txtFromDocNum", 3, "QLineEdit", nullptr},
    {u"txtToItem", 3, "QLineEdit", nullptr},
    {u"ChkSelectAccount", 3, "QCheckBox", nullptr},
};

TEST_F(MainCardTest, EveryControlStandsOnItsPageWithItsKindAndCaption)
{
    for (const ControlCase& expected : kControls) {
        const QString name = QString::fromUtf16(expected.name);
        auto* control = card->findChild<QWidget*>(name);
        ASSERT_NE(control, nullptr) << name.toStdString();
        EXPECT_TRUE(control->inherits(expected.kind)) << name.toStdString();
        if (expected.page >= 0)
            EXPECT_TRUE(c().SSTab1->widget(expected.page)->isAncestorOf(control)) << name.toStdString();
        else
            EXPECT_FALSE(c().SSTab1->isAncestorOf(control)) << name.toStdString();
        if (!expected.caption)
            continue;
        QString text;
        if (auto button = qobject_cast<QAbstractButton*>(control))
            text = button->text();
        else if (auto label = qobject_cast<QLabel*>(control))
            text = label->text();
        else if (auto group = qobject_cast<QGroupBox*>(control))
            text = group->title();
        EXPECT_EQ(text, QString::fromUtf16(expected.caption)) << name.toStdString();
    }
}

TEST_F(MainCardTest, ListsHoldTheirEntriesInOrder)
{
    EXPECT_EQ(itemsOf(c().cmbOutType), (QStringList{u"מדבקות למעטפות"_s, u"מכתבים בפקס"_s, u"דואר אלקטרוני"_s,
                                                    u"לטלפונים סלולריים"_s, u"הדפסת מכתבים"_s}));
    EXPECT_EQ(itemsOf(c().cmbCS), (QStringList{u"לקוחות"_s, u"ספקים"_s, u"לידים"_s}));
    EXPECT_EQ(itemsOf(c().cmbByDoc), (QStringList{u"הופקו"_s, u"לא הופקו"_s}));
    EXPECT_EQ(itemsOf(c().cmbPhoneType), (QStringList{u"טלפון 1"_s, u"טלפון 2"_s, u"טלפון נייד"_s, u"פקס"_s,
                                                      u"טלפון נייד - איש קשר"_s}));
    EXPECT_EQ(itemsOf(c().CmbSortBy), (QStringList{u"מפתח לקוח"_s, u"שם לקוח"_s, u"עיר"_s, u"מיקוד"_s,
                                                   u"איש קשר ומיקוד"_s, u"טלפון סלולרי"_s}));
    EXPECT_EQ(itemsOf(c().CmbSortDir), (QStringList{u"עולה"_s, u"יורד"_s}));
    EXPECT_EQ(itemsOf(c().cmbLabFormat), (QStringList{u"תבנית סטנדרטית"_s, u"איש קשר מעל שם חברה"_s}));
    EXPECT_EQ(c().CmbDocType->count(), 9);
    EXPECT_EQ(c().CmbDocType->itemText(6), u"שיקים"_s);
    EXPECT_EQ(c().cmbAddressFrom->count(), 3);
    EXPECT_EQ(c().txtEmailContent->toPlainText(), u"שלום רב. מצורף מידע על המבצעים החדשים"_s);
}

TEST_F(MainCardTest, MergeRowsCarryTheirTags)
{
    for (int i = 0; i < 8; ++i)
        EXPECT_EQ(tagOf(c().chkFaxField[i]) == u"5"_s, i >= 4) << i;
    EXPECT_EQ(tagOf(c().LblFaxField[0]), u"CardName"_s);
    EXPECT_EQ(tagOf(c().LblFaxField[3]), u"Notes1"_s);
    EXPECT_EQ(tagOf(c().txtFaxExpr[7]), u"Field7"_s);
}

TEST_F(MainCardTest, ClickingTheDepartmentLabelTwiceReturnsToTheFirstCaptionAndTag)
{
    setTag(c().LblDept, u"0"_s);
    card->LblDept_Click();
    EXPECT_EQ(c().LblDept->text(), u"תפקיד"_s);
    EXPECT_EQ(tagOf(c().LblDept), u"1"_s);
    card->LblDept_Click();
    EXPECT_EQ(c().LblDept->text(), u"מחלקה"_s);
    EXPECT_EQ(tagOf(c().LblDept), u"0"_s);

    // A double click as the window system delivers it: press, release, double click, release.
    const QPointF inside(2, 2);
    for (const QEvent::Type type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease, QEvent::MouseButtonDblClick,
                                    QEvent::MouseButtonRelease}) {
        QMouseEvent event(type, inside, c().LblDept->mapToGlobal(inside), Qt::LeftButton,
                          type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(c().LblDept, &event);
    }
    EXPECT_EQ(tagOf(c().LblDept), u"1"_s) << "a double click is one click";

    setTag(c().LblDept, u"7"_s);
    card->LblDept_Click();
    EXPECT_EQ(tagOf(c().LblDept), u"7"_s) << "an unknown tag is left alone";
}

TEST_F(MainCardTest, LeavingTheCardTypeListForgetsTheChosenGroups)
{
    state.SelCardGroups = {CardGroupSel{}, CardGroupSel{100, true}, CardGroupSel{103, true}};
    QFocusEvent popup(QEvent::FocusOut, Qt::PopupFocusReason);
    QCoreApplication::sendEvent(c().cmbCS, &popup);
    EXPECT_EQ(state.SelCardGroups.size(), 3) << "opening the list's popup is not leaving it";
    QFocusEvent leave(QEvent::FocusOut, Qt::TabFocusReason);
    QCoreApplication::sendEvent(c().cmbCS, &leave);
    EXPECT_EQ(state.SelCardGroups.size(), 1);
}

TEST_F(MainCardTest, FilePickersUseTheirFiltersAndACancelLeavesTheBoxUnchanged)
{
    c().txtEmailHTMLBody->setText(u"/old/body.html"_s);
    files.answers = {QString(), u"/new/template.doc"_s, u"/new/attach.pdf"_s};
    card->CmdDir_Click(1);
    card->CmdDir_Click(3);
    card->CmdDir_Click(2);
    card->CmdDir_Click(4);
    EXPECT_EQ(c().txtEmailHTMLBody->text(), u"/old/body.html"_s);
    EXPECT_EQ(c().txtFaxFile->text(), u"/new/template.doc"_s);
    EXPECT_EQ(c().txtEmailAttachFile->text(), u"/new/attach.pdf"_s);
    ASSERT_EQ(files.calls.size(), 3);
    EXPECT_EQ(files.calls[0].filter, u"All Files (*.*)|*.*|HTML Files (*.htm,*.html)|*.htm;*.html"_s);
    EXPECT_EQ(files.calls[1].filter, u"All Files (*.*)|*.*|Word Files (*.doc)|*.doc"_s);
    EXPECT_EQ(files.calls[2].filter, u"All Files (*.*)|*.*"_s);
    for (const auto& call : files.calls)
        EXPECT_EQ(call.filterIndex, 2);
}

TEST_F(MainCardTest, SavingStoresTheOptionsAndShowsNothing)
{
    c().txtRows->setText(u"12"_s);
    card->CmdDef_Click();
    EXPECT_EQ(store->value(u"Pelmar"_s, u"Params"_s, u"Rows"_s, {}), u"12"_s);
    EXPECT_TRUE(messages.boxes.isEmpty());
}

TEST_F(MainCardTest, TheProgressFillTakesItsShareOfTheFrame)
{
    c().ProgressFrame->resize(200, 14);
    card->setProgress(1, 4);
    EXPECT_EQ(c().ProgressFill->width(), 50);
    card->setProgress(0, 0);
    EXPECT_EQ(c().ProgressFill->width(), 0);
}

TEST_F(MainCardTest, InitialisationLoadsTheOptionsAndShowsTheCriteriaPage)
{
    store->setValue(u"Pelmar"_s, u"Params"_s, u"DeptField"_s, u"1"_s);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"Rows"_s, u"10"_s);
    state.SelCardGroups = {CardGroupSel{}, CardGroupSel{100, true}};
    state.CardListSQL = u"SELECT 1"_s;
    card->UserControl_Initialize();
    EXPECT_EQ(c().txtRows->text(), u"10"_s);
    EXPECT_EQ(c().LblDept->text(), u"תפקיד"_s);
    EXPECT_EQ(c().SSTab1->currentIndex(), 3);
    EXPECT_EQ(state.SelCardGroups.size(), 1);
    EXPECT_TRUE(state.CardListSQL.isEmpty());
    EXPECT_EQ(state.ConnDataBase, u"tarvel02"_s);
    EXPECT_EQ(state.ConnServer, u"server"_s);
    EXPECT_TRUE(messages.boxes.isEmpty());
}

}  // namespace
}  // namespace pelmar::test

namespace pelmar::test {
namespace {

TEST_F(MainCardTest, TheStatementIsBuiltFromWhatThePagesHold)
{
    card->SetGetRegParams(kLoad);
    c().ChkCity->setChecked(true);
    c().TxtCity->setText(u"חי"_s);
    c().cmbAddressFrom->setCurrentIndex(1);
    c().CmbAgent->addItem(u"דנה"_s, 7);
    c().ChkAgent->setChecked(true);
    c().CmbAgent->setCurrentIndex(0);
    c().chkFaxField[5]->setChecked(true);
    c().txtFaxExpr[5]->setText(u"OCRD.Notes"_s);
    EXPECT_EQ(card->BuildWhere(), u" Where (1 > 0) AND OCRD.City LIKE N'חי%' AND OCRD.SlpCode = 7"_s);
    EXPECT_TRUE(card->BuildSelect(0, false, 3).contains(u", OCRD.Notes As Field5 FROM"_s));
    EXPECT_EQ(card->recipientStatement(1, false, true),
              card->BuildSelect(0, false, 1) + card->BuildWhere() + card->BuildOrderBy(0, 1));

    state.WantedCrd = {u"C1"_s};
    EXPECT_FALSE(card->selectionFilter());
    c().ChkSelectAccount->setChecked(true);
    EXPECT_TRUE(card->selectionFilter());
    EXPECT_TRUE(card->IsSelectedCard(u"C1"_s));
}

}  // namespace
}  // namespace pelmar::test
