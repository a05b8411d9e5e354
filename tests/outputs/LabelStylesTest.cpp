#include "outputs/LabelStyles.h"
#include "support/LabelStyleStore.h"

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

using LabelStyles = LabelStyleStore;

TEST_F(LabelStyles, FreshSettingsGiveArialNinePointsForEveryLine)
{
    SetGetLabelDefs(2, store, defs);
    for (const LabelDefRec& def : defs)
        EXPECT_EQ(def, (LabelDefRec{0, 9, 0, 0, 0, {}}));
}

TEST_F(LabelStyles, SavingWritesThirteenSectionsAndLineSixFollowsLineThree)
{
    defs[3] = {1, 12, 2, 1, 0, {}};
    defs[6] = {2, 20, 0, 0, 1, {}};
    defs[11].FixedText = u"מעל"_s;
    defs[12].FixedText = u"מתחת"_s;
    defs[2].FixedText = u"never stored"_s;
    SetGetLabelDefs(1, store, defs);
    EXPECT_EQ(key(6, u"FontSize"_s), u"20"_s) << "line 6 is stored as it was edited";
    EXPECT_EQ(defs[6], defs[3]) << "in memory it equals line 3 at once";
    EXPECT_EQ(key(12, u"FixedText"_s), u"מתחת"_s);
    EXPECT_EQ(key(2, u"FixedText"_s), u"<none>"_s);
    EXPECT_EQ(key(0, u"FontItalic"_s), u"0"_s);

    LabelDefTable loaded{};
    SetGetLabelDefs(2, store, loaded);
    EXPECT_EQ(loaded[6], loaded[3]);
    EXPECT_EQ(loaded[3].FontSize, 12);
    EXPECT_EQ(loaded[11].FixedText, u"מעל"_s);
    EXPECT_TRUE(loaded[2].FixedText.isEmpty());
}

TEST_F(LabelStyles, AStoredValueThatIsNotAByteIsPassedOver)
{
    defs[4] = {1, 17, 1, 1, 1, {}};
    const std::pair<const char16_t*, const char16_t*> stored[] = {
        {u"FontSize", u"256"}, {u"Font", u"-1"}, {u"FontWeight", u"two"}, {u"FontUL", u"0"}, {u"FontItalic", u" 255 "}};
    for (const auto& [key, value] : stored)
        store.setValue(u"Pelmar"_s, u"LabelDef4"_s, QString::fromUtf16(key), QString::fromUtf16(value));
    SetGetLabelDefs(2, store, defs);
    EXPECT_EQ(defs[4], (LabelDefRec{1, 17, 1, 0, 255, {}})) << "256, -1 and two are passed over; 0 and 255 taken";
}

}  // namespace
}  // namespace pelmar::test
