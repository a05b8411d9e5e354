#include "common/Failure.h"
#include "options/MailingOptions.h"
#include "selection/PickerData.h"
#include "selection/WhereBuilder.h"
#include "selection/ui/GroupPickers.h"
#include "selection/ui/SelectByFileDialog.h"
#include "selection/ui/SelectCardDialog.h"
#include "support/CompanyRows.h"
#include "support/Engines.h"
#include "support/ui/ModalCloser.h"
#include "support/ui/WindowFixture.h"

#include <QCheckBox>
#include <QComboBox>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QStyle>
#include <QTableView>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class PickersTest : public MainCardTest {
protected:
    void SetUp() override
    {
        MainCardTest::SetUp();
        CompanyOptions options;
        options.cards = 60;
        options.properties = 20;
        engine->createCompany(u"pickers"_s, options);
        state.ConnServer = engine->server();
        state.ConnUID = engine->user();
        state.ConnDataBase = u"pickers"_s;
    }

    Services services() { return Services{messages, browser, files, *store, engine->client()}; }
    QString conn() const { return engine->connString(u"pickers"_s); }

    static QStringList texts(const CheckListModel& model, int textIndex = 0)
    {
        QStringList found;
        for (const auto& row : model.rows())
            found << row.texts.value(textIndex);
        return found;
    }

    std::unique_ptr<Engine> engine = makeSqliteEngine();
};

TEST_F(PickersTest, EachCardTypeListsItsGroupsAndLeadsListTheCustomerGroups)
{
    const std::pair<short, QStringList> cases[] = {
        {0, {u"לקוחות רגילים"_s, u"לקוחות VIP"_s, u"סיטונאים"_s, u"Export"_s, u"מוסדות"_s}},
        {1, {u"ספקים מקומיים"_s, u"ספקי חו\"ל"_s, u"קבלני משנה"_s, u"-"_s}},
        {2, {u"לקוחות רגילים"_s, u"לקוחות VIP"_s, u"סיטונאים"_s, u"Export"_s, u"מוסדות"_s}},
    };
    for (const auto& [type, names] : cases) {
        state.GroupCardType = type;
        CardGroupDialog dialog(services(), state, conn());
        EXPECT_EQ(texts(dialog.model), names) << type;
    }
}

TEST_F(PickersTest, AChoiceComesBackOnReopeningAndCancelKeepsTheStoredOne)
{
    state.GroupCardType = 0;
    {
        CardGroupDialog dialog(services(), state, conn());
        dialog.model.setChecked(0, true);
        dialog.model.setChecked(3, true);
        dialog.cmdOK_Click();
    }
    MailingOptions customers;
    customers.catCode = true;
    EXPECT_EQ(BuildWhere(customers, state),
              u" Where (1 > 0) AND OCRD.CardType = 'C' AND (GroupCode=100 OR GroupCode=103)"_s);
    {
        CardGroupDialog dialog(services(), state, conn());
        EXPECT_EQ(dialog.model.checkedKeys(), (QStringList{u"100"_s, u"103"_s}));
        dialog.buttons.cmdRevert->click();
        dialog.reject();
    }
    {
        CardGroupDialog dialog(services(), state, conn());
        EXPECT_EQ(dialog.model.checkedKeys(), (QStringList{u"100"_s, u"103"_s})) << "cancel stored nothing";
        dialog.buttons.cmdNone->click();
        EXPECT_TRUE(dialog.model.checkedKeys().isEmpty());
        dialog.buttons.cmdAll->click();
        EXPECT_EQ(dialog.model.checkedKeys().size(), 5);
    }
    card->cmbCS_Validate();
    MailingOptions suppliers;
    suppliers.catCode = true;
    suppliers.cardType = 1;
    EXPECT_EQ(BuildWhere(suppliers, state), u" Where (1 > 0) AND OCRD.CardType = 'S'"_s);

    state.SelCardGroups
        = {CardGroupSel{}, {100, false}, {101, false}, {102, false}, {103, false}, {104, false}, {199, true}};
    state.GroupCardType = 1;
    CardGroupDialog supplierGroups(services(), state, conn());
    EXPECT_EQ(state.SelCardGroups.size(), 5) << "the selection is cut to the rows of the list";
}

TEST_F(PickersTest, GroupsThatCannotBeReadLeaveTheStoredChoiceAsItWas)
{
    state.GroupCardType = 0;
    state.SelCardGroups = {CardGroupSel{}, {100, true}, {103, true}};
    for (const bool ok : {false, true}) {
        CardGroupDialog dialog(services(), state, engine->connString(u"missing"_s));
        EXPECT_EQ(dialog.model.rowCount(), 0);
        ok ? dialog.cmdOK_Click() : dialog.reject();
        EXPECT_EQ(state.SelCardGroups.size(), 3) << ok;
    }
    ASSERT_EQ(messages.boxes.size(), 2);
    EXPECT_EQ(messages.boxes[0].kind, u"plain"_s);
    MailingOptions customers;
    customers.catCode = true;
    EXPECT_EQ(BuildWhere(customers, state),
              u" Where (1 > 0) AND OCRD.CardType = 'C' AND (GroupCode=100 OR GroupCode=103)"_s);
}

TEST_F(PickersTest, TextsAndHeadersStandAtTheRightOfARightToLeftGrid)
{
    state.GroupCardType = 0;
    CardGroupDialog groups(services(), state, conn());
    QryGroupDialog properties(services(), state, conn());
    for (QTableView* grid : {groups.CardGroups, properties.QryGroups}) {
        ASSERT_EQ(grid->layoutDirection(), Qt::RightToLeft);
        const auto shown = [&](QVariant alignment) {
            return QStyle::visualAlignment(grid->layoutDirection(), alignment.value<Qt::Alignment>())
                & (Qt::AlignLeft | Qt::AlignRight);
        };
        EXPECT_EQ(shown(grid->model()->index(0, 0).data(Qt::TextAlignmentRole)), Qt::AlignRight);
        EXPECT_EQ(shown(QVariant::fromValue(grid->horizontalHeader()->defaultAlignment())), Qt::AlignRight);
    }
}

TEST_F(PickersTest, TheGroupButtonNeedsACardTypeAndTicksTheCriterion)
{
    c().cmbCS->setCurrentIndex(-1);
    card->CmdSelectGroup_Click();
    EXPECT_FALSE(c().ChkCatCode->isChecked());

    c().cmbCS->setCurrentIndex(1);
    QString title;
    const ModalCloser closer([&](QDialog& dialog) {
        title = dialog.objectName();
        dialog.reject();
    });
    card->CmdSelectGroup_Click();
    EXPECT_EQ(title, u"frmCardGroup"_s);
    EXPECT_TRUE(c().ChkCatCode->isChecked());
    EXPECT_EQ(state.GroupCardType, 1);
    card->cmdQryGroup_Click();
    EXPECT_EQ(title, u"frmQryGroup"_s);
    EXPECT_TRUE(c().chkQryGroup->isChecked());
}

TEST_F(PickersTest, PropertiesListAllSixtyFourAndTheRelationComesBack)
{
    {
        QryGroupDialog dialog(services(), state, conn());
        ASSERT_EQ(dialog.model.rowCount(), 64) << "OCQG names only 20 of them";
        EXPECT_EQ(dialog.model.row(2).texts, QStringList{u"מאפיין 3"_s});
        EXPECT_EQ(dialog.model.row(12).texts, QStringList{u"-"_s}) << "an empty name";
        EXPECT_EQ(dialog.model.row(40).texts, QStringList{u"-"_s}) << "a property OCQG does not list";
        EXPECT_TRUE(dialog.Option2->isChecked()) << "no relation yet reads as AND";
        dialog.model.setChecked(2, true);
        dialog.model.setChecked(63, true);
        dialog.Option1->setChecked(true);
        dialog.cmdOK_Click();
    }
    EXPECT_EQ(BuildQryGroupCriteria(state), u" And (OCRD.QryGroup3='Y' OR OCRD.QryGroup64='Y')"_s);
    QryGroupDialog again(services(), state, conn());
    EXPECT_TRUE(again.Option1->isChecked());
    EXPECT_EQ(again.model.checkedKeys(), (QStringList{u"3"_s, u"64"_s}));
}

TEST_F(PickersTest, TheCardPickerListsSearchesSortsAndStoresTheCheckedCodesInGridOrder)
{
    engine->createDatabase(
        u"cards"_s,
        handMadeCompany(900000,
                        {insertRow(u"OCRD"_s, {{u"CardCode"_s, u"C003"_s}, {u"CardName"_s, u"gamma"_s}}),
                         insertRow(u"OCRD"_s, {{u"CardCode"_s, u"   "_s}, {u"CardName"_s, u"no code"_s}}),
                         insertRow(u"OCRD"_s, {{u"CardCode"_s, u"C001"_s}, {u"CardName"_s, u"Beta"_s}}),
                         insertRow(u"OCRD"_s, {{u"CardCode"_s, u"C002"_s}, {u"CardName"_s, u""_s}}),
                         insertRow(u"OCRD"_s, {{u"CardCode"_s, u"c004"_s}, {u"CardName"_s, u"alpha"_s}}),
                         insertRow(u"OCRD"_s, {{u"CardCode"_s, u"C005"_s}, {u"CardName"_s, u"אלף"_s}})}));
    QStringList opened;
    SelectCardDialog picker(services(), state, [&](const QString& code) { opened << code; });
    picker.FillCardList(engine->connString(u"cards"_s),
                        u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName FROM OCRD ORDER BY CardCode"_s);
    EXPECT_EQ(texts(picker.model), (QStringList{u"C001"_s, u"C002"_s, u"C003"_s, u"C005"_s, u"c004"_s}));
    EXPECT_EQ(picker.model.row(1).texts[1], u"-"_s);

    picker.txtToItemkey->setText(u"C00"_s);
    picker.cmdFindKey_Click();
    picker.txtToItemName->setText(u"ALP"_s);
    picker.cmdFindByDesc_Click();
    EXPECT_EQ(picker.model.checkedKeys(), (QStringList{u"C001"_s, u"c004"_s}));
    EXPECT_EQ(picker.VSSelectItems->currentIndex().row(), 4);
    picker.openCurrentCard();
    EXPECT_EQ(opened, QStringList{u"c004"_s});
    picker.txtToItemName->setText(u"zzz"_s);
    picker.cmdFindByDesc_Click();
    EXPECT_EQ(picker.model.checkedKeys().size(), 2) << "a search that finds nothing changes nothing";

    picker.cmdShowMarked_Click();
    EXPECT_EQ(texts(picker.model), (QStringList{u"c004"_s, u"C001"_s, u"C002"_s, u"C003"_s, u"C005"_s}));
    picker.cmdShowAll_Click();
    EXPECT_EQ(texts(picker.model, 1), (QStringList{u"-"_s, u"alpha"_s, u"Beta"_s, u"gamma"_s, u"אלף"_s}));
    picker.cmdOK_Click();
    EXPECT_EQ(state.WantedCrd, (QStringList{u"c004"_s, u"C001"_s})) << "grid order, not the order of checking";

    picker.CmdAllItems_Click();
    picker.cmdNoneItems_Click();
    picker.cmdOK_Click();
    EXPECT_TRUE(state.WantedCrd.isEmpty());
}

TEST_F(PickersTest, NoToTheRescanQuestionKeepsThePickerAndItsMarks)
{
    const ModalCloser closer;
    c().ChkItems->setChecked(true);
    card->cmdSelectAccount_Click();
    EXPECT_TRUE(c().ChkSelectAccount->isChecked());
    EXPECT_FALSE(c().ChkItems->isChecked());
    ASSERT_NE(card->cardPicker(), nullptr);
    EXPECT_EQ(card->cardPicker()->model.rowCount(), 60);
    card->cardPicker()->model.setChecked(4, true);
    SelectCardDialog* first = card->cardPicker();

    messages.answers = {false};
    card->cmdSelectAccount_Click();
    EXPECT_EQ(messages.boxes.back(),
              (FakeMessages::Box{u"question"_s, u"שימו לב"_s, u"לסרוק מחדש את רשימת הכרטיסים?"_s}));
    EXPECT_EQ(card->cardPicker(), first);
    EXPECT_EQ(card->cardPicker()->model.checkedKeys().size(), 1);

    messages.answers = {true};
    card->cmdSelectAccount_Click();
    EXPECT_TRUE(card->cardPicker()->model.checkedKeys().isEmpty()) << "a rebuilt list starts unchecked";
}

class CardFileTest : public MainCardTest {
protected:
    QString file(const QByteArray& bytes) const { return fileWith(u"cards.txt"_s, bytes); }
};

TEST_F(CardFileTest, TheDialogReadsCountsAndCopiesOnOkWithItsOptionsSaved)
{
    SelectByFileDialog dialog(Services{messages, browser, files, *store, database}, state);
    EXPECT_EQ(dialog.txtFileName->text(), u"c:\\results.txt"_s);
    EXPECT_EQ(dialog.txtTabNum->text(), u"2"_s);
    EXPECT_TRUE(dialog.ChkIgnoreFirstLine->isChecked());

    dialog.cmdReadFile_Click();
    EXPECT_EQ(messages.boxes.last(), (FakeMessages::Box{u"critical"_s, u"תקלה"_s, u"הקובץ אינו נמצא"_s}));
    EXPECT_EQ(dialog.Msg1->text(), u"הקובץ אינו נמצא. נא לבדוק שוב.."_s);

    QByteArray ten = "name\tcode\r\n";
    for (int i = 0; i < 10; ++i)
        ten += "n\tC" + QByteArray::number(i) + "\r\n";
    files.answers = {file(ten)};
    dialog.CmdDir_Click();
    EXPECT_EQ(files.calls.last().filter, u"Excel Text Files (*.txt)|*.txt|All Files (*.*)|*.*"_s);
    dialog.cmdReadFile_Click();
    EXPECT_EQ(dialog.Msg1->text(), u"קריאת הקובץ הסתיימה בהצלחה. נמצאו 10 כרטיסים"_s);
    EXPECT_EQ(messages.boxes.last(),
              (FakeMessages::Box{u"information"_s, u"הודעה"_s, u"קריאת הקובץ הסתיימה בהצלחה"_s}));

    dialog.txtTabNum->setText(u"x"_s);
    dialog.cmdReadFile_Click();
    EXPECT_EQ(dialog.Msg1->text(), u"תקלה בקריאת הקובץ"_s);
    EXPECT_TRUE(dialog.FileCrd().isEmpty()) << "a column that is no number fails before any line is read";
    dialog.txtTabNum->setText(u"2"_s);
    dialog.cmdReadFile_Click();
    dialog.cmdOK_Click();
    EXPECT_EQ(state.WantedCrdCount(), 10);
    EXPECT_EQ(state.WantedCrd.first(), u"C0"_s);
    EXPECT_EQ(store->value(u"Pelmar"_s, u"ImportFile"_s, u"FileName"_s, {}), path(u"cards.txt"_s));

    files.answers = {QString()};
    dialog.CmdDir_Click();
    EXPECT_TRUE(dialog.txtFileName->text().isEmpty()) << "cancelling the chooser empties the box";
}

TEST_F(CardFileTest, CancelKeepsWhatWasReadForALaterOk)
{
    store->setValue(u"Pelmar"_s, u"ImportFile"_s, u"FileName"_s, file("h\r\na\tC9\r\n"));
    int round = 0;
    const ModalCloser closer([&](QDialog& shown) {
        auto& dialog = static_cast<SelectByFileDialog&>(shown);
        if (round++ == 0) {
            dialog.cmdReadFile_Click();
            dialog.cmdClose_Click();
        } else {
            dialog.cmdOK_Click();
        }
    });
    card->cmdSelByFile_Click();
    EXPECT_TRUE(state.WantedCrd.isEmpty());
    EXPECT_TRUE(c().ChkSelectAccount->isChecked());
    card->cmdSelByFile_Click();
    EXPECT_EQ(state.WantedCrd, QStringList{u"C9"_s});
}

}  // namespace
}  // namespace pelmar::test
