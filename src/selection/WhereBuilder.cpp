#include "selection/WhereBuilder.h"

#include "common/Failure.h"
#include "common/SessionState.h"
#include "options/MailingOptions.h"
#include "selection/DateText.h"
#include "selection/DocTypes.h"

#include <QRegularExpression>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

QString cardGroupsFragment(const MailingOptions& options, const SessionState& state)
{
    QString fragment = u" AND OCRD.CardType = '"_s + CardTypeCode(options.cardType, false) + u"'"_s;
    QString groups;
    for (qsizetype i = 1; i < state.SelCardGroups.size(); ++i) {
        if (!state.SelCardGroups[i].Selected)
            continue;
        if (!groups.isEmpty())
            groups += u" OR "_s;
        groups += u"GroupCode="_s + QString::number(state.SelCardGroups[i].GroupCode);
    }
    if (!groups.isEmpty())
        fragment += u" AND ("_s + groups + u")"_s;
    return fragment;
}

QString phoneColumn(int phoneType)
{
    switch (phoneType) {
    case 1: return u"OCRD.Phone2"_s;
    case 2: return u"OCRD.Cellular"_s;  // "טלפון נייד"
    case 3: return u"OCRD.Fax"_s;  // "פקס"
    case 4: return u"OCPR.Cellolar"_s;
    default: return u"OCRD.Phone1"_s;
    }
}

// The code of the chosen sales employee.
int agentCode(const MailingOptions& options)
{
    if (options.agentIndex < 0 || options.agentIndex >= options.agents.size())
        throw Failure(u"נבחר סינון לפי סוכן, אך לא נבחר סוכן מהרשימה. יש לבחור סוכן או לבטל את הסינון."_s);
    return options.agents.at(options.agentIndex).code;
}

QString documentNumber(const QString& text, const QString& which)
{
    static const QRegularExpression whole(u"^\\s*-?\\d{1,18}\\s*$"_s);
    if (!whole.match(text).hasMatch())
        throw Failure(u"מספר המסמך %1 \"%2\" אינו מספר שלם. יש לתקן את טווח מספרי המסמכים."_s.arg(which, text));
    return text.trimmed();
}

}  // namespace

QString sqlText(const QString& value)
{
    return QString(value).replace(u'\'', u"''"_s);
}

QString BuildDatesCriteria(const QDate& pFromDate, const QDate& pToDate, int pDocIndex, int pDocRelation,
                           const QString& pFromDocNum, const QString& pToDocNum)
{
    const DocTypeInfo doc = GetDocTypeInfo(pDocIndex);
    const QString& t = doc.TableName;
    QString condition
        = t + u'.' + doc.DateField + u" Between '"_s + sqlDate(pFromDate) + u"' And '"_s + sqlDate(pToDate) + u"'"_s;
    if (!pFromDocNum.isEmpty())
        condition += u" And "_s + t + u".DocNum>="_s + documentNumber(pFromDocNum, u"הראשון"_s);
    if (!pToDocNum.isEmpty())
        condition += u" And "_s + t + u".DocNum<="_s + documentNumber(pToDocNum, u"האחרון"_s);
    if (pDocRelation == 0)
        return u" AND "_s + condition;
    if (pDocRelation == 1)
        return u" AND OCRD.CardCode Not In (Select Distinct "_s + doc.CardField + u" From "_s + t + u" Where "_s
            + condition + u")"_s;
    return {};
}

QString BuildItemsCriteria(const QString& pFromItem, const QString& pToItem)
{
    const QString range = u"' And N'"_s;
    const QString from = sqlText(pFromItem);
    const QString to = sqlText(pToItem);
    const QString invoices = u"SELECT CardCode FROM OINV, INV1 Where INV1.DocEntry = OINV.DocEntry"
                             " And INV1.ItemCode Between N'"_s
        + from + range + to + u"' GROUP BY CardCode"_s;
    const QString credits = u"SELECT CardCode FROM ORIN, RIN1 Where RIN1.DocEntry = ORIN.DocEntry"
                            " And RIN1.ItemCode Between N'"_s
        + from + range + to + u"' GROUP BY CardCode"_s;
    return u" AND (OCRD.CardCode IN ("_s + invoices + u") OR OCRD.CardCode IN ("_s + credits + u"))"_s;
}

QString BuildQryGroupCriteria(const SessionState& state)
{
    const QString relation = state.QryGroupRelation.isEmpty() ? u"AND"_s : state.QryGroupRelation;
    QString list;
    for (int n = 1; n <= 64; ++n) {
        if (!state.QryGroupSel[n])
            continue;
        if (!list.isEmpty())
            list += u' ' + relation + u' ';
        list += u"OCRD.QryGroup"_s + QString::number(n) + u"='Y'"_s;
    }
    if (list.isEmpty())
        list = u"1>0"_s;
    return u" And ("_s + list + u")"_s;
}

QString BuildWhere(const MailingOptions& c, const SessionState& state)
{
    QString where = u" Where (1 > 0)"_s;
    if (c.catCode)
        where += cardGroupsFragment(c, state);
    if (c.codeRange)
        where += u" AND OCRD.CardCode BETWEEN N'"_s + sqlText(c.fromCard) + u"' And N'"_s + sqlText(c.toCard) + u"'"_s;
    if (c.city) {
        const QString column = c.addressFrom == 1 ? u"OCRD.City"_s : u"OCRD.MailCity"_s;
        where += u" AND "_s + column + u" LIKE N'"_s + sqlText(c.cityPrefix) + u"%'"_s;
    }
    if (c.phone)
        where += u" AND "_s + phoneColumn(c.phoneType) + u" LIKE N'"_s + sqlText(c.phonePrefix) + u"%'"_s;
    if (c.agent)
        where += u" AND OCRD.SlpCode = "_s + QString::number(agentCode(c));
    if (c.dates)
        where += BuildDatesCriteria(DateFromText(c.fromDate), DateFromText(c.toDate), c.docType, c.byDoc, c.fromDocNum,
                                    c.toDocNum);
    if (c.items)
        where += BuildItemsCriteria(c.fromItem, c.toItem);
    if (c.properties)
        where += BuildQryGroupCriteria(state);
    if (c.sqlWhere && !c.sqlWhereText.isEmpty())
        where += u" And "_s + c.sqlWhereText;
    return where;
}

}  // namespace pelmar
