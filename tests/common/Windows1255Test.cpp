#include "common/Windows1255.h"
#include "support/QtPrinting.h"

#include <gtest/gtest.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

TEST(Windows1255, HebrewTakesOneByteAndOtherCharactersBecomeReferencesNeverQuestionMarks)
{
    EXPECT_EQ(toWindows1255(u"אבת"_s, true), QByteArray("\xe0\xe1\xfa"));
    EXPECT_EQ(toWindows1255(u"₪ € ?"_s, true), QByteArray("\xa4 \x80 ?"));
    EXPECT_EQ(toWindows1255(u"日本"_s, true), QByteArray("&#26085;&#26412;"));
    EXPECT_EQ(toWindows1255(u"😀"_s, true), QByteArray("&#128512;"));
    EXPECT_EQ(toWindows1255(u"日"_s, false), QByteArray("?"));
    EXPECT_EQ(fromWindows1255("\xf9\xec\xe5\xed"), u"שלום"_s);
}

}  // namespace
}  // namespace pelmar::test
