#include "common/Failure.h"
#include "common/Windows1255.h"
#include "outputs/LabelSheet.h"
#include "outputs/RecipientList.h"
#include "outputs/Runs.h"
#include "support/FailureOf.h"
#include "support/LabelCompany.h"

#include <QRegularExpression>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class RecipientListTest : public LabelCompanyTest {
protected:
    QString list(short kind)
    {
        const QString path = tempPath(u"list.htm"_s);
        RunContext run = context();
        CreateHTML(path, kind, run);
        return fromWindows1255(readFile(path));
    }

    // The data rows, each as its cells joined by "|".
    static QStringList rows(const QString& list)
    {
        QStringList found;
        static const QRegularExpression row(
            u"  <tr valign='middle' bgcolor='#FFFFFF' align='right'>\r\n(.*?)  </tr>\r\n"_s,
            QRegularExpression::DotMatchesEverythingOption);
        static const QRegularExpression cell(u"    <td(?: align='left')?>(.*?)</td>\r\n"_s);
        for (auto it = row.globalMatch(list); it.hasNext();) {
            QStringList cells;
            for (auto c = cell.globalMatch(it.next().captured(1)); c.hasNext();)
                cells << c.next().captured(1);
            found << cells.join(u'|');
        }
        return found;
    }
};

TEST_F(RecipientListTest, TheLabelsListIsWrittenByteForByte)
{
    const QString expected
        = u"<HTML>\r\n<HEAD>\r\n<TITLE>טרבל מערכות מידע מציגה</TITLE>\r\n"
          "<meta http-equiv='Content-Type' content='text/html; charset=windows-1255'>\r\n"
          "<style>.MyClass1{font-size : 10pt; color: blue; font-family: Arial}\r\n"
          "       .Title1 {font-size : 12pt; color: blue; font-family: Arial; font-weight : bold; direction: rtl}\r\n"
          "       TD {font-size : 9pt; color: black; font-family: Arial}\r\n</style>\r\n</HEAD>\r\n"
          "<BODY class=MyClass1 BGCOLOR='#FFFFFF' TEXT='#000000' LINK='#0000FF' VLINK='#800080'>\r\n"
          "<p class=Title1 align='left'>%1</p>\r\n"
          "<p class=Title1 align='right'>נובר-דיוור ל-SAP Business One</p>\r\n"
          "<p align='right'>דיוור ישיר במעטפות דואר</p>\r\n"
          "<table width='100%' border='0' cellpadding='1' cellspacing='1'>\r\n"
          "  <tr><td colspan='5'><hr noshade size='2'></td></tr>\r\n"
          "  <tr valign='middle' bgcolor='white' align='right'>\r\n"
          "    <td valign='middle'>מיקוד</td>\r\n    <td valign='middle'>עיר</td>\r\n    <td "
          "valign='middle'>כתובת</td>\r\n"
          "    <td valign='middle'>איש קשר</td>\r\n    <td valign='middle'>שם</td>\r\n  </tr>\r\n"
          "  <tr><td colspan='5'><hr noshade size='2'></td></tr>\r\n"
          "  <tr valign='middle' bgcolor='#FFFFFF' align='right'>\r\n"
          "    <td>12345</td>\r\n    <td>חיפה</td>\r\n    <td>הרצל 1</td>\r\n    <td>משה</td>\r\n    <td>אבג "
          "בע&quot;מ</td>\r\n"
          "  </tr>\r\n"
          "  <tr valign='middle' bgcolor='#FFFFFF' align='right'>\r\n"
          "    <td>999</td>\r\n    <td>Springfield</td>\r\n    <td>12 Main St</td>\r\n    <td>ABC</td>\r\n"
          "    <td>Smith &amp; &lt;Sons&gt;</td>\r\n  </tr>\r\n"
          "  <tr valign='middle' bgcolor='#FFFFFF' align='right'>\r\n"
          "    <td>&nbsp;</td>\r\n    <td>תל אביב</td>\r\n    <td>&nbsp;</td>\r\n    <td>&nbsp;</td>\r\n"
          "    <td>ABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789abcd</td>\r\n  </tr>\r\n"
          "  <tr valign='middle' bgcolor='#FFFFFF' align='right'>\r\n"
          "    <td>&nbsp;</td>\r\n    <td>&nbsp;</td>\r\n    <td>&nbsp;</td>\r\n    <td>&nbsp;</td>\r\n"
          "    <td>Null Address Co</td>\r\n  </tr>\r\n"
          "  <tr valign='middle' bgcolor='#FFFFFF' align='right'>\r\n"
          "    <td>55</td>\r\n    <td>עכו</td>\r\n    <td>&nbsp;</td>\r\n    <td>&nbsp;</td>\r\n    <td>חמש</td>\r\n  "
          "</tr>\r\n"
          "</table>\r\n<hr noshade width='100%' size='2'>\r\n"
          "<p class=Title1 align='right'>מספר הכרטיסים ברשימה: 5</p>\r\n"
          "<p class=Title1 align='right'>מספר הדפים הנדרשים: 1</p>\r\n"
          "<br>\r\n<p class=Title1 align='center'>טרבל מערכות מידע</p>\r\n</BODY>\r\n</HTML>\r\n"_s.arg(
              QDate::currentDate().toString(u"dd/MM/yyyy"_s));
    EXPECT_EQ(list(2), expected);
}

TEST_F(RecipientListTest, TheLabelsListRefusesThePageTheLabelSheetRefuses)
{
    options.rows = u"200"_s;
    options.cols = u"200"_s;
    const QString refusal = u"דף של 200 שורות ו-200 עמודות גדול מדי: מותרות עד 32767 מדבקות בדף."_s;
    EXPECT_EQ(failureOf([&] { list(2); }), refusal);
    EXPECT_EQ(failureOf([&] { LabelLayout::read(options); }), refusal);
    options.rows = u"181"_s;
    options.cols = u"181"_s;
    EXPECT_TRUE(list(2).contains(u"מספר הדפים הנדרשים: 1</p>"_s)) << "181 x 181 = 32761 labels fit a page";
}

TEST_F(RecipientListTest, EachKindShowsItsOwnColumnsWithContactValuesBeforeCardValues)
{
    EXPECT_EQ(
        rows(list(3)).mid(0, 2),
        (QStringList{u"04-1234567|רכש|מנהל|משה|אבג בע&quot;מ"_s, u"+1 555|DEF|&nbsp;|ABC|Smith &amp; &lt;Sons&gt;"_s}));
    EXPECT_EQ(rows(list(4)).mid(0, 2),
              (QStringList{u"info@c1.co.il|משה|אבג בע&quot;מ"_s, u"abc@smith.com|ABC|Smith &amp; &lt;Sons&gt;"_s}))
        << "an empty contact e-mail shows the card's";
    EXPECT_EQ(rows(list(5)),
              (QStringList{u"052-999|משה|אבג בע&quot;מ"_s, u"050-222|ABC|Smith &amp; &lt;Sons&gt;"_s,
                           u"&nbsp;|&nbsp;|ABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789abcd"_s,
                           u"&nbsp;|&nbsp;|Null Address Co"_s, u"054 777|&nbsp;|חמש"_s}));
    const QString letters = list(6);
    EXPECT_TRUE(letters.contains(u"<p align='right'>דיוור ישיר במעטפות דואר</p>"_s));
    EXPECT_FALSE(letters.contains(u"מספר הדפים הנדרשים"_s));
    EXPECT_TRUE(list(4).contains(u"colspan='3'"_s));
}

TEST_F(RecipientListTest, TheSelectionFilterAndAnEmptyResult)
{
    options.selectAccount = true;
    state.WantedCrd = {u"C5"_s, u"C1"_s};
    const QString filtered = list(2);
    EXPECT_EQ(rows(filtered).size(), 2);
    EXPECT_TRUE(filtered.contains(u"מספר הכרטיסים ברשימה: 2</p>"_s));

    options.codeRange = true;
    options.fromCard = u"Z"_s;
    options.toCard = u"Z"_s;
    EXPECT_TRUE(list(3).endsWith(u"  </tr>\r\n  <tr><td colspan='5'><hr noshade size='2'></td></tr>\r\n"_s));
}

TEST_F(RecipientListTest, ThePreviewWritesTheListOfTheChosenOutputAndLogsIt)
{
    options.outType = 2;
    run(u"list"_s);
    ASSERT_EQ(browser.opened, QStringList{tempPath(u"pelmar2.htm"_s)});
    EXPECT_TRUE(fromWindows1255(readFile(browser.opened[0])).contains(u"דיוור ישיר בדואר אלקטרוני"_s));
    EXPECT_TRUE(fromWindows1255(readFile(tempPath(u"pelmar.log"_s))).contains(u"רשימת מעקב<br>"_s));

    options.outType = -1;
    const std::pair<QString MailingOptions::*, QString> refused[]
        = {{&MailingOptions::rows, u"הערך 0 בשדה \"שורות\" מחוץ לתחום המותר: 1 עד 32767."_s},
           {&MailingOptions::cols, u"הערך 32768 בשדה \"עמודות\" מחוץ לתחום המותר: 1 עד 32767."_s},
           {&MailingOptions::copies, u"הערך 256 בשדה \"עותקים\" מחוץ לתחום המותר: 0 עד 255."_s}};
    for (const auto& [box, message] : refused) {
        MailingOptions kept = options;
        options.*box = message.section(u' ', 1, 1);
        EXPECT_EQ(failureOf([&] { run(u"list"_s); }), message);
        options = kept;
    }
    EXPECT_EQ(browser.opened.size(), 1) << "a list that cannot be written opens no window";
    options.rows = u"1"_s;
    options.cols = u"32767"_s;
    options.copies = u"255"_s;
    run(u"list"_s);
    EXPECT_TRUE(fromWindows1255(readFile(tempPath(u"pelmar2.htm"_s))).contains(u"מספר הדפים הנדרשים: 1</p>"_s))
        << "the largest layout the boxes take";
}

TEST(LabelPages, PagesNeededForTheRecipientsAndCopies)
{
    EXPECT_EQ(labelPagesNeeded(7, {3, 2, 1}), 2);
    EXPECT_EQ(labelPagesNeeded(6, {3, 2, 1}), 1);
    EXPECT_EQ(labelPagesNeeded(6, {3, 2, 2}), 2);
    EXPECT_EQ(labelPagesNeeded(0, {3, 2, 1}), 0);
    EXPECT_EQ(labelPagesNeeded(3000000, {8, 3, 255}), 31875000) << "counters are wide enough";
}

}  // namespace
}  // namespace pelmar::test
