#include "common/Failure.h"
#include "common/Windows1255.h"
#include "outputs/Runs.h"
#include "support/FailureOf.h"
#include "support/LabelCompany.h"

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class CardPageTest : public LabelCompanyTest {
protected:
    QString page(const QString& code, const QString& database = u"labels"_s)
    {
        state.ConnDataBase = database;
        const QString path = tempPath(u"card.htm"_s);
        RunContext run = context();
        CreateCardFile(path, code, run);
        return fromWindows1255(readFile(path));
    }
};

const QString kHead
    = u"<HTML>\r\n<!-- saved from url=(0024)http://www.pelmar.co.il/ -->\r\n<HEAD>\r\n<TITLE>כרטיס לקוח/ספק</TITLE>\r\n"
      "<meta http-equiv='Content-Type' content='text/html; charset=windows-1255'>\r\n<style>\r\n"
      "  BODY {direction:rtl; background:#FFFFFF ;margin-top:10; margin-left:10; margin-right:10; "
      "vertical-align:top;}\r\n"
      "  TABLE {border: thin solid #ADD6EA}\r\n"
      "  TD {font-size : 9pt; color: black; font-family: arial; text-align: right}\r\n"
      "  .TblClean {border: none}\r\n"
      "  .Cap {background:#5F8EBE; font-size : 9pt; color: white; font-family: Arial; font-weight: bold}\r\n"
      "  .GCap {font-size : 9pt; color: #5F8EBE; font-family: Arial; font-weight: bold}\r\n"
      "  .Title1 {font-size : 12pt; color: blue; font-family: arial; font-weight : bold;}\r\n"
      "  .Tarvel {font-size : 8pt; color: black; font-family: arial;}\r\n</style>\r\n</HEAD>\r\n"
      "<BODY TEXT='#000000' LINK='#0000FF' VLINK='#800080'>\r\n"
      "<table class=TblClean width='100%' border='0' cellpadding='3' cellspacing='3'>\r\n"_s;

QString block(const QStringList& captions, const QStringList& values)
{
    QString text = u"  <tr align='right'>\r\n   <td>\r\n"
                   "   <table class=TblClean width='100%' border='0' cellpadding='2' cellspacing='2'>\r\n"
                   "    <tr align='right'>\r\n"_s;
    for (const QString& caption : captions)
        text += u"     <td class=Cap>"_s + caption + u"</td>\r\n"_s;
    text += u"    </tr>\r\n    <tr align='right'>\r\n"_s;
    for (const QString& value : values)
        text += u"     "_s + value + u"\r\n"_s;
    return text + u"    </tr>\r\n    </table>\r\n   </td>\r\n  </tr>\r\n"_s;
}

QString section(const QString& title, const QStringList& captions, const QList<QStringList>& rows)
{
    QString text = u"<tr><td class=GCap align=right>"_s + title
        + u"</td></tr>\r\n<tr><td>\r\n"
          " <table width='100%' border='0' cellpadding='2' cellspacing='2'>\r\n"
          "  <tr bgcolor='#FFFFFF' align='right'>\r\n"_s;
    for (const QString& caption : captions)
        text += u"    <td class=Cap>"_s + caption + u"</td>\r\n"_s;
    text += u"  </tr>\r\n"_s;
    for (const QStringList& row : rows) {
        text += u"  <tr valign='middle' bgcolor='#FFFFFF' align='right'>\r\n"_s;
        for (const QString& value : row)
            text += u"    <td>"_s + value + u"</td>\r\n"_s;
        text += u"  </tr>\r\n"_s;
    }
    return text + u" </table>\r\n</td></tr>\r\n"_s;
}

TEST_F(CardPageTest, ACardOfTheNewerSchemaIsWrittenByteForByte)
{
    const QString expected
        = kHead + u"<tr><td>\r\n <table width='100%' border='0' cellpadding='2' cellspacing='2'>\r\n"_s
        + block({u"קוד כרטיס"_s, u"שם כרטיס"_s, u"סיווג"_s, u"השתייכות"_s},
                {u"<td><b>C1</b></td>"_s, u"<td><b>אבג בע&quot;מ</b></td>"_s, u"<td>לקוח</td>"_s, u"<td>לקוחות</td>"_s})
        + block({u"טלפון 1"_s, u"טלפון 2"_s, u"טלפון נייד"_s, u"פקס"_s},
                {u"<td>&nbsp;</td>"_s, u"<td>&nbsp;</td>"_s, u"<td>050-123</td>"_s, u"<td>04-1234567</td>"_s})
        + block({u"שם לועזי"_s, u"עוסק מורשה"_s, u"דואל"_s, u"הערות"_s},
                {u"<td>&nbsp;</td>"_s, u"<td>&nbsp;</td>"_s, u"<td>info@c1.co.il</td>"_s, u"<td>&nbsp;</td>"_s})
        + block({u"מאפיינים"_s}, {u"<td>שלוש &amp; &lt;ג&gt;, שבע</td>"_s}) + u" </table>\r\n</td></tr>\r\n"_s
        + section(
              u"כתובות"_s,
              {u"סוג"_s, u"רחוב/תא דואר"_s, u"גוש"_s, u"עיר"_s, u"מיקוד"_s, u"מחוז"_s, u"מדינה"_s, u"ארץ"_s},
              {{u"ראשית"_s, u"הרצל 1"_s, u"&nbsp;"_s, u"חיפה"_s, u"&nbsp;"_s, u"&nbsp;"_s, u"&nbsp;"_s, u"ישראל"_s}})
        + section(u"אנשי קשר"_s,
                  {u"שם"_s, u"תפקיד"_s, u"טל. 1"_s, u"טל. 2"_s, u"טל. נייד"_s, u"פקס"_s, u"EMail"_s, u"זימונית"_s,
                   u"הערות 1"_s, u"הערות 2"_s},
                  {{u"משה"_s, u"מנהל"_s, u"04-5555555"_s, u"&nbsp;"_s, u"052-999"_s, u"&nbsp;"_s, u""_s, u"&nbsp;"_s,
                    u"רכש"_s, u"&nbsp;"_s}})
        + u"</table>\r\n<p class=Tarvel align='center'>טרבל מערכות מידע</p>\r\n</BODY>\r\n</HTML>\r\n"_s;
    EXPECT_EQ(page(u"C1"_s), expected);
}

const QStringList kOlderCaptions = {u"סוג"_s, u"רחוב/תא דואר"_s, u"עיר"_s, u"מיקוד"_s, u"מחוז"_s, u"ארץ"_s};

TEST_F(CardPageTest, TheOlderSchemaShowsTheCardsTwoAddresses)
{
    EXPECT_TRUE(page(u"C2"_s, u"older"_s)
                    .contains(section(u"כתובות"_s, kOlderCaptions,
                                      {{u"כתובת למשלוח"_s, u"12 Main St"_s, u"Springfield"_s, u"&nbsp;"_s, u"&nbsp;"_s,
                                        u"&nbsp;"_s}})))
        << "a mailing address equal to the address is not shown twice";
    EXPECT_TRUE(
        page(u"M1"_s, u"older"_s)
            .contains(section(u"כתובות"_s, kOlderCaptions,
                              {{u"כתובת לדואר"_s, u"ת.ד. 7"_s, u"עכו"_s, u"&nbsp;"_s, u"&nbsp;"_s, u"&nbsp;"_s}})))
        << "a mailing address and a Null address show the mailing row only";
    const QString c1 = page(u"C1"_s, u"older"_s);
    EXPECT_TRUE(
        c1.contains(u"    <td>כתובת למשלוח</td>\r\n    <td>הרצל 1</td>\r\n    <td>חיפה</td>\r\n    <td>&nbsp;</td>\r\n"
                    "    <td>&nbsp;</td>\r\n    <td>ישראל</td>\r\n"_s))
        << "the country is named through OCRY";
}

TEST_F(CardPageTest, CardsWithoutPropertiesAddressesOrContactsLeaveTheirSectionsOut)
{
    for (const QString& database : {u"labels"_s, u"older"_s}) {
        const QString c4 = page(u"C4"_s, database);
        EXPECT_FALSE(c4.contains(u"מאפיינים"_s));
        EXPECT_FALSE(c4.contains(u"כתובות"_s));
        EXPECT_FALSE(c4.contains(u"אנשי קשר"_s));
        EXPECT_TRUE(c4.endsWith(u"</BODY>\r\n</HTML>\r\n"_s));
    }
}

TEST_F(CardPageTest, CardTypesAndACodeWithAnApostrophe)
{
    EXPECT_TRUE(page(u"C5"_s).contains(u"     <td>ליד</td>\r\n"_s));
    const QString odd = page(u"X'1"_s, u"older"_s);
    EXPECT_TRUE(odd.contains(u"     <td><b>X'1</b></td>\r\n     <td><b>אחר</b></td>\r\n     <td></td>\r\n"_s));
    EXPECT_EQ(page(u"nobody"_s), kHead) << "a code that matches no card ends after the head";
    EXPECT_EQ(page(u"C3"_s), kHead) << "a card without a group has no general row either";
}

TEST_F(CardPageTest, OnlyTheSetPropertiesAreListed)
{
    QStringList rows
        = {insertRow(u"OCRG"_s, {{u"GroupCode"_s, 100}, {u"GroupName"_s, u"g"_s}}),
           insertRow(u"OCRD"_s, {{u"CardCode"_s, u"P1"_s}, {u"GroupCode"_s, 100}, {u"QryGroup9"_s, u"Y"_s}}),
           insertRow(u"OCRD"_s,
                     {{u"CardCode"_s, u"P2"_s},
                      {u"GroupCode"_s, 100},
                      {u"QryGroup1"_s, u"Y"_s},
                      {u"QryGroup2"_s, u"N"_s},
                      {u"QryGroup64"_s, u"Y"_s}})};
    for (const int n : {1, 2, 64})
        rows << insertRow(u"OCQG"_s, {{u"GroupCode"_s, n}, {u"GroupName"_s, u"מאפיין 😀%1"_s.arg(n)}});
    engine->createDatabase(u"properties"_s, handMadeCompany(900000, rows));
    const auto propertiesCell = [](const QString& names) {
        return u"     <td class=Cap>מאפיינים</td>\r\n    </tr>\r\n    <tr align='right'>\r\n     <td>%1</td>\r\n"_s.arg(
            names);
    };
    EXPECT_TRUE(page(u"P2"_s, u"properties"_s).contains(propertiesCell(u"מאפיין &#128512;1, מאפיין &#128512;64"_s)))
        << "property 2 is named but not set; a character the code page lacks is a reference";
    EXPECT_TRUE(page(u"P1"_s, u"properties"_s).contains(propertiesCell({})))
        << "a set property without a name still gives the block";
}

TEST_F(CardPageTest, AnUnreadableSchemaLevelTouchesNoFile)
{
    state.ConnDataBase = u"missing"_s;
    const QString path = tempPath(u"card.htm"_s);
    writeFile(path, "previous");
    RunContext run = context();
    EXPECT_TRUE(
        failureOf([&] { CreateCardFile(path, u"C1"_s, run); }).startsWith(u"Cannot open database \"missing\""_s));
    EXPECT_EQ(readFile(path), QByteArray("previous"));
}

}  // namespace
}  // namespace pelmar::test
