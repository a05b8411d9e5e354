#include "outputs/LabelStyles.h"
#include "outputs/ui/LabelStyleDialog.h"
#include "support/Fakes.h"
#include "support/LabelStyleStore.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class LabelStyles : public LabelStyleStore {
protected:
    FakeMessages messages;
};

TEST_F(LabelStyles, ABadSizeIsNamedAndTheDialogKeepsWhatWasTyped)
{
    LabelStyleDialog dialog(store, messages, defs);
    EXPECT_EQ(dialog.txtFontSize[5]->text(), u"9"_s);
    EXPECT_EQ(dialog.txtFixed[0], nullptr);
    ASSERT_NE(dialog.txtFixed[11], nullptr);
    EXPECT_NE(dialog.findChild<QLabel*>(), nullptr);

    dialog.open();
    dialog.CmbFont[0]->setCurrentIndex(1);
    dialog.txtFixed[11]->setText(u"שלום"_s);
    dialog.txtFontSize[4]->setText(u"big"_s);
    dialog.ChkItalic[5]->setChecked(true);
    dialog.cmdOK_Click();
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_EQ(messages.boxes[0].title, u"שגיאה"_s);
    EXPECT_EQ(messages.boxes[0].text, u"הגודל \"big\" בשורה \"כתובת\" אינו מספר שלם בין 0 ל-255. יש לתקן אותו."_s);
    EXPECT_TRUE(dialog.isVisible()) << "the dialog stays open";
    EXPECT_EQ(dialog.txtFixed[11]->text(), u"שלום"_s) << "with what was typed";
    EXPECT_EQ(defs[0].Font, 0) << "and nothing is taken yet";
    EXPECT_EQ(key(0, u"Font"_s), u"<none>"_s);

    dialog.txtFontSize[4]->setText(u"256"_s);
    dialog.cmdOK_Click();
    EXPECT_EQ(messages.boxes.size(), 2) << "256 is one past the largest size";
    dialog.txtFontSize[4]->setText(u"255"_s);
    dialog.cmdOK_Click();
    EXPECT_EQ(messages.boxes.size(), 2);
    EXPECT_FALSE(dialog.isVisible());
    EXPECT_EQ(defs[0].Font, 1);
    EXPECT_EQ(defs[4].FontSize, 255);
    EXPECT_EQ(defs[11].FixedText, u"שלום"_s);
    EXPECT_EQ(defs[5].FontItalic, 1);
    EXPECT_EQ(key(11, u"FixedText"_s), u"שלום"_s);
}

TEST_F(LabelStyles, CancelStoresNothing)
{
    LabelStyleDialog dialog(store, messages, defs);
    dialog.txtFontSize[1]->setText(u"30"_s);
    dialog.cmdCancel_Click();
    EXPECT_EQ(defs[1].FontSize, 9);
    EXPECT_EQ(key(1, u"FontSize"_s), u"<none>"_s);
}

}  // namespace
}  // namespace pelmar::test
