#include "common/SessionState.h"
#include "options/OptionBindings.h"
#include "selection/WhereBuilder.h"
#include "support/ui/ModalCloser.h"
#include "support/ui/WindowFixture.h"
#include "widgets/ClickableLabel.h"
#include "widgets/QtTranslation.h"
#include "widgets/Tag.h"

#include <QAbstractButton>
#include <QCheckBox>
#include <QComboBox>
#include <QCoreApplication>
#include <QDialogButtonBox>
#include <QFocusEvent>
#include <QFrame>
#include <QLabel>
#include <QLineEdit>
#include <QMessageBox>
#include <QMouseEvent>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTabWidget>
#include <QTranslator>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

// Changes a control the way the user would, to the text form given.
void change(QWidget* control, const QString& text)
{
    if (auto* edit = qobject_cast<QLineEdit*>(control))
        edit->setText(text);
    else if (auto* plain = qobject_cast<QPlainTextEdit*>(control))
        plain->setPlainText(text);
    else if (auto* combo = qobject_cast<QComboBox*>(control))
        combo->setCurrentIndex(text.toInt());
    else if (auto* radio = qobject_cast<QRadioButton*>(control))
        radio->setChecked(true);
    else if (auto* check = qobject_cast<QCheckBox*>(control))
        check->setChecked(text == u"1"_s);
}

TEST_F(MainCardTest, EveryOptionHasItsControlAndBothFollowEachOther)
{
    store->setValue(u"Pelmar"_s, u"Params"_s, u"Rows"_s, u"12"_s);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"OptOLE2"_s, u"True"_s);
    card->UserControl_Initialize();
    EXPECT_EQ(control<QLineEdit>(u"txtRows"_s)->text(), u"12"_s) << "the loaded options are shown";
    EXPECT_TRUE(control<QRadioButton>(u"OptOLE_2"_s)->isChecked());
    EXPECT_FALSE(control<QRadioButton>(u"OptOLE_1"_s)->isChecked());

    for (const OptionBinding& binding : optionBindings()) {
        if (binding.kind == OptionKind::Tag)
            continue;
        auto* widget = card->findChild<QWidget*>(binding.control);
        ASSERT_NE(widget, nullptr) << binding.control.toStdString();
        const QString text = binding.kind == OptionKind::ListIndex
            ? QString::number(binding.entries(card->options()) - 1)
            : binding.kind == OptionKind::Check ? (optionText(binding, card->options()) == u"1"_s ? u"0"_s : u"1"_s)
                                                : u"ערך של "_s + binding.control;
        change(widget, text);
        if (binding.kind == OptionKind::Choice)
            EXPECT_EQ(optionText(binding, card->options()), u"True"_s) << binding.control.toStdString();
        else
            EXPECT_EQ(optionText(binding, card->options()), text) << binding.control.toStdString();
    }
    EXPECT_EQ(card->options().faxTransport, 2) << "the last button clicked of each group is the chosen one";
}

TEST_F(MainCardTest, TheCriteriaThePagesHoldAreTheStatementsCriteria)
{
    store->setValue(u"Pelmar"_s, u"Params"_s, u"UseCity"_s, u"1"_s);
    card->UserControl_Initialize();
    control<QLineEdit>(u"TxtCity"_s)->setText(u"חי"_s);
    control<QComboBox>(u"cmbAddressFrom"_s)->setCurrentIndex(1);
    EXPECT_EQ(BuildWhere(card->options(), state), u" Where (1 > 0) AND OCRD.City LIKE N'חי%'"_s);
}

TEST_F(MainCardTest, ClickingTheDepartmentLabelTwiceReturnsToTheFirstCaptionAndTag)
{
    card->LblDept_Click();
    EXPECT_EQ(c().LblDept->text(), u"תפקיד"_s);
    EXPECT_EQ(card->options().deptTag, u"1"_s);
    card->LblDept_Click();
    EXPECT_EQ(c().LblDept->text(), u"מחלקה"_s);
    EXPECT_EQ(card->options().deptTag, u"0"_s);

    // A double click as the window system delivers it: press, release, double click, release.
    const QPointF inside(2, 2);
    for (const QEvent::Type type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease, QEvent::MouseButtonDblClick,
                                    QEvent::MouseButtonRelease}) {
        QMouseEvent event(type, inside, c().LblDept->mapToGlobal(inside), Qt::LeftButton,
                          type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(c().LblDept, &event);
    }
    EXPECT_EQ(card->options().deptTag, u"1"_s) << "a double click is one click";
    EXPECT_EQ(tagOf(c().LblDept), u"1"_s);

    store->setValue(u"Pelmar"_s, u"Params"_s, u"DeptField"_s, u"7"_s);
    card->UserControl_Initialize();
    card->LblDept_Click();
    EXPECT_EQ(card->options().deptTag, u"7"_s) << "an unknown tag is left alone";
    EXPECT_EQ(c().LblDept->text(), u"תפקיד"_s) << "and so is the caption";
}

TEST_F(MainCardTest, LeavingTheCardTypeListForgetsTheChosenGroups)
{
    state.SelCardGroups = {CardGroupSel{}, CardGroupSel{100, true}, CardGroupSel{103, true}};
    QFocusEvent popup(QEvent::FocusOut, Qt::PopupFocusReason);
    QCoreApplication::sendEvent(c().cmbCS, &popup);
    EXPECT_EQ(state.SelCardGroups.size(), 3) << "opening the list's popup is not leaving it";
    QFocusEvent away(QEvent::FocusOut, Qt::ActiveWindowFocusReason);
    QCoreApplication::sendEvent(c().cmbCS, &away);
    EXPECT_EQ(state.SelCardGroups.size(), 3) << "switching to another window is not leaving the list";
    QFocusEvent leave(QEvent::FocusOut, Qt::TabFocusReason);
    QCoreApplication::sendEvent(c().cmbCS, &leave);
    EXPECT_EQ(state.SelCardGroups.size(), 1);

    state.SelCardGroups = {CardGroupSel{}, CardGroupSel{100, true}};
    c().cmbCS->activated(1);
    EXPECT_EQ(state.SelCardGroups.size(), 1) << "choosing another card type forgets the groups";
}

TEST_F(MainCardTest, FilePickersUseTheirFiltersAndACancelLeavesTheBoxUnchanged)
{
    c().txtEmailHTMLBody->setText(u"/old/body.html"_s);
    files.answers = {QString(), u"/new/template.doc"_s, u"/new/attach.pdf"_s};
    card->CmdDir_Click(1);
    card->CmdDir_Click(3);
    card->CmdDir_Click(2);
    card->CmdDir_Click(4);
    EXPECT_EQ(card->options().emailHtmlBody, u"/old/body.html"_s);
    EXPECT_EQ(card->options().faxFile, u"/new/template.doc"_s);
    EXPECT_EQ(card->options().emailAttachFile, u"/new/attach.pdf"_s);
    ASSERT_EQ(files.calls.size(), 3);
    EXPECT_EQ(files.calls[0].filter, u"All Files (*.*)|*.*|HTML Files (*.htm,*.html)|*.htm;*.html"_s);
    EXPECT_EQ(files.calls[1].filter, u"All Files (*.*)|*.*|Word Files (*.doc)|*.doc"_s);
    EXPECT_EQ(files.calls[2].filter, u"All Files (*.*)|*.*"_s);
    for (const auto& call : files.calls)
        EXPECT_EQ(call.filterIndex, 2);
}

TEST_F(MainCardTest, SavingStoresWhatThePagesHoldAndShowsNothing)
{
    control<QLineEdit>(u"txtRows"_s)->setText(u"12"_s);
    card->CmdDef_Click();
    EXPECT_EQ(store->value(u"Pelmar"_s, u"Params"_s, u"Rows"_s, {}), u"12"_s);
    EXPECT_TRUE(messages.boxes.isEmpty());
}

TEST_F(MainCardTest, TheDepartmentCaptionLooksLikeTheLinkItIs)
{
    EXPECT_TRUE(c().LblDept->font().underline());
    EXPECT_EQ(c().LblDept->foregroundRole(), QPalette::Link);
    EXPECT_EQ(c().LblDept->cursor().shape(), Qt::PointingHandCursor);
}

TEST_F(MainCardTest, ClosingWithUnsavedOptionsAsksToSaveThemAndCancelStays)
{
    QStringList asked;
    QMessageBox::StandardButton answer = QMessageBox::Cancel;
    const ModalCloser closer([&](QDialog& dialog) {
        auto* box = qobject_cast<QMessageBox*>(&dialog);
        ASSERT_NE(box, nullptr);
        asked << box->text();
        box->button(answer)->click();
    });
    EXPECT_TRUE(card->mayClose());
    EXPECT_TRUE(asked.isEmpty()) << "nothing changed, nothing to ask";
    control<QLineEdit>(u"txtRows"_s)->setText(u"12"_s);
    EXPECT_FALSE(card->mayClose());
    EXPECT_EQ(asked, QStringList{u"ההגדרות שבדפים שונו ולא נשמרו. לשמור אותן?"_s});
    answer = QMessageBox::No;
    EXPECT_TRUE(card->mayClose());
    EXPECT_EQ(store->value(u"Pelmar"_s, u"Params"_s, u"Rows"_s, u"<none>"_s), u"<none>"_s);
    answer = QMessageBox::Yes;
    EXPECT_TRUE(card->mayClose());
    EXPECT_EQ(store->value(u"Pelmar"_s, u"Params"_s, u"Rows"_s, {}), u"12"_s);
    EXPECT_EQ(asked.size(), 3);
    EXPECT_TRUE(card->mayClose()) << "saved: nothing to ask";
    EXPECT_EQ(asked.size(), 3);
}

TEST_F(MainCardTest, QtsOwnButtonsSpeakHebrew)
{
    QTranslator hebrew;
    ASSERT_TRUE(installQtHebrew(hebrew)) << "Qt's Hebrew translations are not installed";
    QDialogButtonBox buttons(QDialogButtonBox::Yes | QDialogButtonBox::No | QDialogButtonBox::Cancel);
    EXPECT_EQ(buttons.button(QDialogButtonBox::Yes)->text().remove(u'&'), u"כן"_s);
    EXPECT_EQ(buttons.button(QDialogButtonBox::No)->text().remove(u'&'), u"לא"_s);
    QCoreApplication::removeTranslator(&hebrew);
}

TEST_F(MainCardTest, TheProgressDisplayShowsTheTextAndTheShareOfTheFrame)
{
    c().ProgressFrame->resize(200, 14);
    card->report(u"שולח 1 מתוך 4"_s, 0.25);
    EXPECT_EQ(c().ProgressFill->width(), 50);
    EXPECT_EQ(c().ProgressFill->x(), 150) << "right to left, the fill grows from the right";
    EXPECT_EQ(c().Message1->text(), u"שולח 1 מתוך 4"_s);
    card->report({}, 0);
    EXPECT_EQ(c().ProgressFill->width(), 0);
}

TEST_F(MainCardTest, InitialisationShowsTheStoredOptionsAndTheCriteriaPage)
{
    store->setValue(u"Pelmar"_s, u"Params"_s, u"DeptField"_s, u"1"_s);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"Rows"_s, u"10"_s);
    card->UserControl_Initialize();
    EXPECT_EQ(control<QLineEdit>(u"txtRows"_s)->text(), u"10"_s);
    EXPECT_EQ(c().LblDept->text(), u"תפקיד"_s);
    EXPECT_EQ(c().SSTab1->currentIndex(), 3);
    EXPECT_TRUE(messages.boxes.isEmpty());
}

}  // namespace
}  // namespace pelmar::test
