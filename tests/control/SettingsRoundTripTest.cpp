#include "control/ClickableLabel.h"
#include "control/SetGetCtrl.h"
#include "control/Tag.h"
#include "support/MainCardFixture.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QRadioButton>

#include <sys/stat.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

// The controls whose state the settings keep, by name.
QStringList savedControls()
{
    QStringList names = {
        u"cmbOutType"_s, u"ChkCatCode"_s, u"cmbCS"_s, u"ChkAccKey"_s, u"TxtFromCrd"_s, u"TxtToCrd"_s,
        u"ChkCity"_s, u"TxtCity"_s, u"ChkPhone"_s, u"txtPhone"_s, u"ChkAgent"_s, u"CmbAgent"_s,
        u"ChkDates"_s, u"TxtFromDate"_s, u"TxtToDate"_s, u"CmbDocType"_s, u"ChkUseSQLW"_s, u"txtSQLWhere"_s,
        u"ChkAddressBySQL"_s, u"txtSQLAddress"_s, u"txtRows"_s, u"txtCols"_s, u"txtCopies"_s, u"CmbSortBy"_s,
        u"CmbSortDir"_s, u"cmbByDoc"_s, u"LblDept"_s, u"chkShowAttn"_s, u"chkDeptNewLine"_s,
        u"ChkAllContact"_s, u"chkUseCntctAddrss"_s, u"cmbAddressFrom"_s, u"cmbPhoneType"_s, u"cmbLabFormat"_s,
        u"txtFaxSubject"_s, u"txtFaxDelay"_s, u"TxtLocalAreaPrefix"_s, u"OptOLE_1"_s, u"OptOLE_2"_s,
        u"txtFaxFile"_s, u"txtEmailAttachFile"_s, u"txtEmailAttachFileDesc"_s, u"txtEmailFrom"_s,
        u"txtEmailFromDesc"_s, u"txtEmailGroupSize"_s, u"txtEmailHTMLBody"_s, u"txtEmailSubject"_s,
        u"txtEmailToMain"_s, u"txtEmailToMainDesc"_s, u"OptEmailMethod_1"_s, u"OptEmailMethod_2"_s};
    for (int i = 0; i < 13; ++i)
        names << u"ChkTitle_%1"_s.arg(i);
    for (int i = 0; i < 8; ++i)
        names << u"chkFaxField_%1"_s.arg(i);
    for (int i = 4; i < 8; ++i)
        names << u"txtFaxExpr_%1"_s.arg(i);
    return names;
}

QString stateOf(const QWidget* control)
{
    if (auto edit = qobject_cast<const QLineEdit*>(control))
        return u"text:"_s + edit->text();
    if (auto combo = qobject_cast<const QComboBox*>(control))
        return u"index:"_s + QString::number(combo->currentIndex());
    if (auto button = qobject_cast<const QAbstractButton*>(control))
        return button->isChecked() ? u"on"_s : u"off"_s;
    return u"tag:"_s + tagOf(control);
}

QMap<QString, QString> snapshot(const QWidget& card)
{
    QMap<QString, QString> states;
    for (const QString& name : savedControls()) {
        const auto* control = card.findChild<QWidget*>(name);
        states[name] = control ? stateOf(control) : u"<missing>"_s;
    }
    return states;
}

// Moves every saved control away from its default.
void changeEverything(MainCard& card)
{
    for (const QString& name : savedControls()) {
        auto* control = card.findChild<QWidget*>(name);
        if (auto edit = qobject_cast<QLineEdit*>(control))
            edit->setText(u"ערך '%1'"_s.arg(name));
        else if (auto combo = qobject_cast<QComboBox*>(control))
            combo->setCurrentIndex(combo->count() - 1);
        else if (auto check = qobject_cast<QCheckBox*>(control))
            check->setChecked(!check->isChecked());
    }
    card.findChild<QRadioButton*>(u"OptOLE_2"_s)->setChecked(true);
    card.findChild<QRadioButton*>(u"OptEmailMethod_2"_s)->setChecked(true);
    card.LblDept_Click();
}

class SettingsRoundTrip : public MainCardTest {};

TEST_F(SettingsRoundTrip, SavingThenLoadingGivesBackEveryControlState)
{
    card->SetGetRegParams(kLoad);
    changeEverything(*card);
    const auto changed = snapshot(*card);
    card->SetGetRegParams(kSave);

    auto fresh = makeCard();
    ASSERT_NE(snapshot(*fresh), changed);
    fresh->SetGetRegParams(kLoad);
    EXPECT_EQ(snapshot(*fresh), changed);
}

TEST_F(SettingsRoundTrip, AnEmptyStoreShowsTheDefaults)
{
    card->SetGetRegParams(kLoad);
    const auto states = snapshot(*card);
    const QMap<QString, QString> expected = {
        {u"txtRows"_s, u"text:8"_s}, {u"txtCols"_s, u"text:3"_s}, {u"txtCopies"_s, u"text:1"_s},
        {u"chkShowAttn"_s, u"on"_s}, {u"cmbAddressFrom"_s, u"index:2"_s}, {u"txtFaxDelay"_s, u"text:5"_s},
        {u"TxtLocalAreaPrefix"_s, u"text:04"_s}, {u"txtEmailGroupSize"_s, u"text:20"_s},
        {u"OptOLE_1"_s, u"on"_s}, {u"OptOLE_2"_s, u"off"_s}, {u"OptEmailMethod_1"_s, u"on"_s},
        {u"OptEmailMethod_2"_s, u"off"_s}, {u"TxtFromDate"_s, u"text:01/01/1980"_s},
        {u"TxtToDate"_s, u"text:01/01/2025"_s}, {u"txtFaxSubject"_s, u"text:מבצע השבוע"_s},
        {u"txtFaxFile"_s, u"text:c:\\mivtza1.doc"_s}, {u"LblDept"_s, u"tag:0"_s},
        {u"cmbOutType"_s, u"index:0"_s}, {u"ChkTitle_3"_s, u"off"_s}, {u"CmbAgent"_s, u"index:-1"_s}};
    for (auto it = expected.begin(); it != expected.end(); ++it)
        EXPECT_EQ(states.value(it.key()), it.value()) << it.key().toStdString();
}

TEST_F(SettingsRoundTrip, SavingWritesEveryKeyWithItsValueText)
{
    card->SetGetRegParams(kLoad);
    card->SetGetRegParams(kSave);
    const auto key = [&](const QString& name) { return store->value(u"Pelmar"_s, u"Params"_s, name, u"<none>"_s); };
    EXPECT_EQ(key(u"OutType"_s), u"0"_s);
    EXPECT_EQ(key(u"ShowAttn"_s), u"1"_s);
    EXPECT_EQ(key(u"UseTitle12"_s), u"0"_s);
    EXPECT_EQ(key(u"OptOLE1"_s), u"True"_s);
    EXPECT_EQ(key(u"OptOLE2"_s), u"False"_s);
    EXPECT_EQ(key(u"DeptField"_s), u"0"_s);
    EXPECT_EQ(key(u"Agent"_s), u"-1"_s);
    EXPECT_EQ(key(u"FaxExpr4"_s), u""_s);
    EXPECT_EQ(key(u"FaxExpr3"_s), u"<none>"_s) << "a fixed merge row has no expression key";
    EXPECT_EQ(key(u"UseFaxField7"_s), u"0"_s);
    EXPECT_EQ(key(u"EmailSubject"_s), u"מבצעי השבוע"_s);
    EXPECT_EQ(key(u"ConnPWD"_s), u"<none>"_s) << "connection keys belong to the logon dialog";

    struct stat info {};
    ASSERT_EQ(::stat(store->filePath(u"Pelmar"_s).toLocal8Bit().constData(), &info), 0);
    EXPECT_EQ(info.st_mode & 0777, 0600u);
}

TEST_F(SettingsRoundTrip, TheExpressionKeyFollowsTheTagOfTheRowsBox)
{
    setTag(c().chkFaxField[1], u"5"_s);
    setTag(c().chkFaxField[5], u"1"_s);
    c().txtFaxExpr[1]->setText(u"OCRD.Phone2"_s);
    card->SetGetRegParams(kSave);
    EXPECT_EQ(store->value(u"Pelmar"_s, u"Params"_s, u"FaxExpr1"_s, u"<none>"_s), u"OCRD.Phone2"_s);
    EXPECT_FALSE(store->contains(u"Pelmar"_s, u"Params"_s, u"FaxExpr5"_s));
}

TEST_F(SettingsRoundTrip, AnActionOtherThanSaveOrLoadTouchesNothing)
{
    changeEverything(*card);
    const auto before = snapshot(*card);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"Rows"_s, u"4"_s);
    card->SetGetRegParams(3);
    EXPECT_EQ(snapshot(*card), before);
    EXPECT_FALSE(store->contains(u"Pelmar"_s, u"Params"_s, u"Cols"_s));
}

TEST_F(SettingsRoundTrip, AValueAControlCannotTakeLeavesItAndLoadingGoesOn)
{
    c().cmbOutType->setCurrentIndex(3);
    c().ChkCatCode->setChecked(true);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"OutType"_s, u"9"_s);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"UseCatCode"_s, u"yes"_s);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"CS"_s, u"2"_s);
    card->SetGetRegParams(kLoad);
    EXPECT_EQ(c().cmbOutType->currentIndex(), 3);
    EXPECT_TRUE(c().ChkCatCode->isChecked());
    EXPECT_EQ(c().cmbCS->currentIndex(), 2);
}

TEST_F(SettingsRoundTrip, ATrueFaxServiceOptionTurnsWinFaxOffThroughTheGroup)
{
    store->setValue(u"Pelmar"_s, u"Params"_s, u"OptOLE1"_s, u"False"_s);
    store->setValue(u"Pelmar"_s, u"Params"_s, u"OptOLE2"_s, u"True"_s);
    card->SetGetRegParams(kLoad);
    EXPECT_FALSE(c().OptOLE[1]->isChecked());
    EXPECT_TRUE(c().OptOLE[2]->isChecked());
    EXPECT_EQ(card->GetOLEOption(), 2);

    store->setValue(u"Pelmar"_s, u"Params"_s, u"OptOLE2"_s, u"False"_s);
    card->SetGetRegParams(kLoad);
    EXPECT_EQ(card->GetOLEOption(), 0) << "both stored false leave no transport chosen";
}

}  // namespace
}  // namespace pelmar::test
