#include "common/Failure.h"
#include "common/Windows1255.h"
#include "outputs/LabelComposer.h"
#include "outputs/LabelSheet.h"
#include "outputs/LabelStyles.h"
#include "outputs/Runs.h"
#include "support/LabelCompany.h"
#include "support/FailureOf.h"

#include <QFile>
#include <QRegularExpression>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class LabelSheet : public LabelCompanyTest {
protected:
    void SetUp() override
    {
        LabelCompanyTest::SetUp();
        SetGetLabelDefs(2, *store, state.LabelDefs);
        options.rows = u"3"_s;
        options.cols = u"2"_s;
        lines({0, 1, 2, 3, 4, 5, 6});
    }

    QString sheet()
    {
        const QString path = tempPath(u"sheet.htm"_s);
        RunContext run = context();
        CreateLabFile(path, run);
        const QByteArray bytes = readFile(path);
        EXPECT_FALSE(bytes.contains("\n") && bytes.count("\r\n") != bytes.count("\n")) << "every line ends with CR LF";
        return fromWindows1255(bytes);
    }

    // The content of each cell, its lines joined by "|"; "-" for a blank cell.
    static QStringList cells(const QString& sheet)
    {
        QStringList found;
        static const QRegularExpression cell(u"     <table class=TBL1>\r\n(.*?)     </table>\r\n"_s,
                                             QRegularExpression::DotMatchesEverythingOption);
        for (auto it = cell.globalMatch(sheet); it.hasNext();) {
            QString content = it.next().captured(1).trimmed();
            content.replace(u"\r\n"_s, u"|"_s);
            content.replace(QRegularExpression(u"\\s*<tr(?: class=L(?:E)?\\d+)?><td>"_s), QString());
            content.replace(u"</td></tr>"_s, QString());
            found << (content == u"&nbsp;"_s ? u"-"_s : content);
        }
        return found;
    }
};

// The head of a sheet up to its line styles, for cells of the given height and width.
QString headOf(const QString& height, const QString& width)
{
    return u"<HTML>\r\n<HEAD>\r\n<TITLE>טרבל מערכות מידע מציגה</TITLE>\r\n"
           "<meta http-equiv='Content-Type' content='text/html; charset=windows-1255'>\r\n<style>\r\n"
           " TR {vertical-align: middle; text-align: right}\r\n TD {vertical-align: middle}\r\n"
           " .TDL {; height: %1%; width: %2%; vertical-align: middle; text-align: center}\r\n"
           " .TBL1 {padding: 1; border-spacing: 0; border-collapse: collapse; border: none; direction: rtl}\r\n"_s
        .arg(height, width);
}

const QString kHead = headOf(u"33.3"_s, u"50.0"_s);

QString rulesOf(int line)
{
    const QString body = u" {font-family:Arial (Hebrew); font-weight:Normal; font-size:9pt; font-style:Normal"_s;
    return u" .L%1"_s.arg(line) + body + u"; text-align: right; direction: rtl; color:black;}\r\n"_s
        + u" .LE%1"_s.arg(line) + body + u"; text-align: left; direction: ltr; color:black;}\r\n"_s;
}

QString cellOf(const QStringList& lines)
{
    QString cell = u"    <td class=TDL>\r\n     <table class=TBL1>\r\n"_s;
    for (const QString& line : lines)
        cell += line + u"\r\n"_s;
    return cell + u"     </table>\r\n    </td>\r\n"_s;
}

TEST_F(LabelSheet, ASheetIsWrittenByteForByte)
{
    QString expected = kHead;
    for (int line = 0; line <= 6; ++line)
        expected += rulesOf(line);
    expected += u"</style>\r\n</HEAD>\r\n<BODY BGCOLOR='#FFFFFF'>\r\n"_s;
    expected += u"<table height='100%' width='100%' border='0' cellpadding='0' cellspacing='0' dir='rtl'>\r\n"_s;
    const QStringList labels[] = {
        {u"    <tr class=L0><td>לכבוד</td></tr>"_s, u"    <tr class=L1><td>אבג בע&quot;מ</td></tr>"_s,
         u"    <tr class=L2><td>קוד: C1</td></tr>"_s, u"    <tr class=L3><td>לידי:משה, רכש</td></tr>"_s,
         u"    <tr class=L4><td>הרצל 1</td></tr>"_s,
         u"    <tr class=L5><td>חיפה&nbsp;&nbsp;&nbsp;&nbsp;12345</td></tr>"_s},
        {u"    <tr class=LE0><td>To</td></tr>"_s, u"    <tr class=LE1><td>Smith &amp; &lt;Sons&gt;</td></tr>"_s,
         u"    <tr class=LE2><td>Code: C2</td></tr>"_s, u"    <tr class=LE3><td>Attn:ABC, DEF</td></tr>"_s,
         u"    <tr class=LE4><td>12 Main St</td></tr>"_s,
         u"    <tr class=LE5><td>Springfield&nbsp;&nbsp;&nbsp;&nbsp;999</td></tr>"_s},
        {u"    <tr class=L0><td>לכבוד</td></tr>"_s, u"    <tr class=L1><td>ABCDEFGHIJKLMNOPQRSTUVWXYZ0123</td></tr>"_s,
         u"    <tr class=L2><td>קוד: C3</td></tr>"_s,
         u"    <tr class=L5><td>תל אביב&nbsp;&nbsp;&nbsp;&nbsp;</td></tr>"_s},
        {u"    <tr class=LE0><td>To</td></tr>"_s, u"    <tr class=LE1><td>Null Address Co</td></tr>"_s,
         u"    <tr class=LE2><td>Code: C4</td></tr>"_s, u"    <tr class=LE5><td>&nbsp;&nbsp;&nbsp;&nbsp;</td></tr>"_s},
        {u"    <tr class=L0><td>לכבוד</td></tr>"_s, u"    <tr class=L1><td>חמש</td></tr>"_s,
         u"    <tr class=L2><td>קוד: C5</td></tr>"_s,
         u"    <tr class=L5><td>עכו&nbsp;&nbsp;&nbsp;&nbsp;55</td></tr>"_s},
        {u"    <tr><td>&nbsp;</td></tr>"_s},
    };
    for (int row = 0; row < 3; ++row) {
        expected += u"  <tr>\r\n"_s + cellOf(labels[row * 2]) + cellOf(labels[row * 2 + 1]) + u"  </tr>\r\n"_s;
    }
    expected += u"</table>\r\n</BODY>\r\n</HTML>\r\n"_s;
    EXPECT_EQ(sheet(), expected);
}

TEST_F(LabelSheet, EveryLineOfALabelIsWrittenByteForByte)
{
    state.LabelDefs[11].FixedText = u"<מעל>"_s;
    state.LabelDefs[12] = {1, 14, 2, 1, 1, u"מתחת & אחרי"_s};
    options.rows = options.cols = u"1"_s;
    options.useTitle.fill(true);
    options.selectAccount = true;
    state.WantedCrd = {u"C1"_s};
    QString expected = headOf(u"100.0"_s, u"100.0"_s);
    for (int line = 0; line <= 11; ++line)
        expected += rulesOf(line);
    const QString david = u" {font-family:David; font-weight:Bold; font-size:14pt; font-style:Italic; "
                          "text-decoration: underline; text-align: "_s;
    expected += u" .L12"_s + david + u"right; direction: rtl; color:black;}\r\n .LE12"_s + david
        + u"left; direction: ltr; color:black;}\r\n</style>\r\n</HEAD>\r\n<BODY BGCOLOR='#FFFFFF'>\r\n"
          "<table height='100%' width='100%' border='0' cellpadding='0' cellspacing='0' dir='rtl'>\r\n  <tr>\r\n"_s;
    expected += cellOf({u"    <tr class=L0><td>לכבוד</td></tr>"_s, u"    <tr class=L11><td>&lt;מעל&gt;</td></tr>"_s,
                        u"    <tr class=L1><td>אבג בע&quot;מ</td></tr>"_s,
                        u"    <tr class=L12><td>מתחת &amp; אחרי</td></tr>"_s, u"    <tr class=L2><td>קוד: C1</td></tr>"_s,
                        u"    <tr class=L3><td>לידי:משה, רכש</td></tr>"_s, u"    <tr class=L4><td>הרצל 1</td></tr>"_s,
                        u"    <tr class=L7><td>גוש 5</td></tr>"_s,
                        u"    <tr class=L5><td>חיפה&nbsp;&nbsp;&nbsp;&nbsp;12345</td></tr>"_s,
                        u"    <tr class=L8><td>צפון</td></tr>"_s, u"    <tr class=L10><td>ישראל</td></tr>"_s});
    expected += u"  </tr>\r\n</table>\r\n</BODY>\r\n</HTML>\r\n"_s;
    EXPECT_EQ(sheet(), expected) << "line 9 (the state) is empty, so it is left out";
}

TEST_F(LabelSheet, TheStartPositionLeavesCellsOfTheFirstPageBlank)
{
    lines({2});
    options.startFrom = u"5"_s;
    EXPECT_EQ(cells(sheet()),
              (QStringList{u"-"_s, u"-"_s, u"-"_s, u"-"_s, u"קוד: C1"_s, u"Code: C2"_s, u"קוד: C3"_s, u"Code: C4"_s,
                           u"קוד: C5"_s, u"-"_s, u"-"_s, u"-"_s}));
    options.startFrom = u"8"_s;
    const QStringList beyond = cells(sheet());
    ASSERT_EQ(beyond.size(), 12) << "start 8 of 6 cells: positions 1..12 over two pages";
    EXPECT_EQ(beyond.mid(0, 6), QStringList(6, u"-"_s));
    EXPECT_EQ(beyond.mid(6),
              (QStringList{u"קוד: C1"_s, u"Code: C2"_s, u"קוד: C3"_s, u"Code: C4"_s, u"קוד: C5"_s, u"-"_s}));
}

TEST_F(LabelSheet, CopiesFillConsecutiveCellsAndZeroCopiesWriteNoPage)
{
    lines({2});
    options.copies = u"3"_s;
    options.startFrom = u"2"_s;
    const QStringList copies = cells(sheet());
    ASSERT_EQ(copies.size(), 18) << "3 × (2 + 5 - 1) positions make three pages of six";
    EXPECT_EQ(copies.mid(0, 8),
              (QStringList{u"-"_s, u"קוד: C1"_s, u"קוד: C1"_s, u"קוד: C1"_s, u"Code: C2"_s, u"Code: C2"_s,
                           u"Code: C2"_s, u"קוד: C3"_s}));
    EXPECT_EQ(copies.mid(16), (QStringList{u"-"_s, u"-"_s}));

    options.copies = u"0"_s;
    const QString none = sheet();
    EXPECT_TRUE(cells(none).isEmpty());
    EXPECT_TRUE(none.endsWith(u"<BODY BGCOLOR='#FFFFFF'>\r\n</BODY>\r\n</HTML>\r\n"_s));
}

TEST_F(LabelSheet, TheContactTemplateAndAttentionOptionsShapeTheContactLine)
{
    lines({1, 3, 6});
    options.labFormat = 1;
    options.deptNewLine = true;
    QStringList labels = cells(sheet());
    EXPECT_EQ(labels[0], u"לידי:משה<br>רכש|אבג בע&quot;מ"_s);
    EXPECT_EQ(labels[1], u"Attn:ABC<br>DEF|Smith &amp; &lt;Sons&gt;"_s);

    options.showAttn = false;
    lines({3});
    labels = cells(sheet());
    EXPECT_EQ(labels[0], u"משה"_s) << "without line 6 no department; without the word no title";
    EXPECT_EQ(labels[2], QString()) << "no contact: the label has no line at all, yet it is not a blank cell";
}

TEST_F(LabelSheet, AContactAddressReplacesTheCardAddressFromSixCharactersOn)
{
    const auto card = [](const QString& code, const QString& contactAddress) {
        return QStringList{insertRow(u"OCRD"_s, {{u"CardCode"_s, code}, {u"CardName"_s, code}, {u"CntctPrsn"_s, u"P"_s},
                                                 {u"MailAddres"_s, u"Main St"_s}}),
                           insertRow(u"OCPR"_s, {{u"CntctCode"_s, code.right(1).toInt()}, {u"CardCode"_s, code},
                                                 {u"Name"_s, u"P"_s}, {u"Address"_s, contactAddress}})};
    };
    engine->createDatabase(u"contacts"_s,
                           handMadeCompany(900000, card(u"A5"_s, u"12345"_s) + card(u"B6"_s, u"123456"_s)));
    state.ConnDataBase = u"contacts"_s;
    lines({4});
    options.allContacts = options.useContactAddress = true;
    EXPECT_EQ(cells(sheet()).mid(0, 2), (QStringList{u"Main St"_s, u"123456"_s}));
    options.useContactAddress = false;
    EXPECT_EQ(cells(sheet()).mid(0, 2), (QStringList{u"Main St"_s, u"Main St"_s}));
}

TEST_F(LabelSheet, AContactAddressLongerThanFiveCharactersReplacesTheCardAddress)
{
    lines({4, 5, 7});
    options.allContacts = true;
    options.useContactAddress = true;
    const QStringList labels = cells(sheet());
    EXPECT_EQ(labels[0], u"רחוב הגפן 5<br>עכו"_s);
    EXPECT_EQ(labels[1], u"12 Main St|Springfield&nbsp;&nbsp;&nbsp;&nbsp;999"_s) << "\"PO 5\" is too short to be used";
}

TEST_F(LabelSheet, FixedTextsAndTheNameAreCutToThirtyCharacters)
{
    state.LabelDefs[11].FixedText = u"<Dear> customer & friend of the house"_s;
    state.LabelDefs[12].FixedText = u"מבצע"_s;
    lines({11, 1, 12});
    EXPECT_EQ(cells(sheet())[2], u"&lt;Dear&gt; customer &amp; friend of th|ABCDEFGHIJKLMNOPQRSTUVWXYZ0123|מבצע"_s);
}

TEST_F(LabelSheet, TheSelectionFilterLeavesOtherCardsOutOfCountAndSheet)
{
    lines({2});
    options.selectAccount = true;
    state.WantedCrd = {u"C4"_s, u"C2"_s};
    EXPECT_EQ(cells(sheet()), (QStringList{u"Code: C2"_s, u"Code: C4"_s, u"-"_s, u"-"_s, u"-"_s, u"-"_s}));
    state.WantedCrd = {u"nobody"_s};
    EXPECT_TRUE(cells(sheet()).isEmpty()) << "no row selected: copies × (start - 1) positions, no page";
}

TEST_F(LabelSheet, AnEmptyResultLeavesTheHeadOnly)
{
    options.codeRange = true;
    options.fromCard = u"X"_s;
    options.toCard = u"X"_s;
    EXPECT_TRUE(sheet().endsWith(u"<BODY BGCOLOR='#FFFFFF'>\r\n"_s));
}

TEST_F(LabelSheet, AFailingStatementLeavesTheSheetAsFarAsItWasWritten)
{
    options.sqlWhere = true;
    options.sqlWhereText = u"NoSuchColumn = 1"_s;
    const QString path = tempPath(u"sheet.htm"_s);
    RunContext run = context();
    EXPECT_EQ(failureOf([&] { CreateLabFile(path, run); }), u"no such column: NoSuchColumn"_s);
    EXPECT_TRUE(fromWindows1255(readFile(path)).endsWith(u"<BODY BGCOLOR='#FFFFFF'>\r\n"_s));
}

TEST_F(LabelSheet, TheRunOpensTheSheetAndLogsTheCountingQuery)
{
    run(u"labels"_s);
    ASSERT_EQ(browser.opened, QStringList{tempPath(u"pelmar1.htm"_s)});
    const QString log = fromWindows1255(readFile(tempPath(u"pelmar.log"_s)));
    EXPECT_TRUE(log.contains(u"הפקת מדבקות<br>\r\nSELECT DISTINCT OCRD.CardCode"_s)) << log.toStdString();
    EXPECT_FALSE(log.contains(u"ORDER BY"_s));
}

TEST_F(LabelSheet, ABadLayoutFailsBeforeTheFileIsTouchedAndOpensNothing)
{
    const QString path = tempPath(u"pelmar1.htm"_s);
    writeFile(path, "previous sheet");
    for (const auto& [box, text] :
         {std::pair{&MailingOptions::rows, u"0"_s}, std::pair{&MailingOptions::copies, u"abc"_s},
          std::pair{&MailingOptions::cols, u"40000"_s}}) {
        const QString kept = options.*box;
        options.*box = text;
        try {
            run(u"labels"_s);
            ADD_FAILURE() << text.toStdString();
        } catch (const Failure& failure) {
            EXPECT_TRUE(failure.description().contains(text)) << failure.description().toStdString();
        }
        options.*box = kept;
    }
    EXPECT_TRUE(browser.opened.isEmpty());
    EXPECT_EQ(readFile(path), "previous sheet");
}

TEST(LabelLayout, TheLayoutBoxesAreReadWithinTheirBoundsOrRefusedByName)
{
    struct Case {
        QString rows, cols, start, copies;
        QString refusal;  // empty: accepted
    };
    const QString notANumber = u"הערך \"%1\" בשדה \"%2\" אינו מספר. יש לתקן אותו ולהפעיל שוב."_s;
    const QString outOfRange = u"הערך %1 בשדה \"%2\" מחוץ לתחום המותר: %3 עד %4."_s;
    const Case cases[] = {
        {u"32767"_s, u"1"_s, u"1"_s, u"1"_s, {}},
        {u"1"_s, u"32767"_s, u"-32768"_s, u"0"_s, {}},
        {u"181"_s, u"181"_s, u"32767"_s, u"255"_s, {}},
        {u"200"_s, u"200"_s, u"1"_s, u"1"_s, u"דף של 200 שורות ו-200 עמודות גדול מדי: מותרות עד 32767 מדבקות בדף."_s},
        {u"128"_s, u"256"_s, u"1"_s, u"1"_s, u"דף של 128 שורות ו-256 עמודות גדול מדי: מותרות עד 32767 מדבקות בדף."_s},
        {u"0"_s, u"3"_s, u"1"_s, u"1"_s, outOfRange.arg(u"0"_s, u"שורות"_s).arg(1).arg(32767)},
        {u"8"_s, u"32768"_s, u"1"_s, u"1"_s, outOfRange.arg(u"32768"_s, u"עמודות"_s).arg(1).arg(32767)},
        {u"8"_s, u"3"_s, u"-32769"_s, u"1"_s, outOfRange.arg(u"-32769"_s, u"התחל ממדבקה"_s).arg(-32768).arg(32767)},
        {u"8"_s, u"3"_s, u"1"_s, u"256"_s, outOfRange.arg(u"256"_s, u"עותקים"_s).arg(0).arg(255)},
        {u"8"_s, u"3"_s, u"1"_s, u"-1"_s, outOfRange.arg(u"-1"_s, u"עותקים"_s).arg(0).arg(255)},
        {u"8"_s, u"three"_s, u"1"_s, u"1"_s, notANumber.arg(u"three"_s, u"עמודות"_s)},
    };
    for (const Case& c : cases) {
        MailingOptions options;
        options.rows = c.rows;
        options.cols = c.cols;
        options.startFrom = c.start;
        options.copies = c.copies;
        try {
            const LabelLayout layout = LabelLayout::read(options);
            EXPECT_TRUE(c.refusal.isEmpty()) << c.refusal.toStdString();
            EXPECT_EQ(layout.perPage(), c.rows.toInt() * c.cols.toInt());
            EXPECT_EQ(layout.start, c.start.toInt());
            EXPECT_EQ(layout.copies, c.copies.toInt());
        } catch (const Failure& failure) {
            EXPECT_EQ(failure.description(), c.refusal);
        }
    }
    MailingOptions typed;
    typed.rows = u" 2.5 "_s;
    typed.cols = u"3.5"_s;
    EXPECT_EQ(LabelLayout::read(typed).perPage(), 8) << "a fraction rounds half to even, as the classic conversion";
}

TEST(LabelSizes, CellSizesHaveTwoIntegerDigitsAndOneDecimal)
{
    EXPECT_EQ(cellSizeText(3), u"33.3"_s);
    EXPECT_EQ(cellSizeText(8), u"12.5"_s);
    EXPECT_EQ(cellSizeText(12), u"08.3"_s);
    EXPECT_EQ(cellSizeText(16), u"06.3"_s);
    EXPECT_EQ(cellSizeText(1), u"100.0"_s);
}

TEST(LabelStyleRules, FontWeightSizeItalicAndUnderline)
{
    LabelDefRec david{1, 14, 2, 1, 0, {}};
    EXPECT_EQ(
        labelStyleRules(1, david),
        (QStringList{u" .L1 {font-family:David; font-weight:Bold; font-size:14pt; font-style:Normal; text-decoration: "
                     "underline; text-align: right; direction: rtl; color:black;}"_s,
                     u" .LE1 {font-family:David; font-weight:Bold; font-size:14pt; font-style:Normal; text-decoration: "
                     "underline; text-align: left; direction: ltr; color:black;}"_s}));
    LabelDefRec miriam{2, 0, 1, 0, 1, {}};
    EXPECT_EQ(labelStyleRules(12, miriam)[0],
              u" .L12 {font-family:Miriam; font-weight:Bolder; font-size:0pt; font-style:Italic; text-align: right; "
              "direction: rtl; color:black;}"_s);
}

}  // namespace
}  // namespace pelmar::test

namespace pelmar::test {
namespace {

TEST(LabelDirection, ALabelIsHebrewWhenItsAddressOrElseCityHoldsAHebrewLetter)
{
    EXPECT_TRUE(IsHebrew(u"12 רחוב"_s));
    EXPECT_TRUE(IsHebrew(u"ת"_s));
    EXPECT_FALSE(IsHebrew(u"Main St 12"_s));
    EXPECT_FALSE(IsHebrew(QString()));
    EXPECT_FALSE(IsHebrew(u"\u05B0\u05F0"_s)) << "points and ligatures are not letters alef to tav";
}

}  // namespace
}  // namespace pelmar::test
