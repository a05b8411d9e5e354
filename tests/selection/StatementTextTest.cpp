#include "common/Failure.h"
#include "common/SessionState.h"
#include "options/MailingOptions.h"
#include "selection/DateText.h"
#include "selection/SelectBuilder.h"
#include "selection/SelectedCards.h"
#include "selection/WhereBuilder.h"
#include "support/FailureOf.h"
#include "support/OptionsWith.h"
#include "support/QtPrinting.h"

#include <gtest/gtest.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

TEST(StatementText, TheDocumentedExamplesComeOutByteForByte)
{
    SessionState state;
    MailingOptions groups;
    groups.catCode = true;
    groups.cardType = 0;
    state.SelCardGroups = {CardGroupSel{}, CardGroupSel{100, true}, CardGroupSel{101, false}, CardGroupSel{103, true}};
    EXPECT_EQ(BuildWhere(groups, state),
              u" Where (1 > 0) AND OCRD.CardType = 'C' AND (GroupCode=100 OR GroupCode=103)"_s);

    EXPECT_EQ(BuildDatesCriteria(QDate(2005, 3, 1), QDate(2005, 3, 31), 0, 0, u"1000"_s, {}),
              u" AND OINV.DocDate Between '03/01/2005' And '03/31/2005' And OINV.DocNum>=1000"_s);

    state.QryGroupSel[3] = state.QryGroupSel[17] = true;
    state.QryGroupRelation = u"OR"_s;
    EXPECT_EQ(BuildQryGroupCriteria(state), u" And (OCRD.QryGroup3='Y' OR OCRD.QryGroup17='Y')"_s);

    MailingOptions labels;
    labels.addressFrom = 0;
    EXPECT_EQ(BuildSelect(labels, 0, 0, true, kLabels),
              u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName, OCRD.MailAddres, OCRD.MailCounty, OCRD.MailCity, "
              "OCRD.MailZipCod, OCPR.Name Attn, OCPR.Notes1 Department, OCPR.Address CntctAddrs, '' MailBlock, "
              "'' MailState, OCRD.MailCountr MailCountry FROM OCRD LEFT JOIN OCPR ON (OCPR.CardCode = "
              "OCRD.CardCode AND OCPR.Name = OCRD.CntctPrsn )"_s);

    labels.sortBy = 4;
    EXPECT_EQ(BuildOrderBy(labels, 0, 0, true, kLabels), u" ORDER BY OCPR.Name ASC, OCRD.MailZipCod ASC"_s);
}

TEST(StatementText, EachCriterionAddsItsFragmentInOrder)
{
    const std::pair<QStringList, QString> cases[] = {
        {{}, u" Where (1 > 0)"_s},
        {{u"ChkCatCode=1"_s, u"cmbCS=1"_s}, u" Where (1 > 0) AND OCRD.CardType = 'S'"_s},
        {{u"ChkCatCode=1"_s, u"cmbCS=-1"_s}, u" Where (1 > 0) AND OCRD.CardType = 'All'"_s},
        {{u"ChkCatCode=1"_s, u"cmbCS=2"_s}, u" Where (1 > 0) AND OCRD.CardType = 'L'"_s},
        {{u"ChkAccKey=1"_s, u"TxtFromCrd=C'01"_s, u"TxtToCrd=C'09"_s},
         u" Where (1 > 0) AND OCRD.CardCode BETWEEN N'C''01' And N'C''09'"_s},
        {{u"ChkAccKey=1"_s}, u" Where (1 > 0) AND OCRD.CardCode BETWEEN N'' And N''"_s},
        {{u"ChkCity=1"_s, u"TxtCity=קריית"_s, u"cmbAddressFrom=0"_s},
         u" Where (1 > 0) AND OCRD.MailCity LIKE N'קריית%'"_s},
        {{u"ChkCity=1"_s, u"TxtCity=ב'"_s, u"cmbAddressFrom=1"_s}, u" Where (1 > 0) AND OCRD.City LIKE N'ב''%'"_s},
        {{u"ChkCity=1"_s, u"cmbAddressFrom=2"_s}, u" Where (1 > 0) AND OCRD.MailCity LIKE N'%'"_s},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=1"_s, u"txtPhone=03"_s}, u" Where (1 > 0) AND OCRD.Phone2 LIKE N'03%'"_s},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=2"_s, u"txtPhone=05"_s}, u" Where (1 > 0) AND OCRD.Cellular LIKE N'05%'"_s},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=3"_s, u"txtPhone=04"_s}, u" Where (1 > 0) AND OCRD.Fax LIKE N'04%'"_s},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=4"_s, u"txtPhone=052"_s}, u" Where (1 > 0) AND OCPR.Cellolar LIKE N'052%'"_s},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=-1"_s}, u" Where (1 > 0) AND OCRD.Phone1 LIKE N'%'"_s},
        {{u"ChkDates=1"_s, u"TxtFromDate=31/12/99"_s, u"TxtToDate=1/1/00"_s, u"CmbDocType=2"_s, u"txtToDocNum=77"_s},
         u" Where (1 > 0) AND ODLN.DocDate Between '12/31/1999' And '01/01/2000' And ODLN.DocNum<=77"_s},
        {{u"ChkDates=1"_s, u"TxtFromDate=15/6/2004"_s, u"TxtToDate=5/3/05"_s, u"CmbDocType=6"_s, u"cmbByDoc=1"_s},
         u" Where (1 > 0) AND OCRD.CardCode Not In (Select Distinct VendorCode From OCHO Where OCHO.PmntDate Between "
         "'06/15/2004' And '03/05/2005')"_s},
        {{u"ChkDates=1"_s, u"cmbByDoc=-1"_s}, u" Where (1 > 0)"_s},
        {{u"ChkItems=1"_s, u"txtFromItem=A'1"_s, u"txtToItem=B"_s},
         u" Where (1 > 0) AND (OCRD.CardCode IN (SELECT CardCode FROM OINV, INV1 Where INV1.DocEntry = OINV.DocEntry "
         "And INV1.ItemCode Between N'A''1' And N'B' GROUP BY CardCode) OR OCRD.CardCode IN (SELECT CardCode FROM "
         "ORIN, RIN1 Where RIN1.DocEntry = ORIN.DocEntry And RIN1.ItemCode Between N'A''1' And N'B' GROUP BY CardCode))"_s},
        {{u"chkQryGroup=1"_s}, u" Where (1 > 0) And (1>0)"_s},
        {{u"ChkUseSQLW=1"_s}, u" Where (1 > 0)"_s},
        {{u"ChkUseSQLW=1"_s, u"txtSQLWhere=OCRD.Notes LIKE 'x%'"_s}, u" Where (1 > 0) And OCRD.Notes LIKE 'x%'"_s},
    };
    for (const auto& [assignments, expected] : cases)
        EXPECT_EQ(BuildWhere(optionsWith(assignments), SessionState{}), expected)
            << assignments.join(u' ').toStdString();

    MailingOptions agent = optionsWith({u"ChkAgent=1"_s});
    agent.agents = {{u"ללא"_s, -1}, {u"דנה"_s, 7}};
    agent.agentIndex = 0;
    EXPECT_EQ(BuildWhere(agent, SessionState{}), u" Where (1 > 0) AND OCRD.SlpCode = -1"_s) << "the first entry";
    agent.agentIndex = 1;
    EXPECT_EQ(BuildWhere(agent, SessionState{}), u" Where (1 > 0) AND OCRD.SlpCode = 7"_s) << "the last entry";
    agent.agentIndex = 2;
    EXPECT_EQ(failureOf([&] { BuildWhere(agent, SessionState{}); }),
              u"נבחר סינון לפי סוכן, אך לא נבחר סוכן מהרשימה. יש לבחור סוכן או לבטל את הסינון."_s);
    SessionState properties;
    properties.QryGroupSel[1] = properties.QryGroupSel[64] = true;
    EXPECT_EQ(BuildWhere(optionsWith({u"chkQryGroup=1"_s}), properties),
              u" Where (1 > 0) And (OCRD.QryGroup1='Y' AND OCRD.QryGroup64='Y')"_s)
        << "the relation is AND until one is chosen";
}

TEST(StatementText, ACriterionThatCannotBeReadIsNamedInsteadOfBreakingTheStatement)
{
    const QString dates = u"ChkDates=1|TxtFromDate=1/1/05|TxtToDate=1/1/05|"_s;
    const std::pair<QString, QString> cases[] = {
        {u"ChkAgent=1"_s, u"נבחר סינון לפי סוכן, אך לא נבחר סוכן מהרשימה. יש לבחור סוכן או לבטל את הסינון."_s},
        {u"ChkDates=1|TxtFromDate=yesterday"_s,
         u"התאריך \"yesterday\" אינו תקין. יש לכתוב תאריך בצורה יום/חודש/שנה, למשל 15/06/2004."_s},
        {dates + u"txtFromDocNum=1; DROP TABLE OCRD"_s,
         u"מספר המסמך הראשון \"1; DROP TABLE OCRD\" אינו מספר שלם. יש לתקן את טווח מספרי המסמכים."_s},
        {dates + u"txtToDocNum=12.5"_s, u"מספר המסמך האחרון \"12.5\" אינו מספר שלם. יש לתקן את טווח מספרי המסמכים."_s},
        {dates + u"txtToDocNum=1234567890123456789"_s,
         u"מספר המסמך האחרון \"1234567890123456789\" אינו מספר שלם. יש לתקן את טווח מספרי המסמכים."_s},
    };
    for (const auto& [assignments, message] : cases)
        EXPECT_EQ(failureOf([&] { BuildWhere(optionsWith(assignments.split(u'|')), SessionState{}); }), message);
    EXPECT_TRUE(BuildWhere(optionsWith((dates + u"txtToDocNum= -123456789012345678 "_s).split(u'|')), SessionState{})
                    .endsWith(u"DocNum<=-123456789012345678"_s))
        << "eighteen digits and a sign are a whole number";
}

TEST(StatementText, DatesAreReadDayFirstWithTwoDigitYearsAndRollOver)
{
    EXPECT_EQ(DateFromText(u"31/12/99"_s), QDate(1999, 12, 31));
    EXPECT_EQ(DateFromText(u"1/1/00"_s), QDate(2000, 1, 1));
    EXPECT_EQ(DateFromText(u"15/6/2004"_s), QDate(2004, 6, 15));
    EXPECT_EQ(DateFromText(u"5/3/05"_s), DateFromText(u"05/03/2005"_s));
    EXPECT_EQ(DateFromText(u"01/01/79"_s), QDate(2079, 1, 1)) << "below 80 is this century";
    EXPECT_EQ(DateFromText(u"01/01/80"_s), QDate(1980, 1, 1));
    EXPECT_EQ(DateFromText(u"1/1/100"_s), QDate(100, 1, 1)) << "three digits are taken as written";
    EXPECT_EQ(DateFromText(u"32/12/2004"_s), QDate(2005, 1, 1));
    EXPECT_EQ(DateFromText(u"1/13/2004"_s), QDate(2005, 1, 1));
    for (const QString& text :
         {u"2004-06-15"_s, QString(), u"1/-1/05"_s, u"+1/1/05"_s, u"1/1/"_s, u"1/1/0x5"_s, u"123/05"_s}) {
        try {
            DateFromText(text);
            ADD_FAILURE() << text.toStdString();
        } catch (const Failure& failure) {
            EXPECT_EQ(failure.description(),
                      u"התאריך \"%1\" אינו תקין. יש לכתוב תאריך בצורה יום/חודש/שנה, למשל 15/06/2004."_s.arg(text));
        }
    }
}

TEST(StatementText, TheAddressExpressionStandsOnlyWhenSwitchedOnAndGiven)
{
    MailingOptions c;
    c.addressFrom = 0;
    c.sqlAddress = u"OCRD.Notes"_s;
    EXPECT_TRUE(BuildSelect(c, 1, 0, true, kLabels).contains(u"OCRD.CardName, OCRD.MailAddres, "_s)) << "switched off";
    c.addressBySql = true;
    EXPECT_TRUE(BuildSelect(c, 1, 0, true, kLabels).contains(u"OCRD.CardName, OCRD.Notes As MailAddres, "_s));
    c.sqlAddress.clear();
    EXPECT_TRUE(BuildSelect(c, 1, 0, true, kLabels).contains(u"OCRD.CardName, OCRD.MailAddres, "_s)) << "nothing given";
}

TEST(StatementText, SelectListsFollowKindSourceLevelAndJoin)
{
    MailingOptions c;
    EXPECT_EQ(
        BuildSelect(c, 1, 0, false, kCardList),
        u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName FROM OCRD LEFT JOIN OCPR ON (OCPR.CardCode = OCRD.CardCode AND OCPR.Name = OCRD.CntctPrsn )"_s);
    c.allContacts = true;
    c.addressFrom = 1;
    c.deptTag = u"1"_s;
    EXPECT_EQ(
        BuildSelect(c, 1, 0, true, kLetters),
        u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName, OCRD.Address MailAddres, OCRD.County MailCounty, OCRD.City "
        u"MailCity, OCRD.ZipCode MailZipCod, OCPR.Name Attn, OCPR.Position Department, OCPR.Address As CntctAddrs, "
        u"OCRD.Block MailBlock, OCST.Name MailState, OCRY.Name MailCountry FROM OCRD LEFT JOIN OCPR ON (OCPR.CardCode "
        u"= OCRD.CardCode )"
        " LEFT JOIN OCRY ON (OCRY.Code = OCRD.Country) LEFT JOIN OCST ON (OCST.Code = OCRD.State1 AND OCST.Country = OCRD.Country)"_s);

    MailingOptions checks;
    checks.dates = true;
    checks.fromDate = checks.toDate = u"1/1/05"_s;
    checks.docType = 6;
    checks.addressBySql = true;
    checks.sqlAddress = u"OCRD.Notes"_s;
    EXPECT_EQ(
        BuildSelect(checks, -1, 6, true, kLabels),
        u"SELECT DISTINCT OCRD.CardCode, OCHO.VendorName As CardName, OCRD.Notes As MailAddres, '' MailCounty, '' MailCity, '' MailZipCod, OCPR.Name Attn, OCPR.Notes1 Department, OCPR.Address As CntctAddrs FROM (OCRD INNER JOIN OCHO ON OCRD.CardCode = OCHO.VendorCode) LEFT JOIN OCPR ON (OCPR.CardCode = OCRD.CardCode AND OCPR.Name = OCRD.CntctPrsn)"_s);
    checks.sortBy = 1;
    EXPECT_EQ(BuildOrderBy(checks, -1, 6, true, kLabels), u" ORDER BY OCHO.VendorName ASC"_s)
        << "the name key is the column the list takes the name from";

    MailingOptions fax;
    fax.faxField[4] = true;
    fax.faxExpr[4] = u"OCRD.Phone2"_s;
    EXPECT_EQ(
        BuildSelect(fax, 1, 0, false, kFax),
        u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName, OCRD.Fax, OCRD.Phone1, OCPR.Name AS Attn, OCPR.Name AS CName, OCPR.Fax AS CFax, OCPR.Position, OCPR.Notes1, OCPR.Notes2, OCRD.Phone2 As Field4 FROM OCRD LEFT JOIN OCPR ON (OCPR.CardCode = OCRD.CardCode AND OCPR.Name = OCRD.CntctPrsn )"_s);
    EXPECT_FALSE(BuildSelect(fax, 1, 0, false, kEmail).contains(u"Field4"_s));
    EXPECT_TRUE(BuildSelect(MailingOptions{}, 1, 0, false, 7).startsWith(u" FROM OCRD"_s));
}

TEST(StatementText, ASortKeyOutsideTheListIsSelectedSoTheDatabaseAcceptsTheOrder)
{
    MailingOptions c;
    c.sortBy = 2;
    c.addressFrom = 0;
    EXPECT_TRUE(BuildSelect(c, 1, 0, false, kCardList).contains(u", OCRD.MailCity AS SortKey1 FROM"_s));
    EXPECT_EQ(BuildOrderBy(c, 1, 0, false, kCardList), u" ORDER BY SortKey1 ASC"_s);
    EXPECT_FALSE(BuildSelect(c, 1, 0, true, kLabels).contains(u"SortKey"_s));
    EXPECT_EQ(BuildOrderBy(c, 1, 0, true, kLabels), u" ORDER BY OCRD.MailCity ASC"_s);

    c.sortBy = 5;
    c.sortDir = -1;
    EXPECT_TRUE(
        BuildSelect(c, 1, 0, true, kLabels).contains(u", OCPR.Cellolar AS SortKey1, OCRD.Cellular AS SortKey2 FROM"_s));
    EXPECT_EQ(BuildOrderBy(c, 1, 0, true, kLabels), u" ORDER BY SortKey1 , SortKey2 "_s);
    EXPECT_EQ(BuildOrderBy(c, 1, 0, true, kMobiles), u" ORDER BY OCPR.Cellolar , OCRD.Cellular "_s);
}

TEST(StatementText, TheCardListNeverGainsAContactColumnAndUserExpressionsHideNoKey)
{
    MailingOptions c;
    c.allContacts = true;
    c.sortBy = 4;
    EXPECT_TRUE(BuildSelect(c, 1, 0, false, kCardList).contains(u", OCRD.MailZipCod AS SortKey1 FROM"_s));
    EXPECT_EQ(BuildOrderBy(c, 1, 0, false, kCardList), u" ORDER BY SortKey1 ASC"_s);
    c.sortBy = 5;
    EXPECT_EQ(BuildOrderBy(c, 1, 0, false, kCardList), u" ORDER BY SortKey1 ASC"_s);
    EXPECT_FALSE(BuildSelect(c, 1, 0, false, kCardList).contains(u"OCPR.Cellolar"_s)) << "one row per card";

    MailingOptions merged;
    merged.sortBy = 5;
    merged.faxField[4] = true;
    merged.faxExpr[4] = u"'+' + OCRD.Cellular"_s;
    EXPECT_TRUE(BuildSelect(merged, 1, 0, false, kFax).contains(u"OCRD.Cellular AS SortKey2"_s));
}

TEST(SelectedCards, TheListIsExactCaseSensitiveAndKeepsDuplicates)
{
    SessionState state;
    EXPECT_FALSE(IsSelectedCard(state, u"C0001"_s));
    EXPECT_FALSE(selectionFilterOn(state, true)) << "an empty list filters nothing";
    replaceSelectedCards(state, {u"C0001"_s, u"C0002"_s, u"C0001"_s});
    EXPECT_EQ(state.WantedCrdCount(), 3);
    EXPECT_TRUE(IsSelectedCard(state, u"C0002"_s));
    EXPECT_FALSE(IsSelectedCard(state, u"c0001"_s));
    EXPECT_FALSE(IsSelectedCard(state, u"C0001 "_s));
    EXPECT_TRUE(selectionFilterOn(state, true));
    EXPECT_FALSE(selectionFilterOn(state, false));
    replaceSelectedCards(state, {});
    EXPECT_FALSE(selectionFilterOn(state, true));
}

}  // namespace
}  // namespace pelmar::test
