#include "outputs/LabelStyles.h"
#include "outputs/ui/LabelStyleDialog.h"
#include "support/LabelStyleStore.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

using LabelStyles = LabelStyleStore;

TEST_F(LabelStyles, TheDialogShowsTheRowsAndOkSavesWhatWasReadUpToABadSize)
{
    LabelStyleDialog dialog(store, defs);
    EXPECT_EQ(dialog.txtFontSize[5]->text(), u"9"_s);
    EXPECT_EQ(dialog.txtFixed[0], nullptr);
    ASSERT_NE(dialog.txtFixed[11], nullptr);
    EXPECT_NE(dialog.findChild<QLabel*>(), nullptr);

    dialog.CmbFont[0]->setCurrentIndex(1);
    dialog.txtFixed[11]->setText(u"שלום"_s);
    dialog.CmbFont[4]->setCurrentIndex(2);
    dialog.txtFontSize[4]->setText(u"big"_s);
    dialog.ChkUL[4]->setChecked(true);
    dialog.ChkItalic[5]->setChecked(true);
    dialog.cmdOK_Click();
    EXPECT_EQ(defs[0].Font, 1);
    EXPECT_TRUE(defs[11].FixedText.isEmpty()) << "lines are read 0 to 12, so line 11 comes after the bad line 4";
    EXPECT_EQ(defs[4].Font, 2) << "the bad size's own font is taken";
    EXPECT_EQ(defs[4].FontUL, 0) << "the fields after the bad size keep their values";
    EXPECT_EQ(defs[5].FontItalic, 0) << "and so do the later lines";
    EXPECT_EQ(key(4, u"Font"_s), u"2"_s) << "OK still saves";
}

TEST_F(LabelStyles, CancelStoresNothing)
{
    LabelStyleDialog dialog(store, defs);
    dialog.txtFontSize[1]->setText(u"30"_s);
    dialog.cmdCancel_Click();
    EXPECT_EQ(defs[1].FontSize, 9);
    EXPECT_EQ(key(1, u"FontSize"_s), u"<none>"_s);
}

}  // namespace
}  // namespace pelmar::test
