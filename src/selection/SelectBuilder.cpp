#include "selection/SelectBuilder.h"

#include "common/SessionState.h"
#include "options/Lists.h"
#include "options/MailingOptions.h"
#include "selection/DocTypes.h"
#include "selection/WhereBuilder.h"

#include <QRegularExpression>
#include <QStringList>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

enum class Source { Mailing, Card, Documents };

bool isAddressKind(short kind)
{
    return kind == kCardList || kind == kLabels || kind == kLetters;
}

// The address columns follow the document table only where the column list itself does.
Source sourceOf(const MailingOptions& c, short kind)
{
    if (c.addressFrom == 1)
        return Source::Card;
    if (c.addressFrom == 2 && documentJoin(c) && isAddressKind(kind))
        return Source::Documents;
    return Source::Mailing;
}

QString deptField(const MailingOptions& c)
{
    return c.deptTag == u"1"_s ? u"OCPR.Position"_s : u"OCPR.Notes1"_s;
}

QString addrSql(const MailingOptions& c)
{
    return c.addressBySql && !c.sqlAddress.isEmpty() ? u", "_s + c.sqlAddress + u" As MailAddres"_s : QString();
}

QString orDefault(const QString& value, const QString& fallback)
{
    return value.isEmpty() ? fallback : value;
}

QString nameTableColumns(short level, const QString& block, const QString& country)
{
    if (level == 1)
        return u", "_s + block + u" MailBlock, OCST.Name MailState, OCRY.Name MailCountry"_s;
    if (level == 0)
        return u", '' MailBlock, '' MailState, "_s + country + u" MailCountry"_s;
    return {};
}

QString addressColumns(const MailingOptions& c, short level, int pDocIndex, bool details, short kind)
{
    const DocTypeInfo doc = GetDocTypeInfo(pDocIndex);
    const QString contact = u", OCPR.Name Attn, "_s + deptField(c) + u" Department, OCPR.Address"_s;
    switch (sourceOf(c, kind)) {
    case Source::Documents:
        if (!details)
            return u"SELECT DISTINCT OCRD.CardCode, "_s + doc.TableName + u'.' + doc.NameField + u" As CardName"_s;
        return u"SELECT DISTINCT OCRD.CardCode, "_s + doc.TableName + u'.' + doc.NameField + u" As CardName"_s
            + orDefault(addrSql(c), u", "_s + doc.TableName + u".Address MailAddres"_s)
            + u", '' MailCounty, '' MailCity, '' MailZipCod"_s + contact + u" As CntctAddrs"_s;
    case Source::Card:
        if (!details)
            return u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName"_s;
        return u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName"_s + orDefault(addrSql(c), u", OCRD.Address MailAddres"_s)
            + u", OCRD.County MailCounty, OCRD.City MailCity, OCRD.ZipCode MailZipCod"_s + contact + u" As CntctAddrs"_s
            + nameTableColumns(level, u"OCRD.Block"_s, u"OCRD.Country"_s);
    case Source::Mailing:
        if (!details)
            return u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName"_s;
        return u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName"_s + orDefault(addrSql(c), u", OCRD.MailAddres"_s)
            + u", OCRD.MailCounty, OCRD.MailCity, OCRD.MailZipCod"_s + contact + u" CntctAddrs"_s
            + (level == 1 ? u", OCRD.MailBlock, OCST.Name MailState, OCRY.Name MailCountry"_s
                          : nameTableColumns(level, {}, u"OCRD.MailCountr"_s));
    }
    return {};
}

QString columnList(const MailingOptions& c, short level, int pDocIndex, bool details, short kind)
{
    switch (kind) {
    case kCardList:
    case kLabels:
    case kLetters: return addressColumns(c, level, pDocIndex, details, kind);
    case kFax:
        return u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName, OCRD.Fax, OCRD.Phone1, OCPR.Name AS Attn, "
               "OCPR.Name AS CName, OCPR.Fax AS CFax, OCPR.Position, OCPR.Notes1, OCPR.Notes2"_s;
    case kEmail:
        return u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName, OCRD.E_Mail AS EMail, OCPR.Name As Attn, "
               "OCPR.Name AS CName, OCPR.E_MailL AS CMail"_s;
    case kMobiles:
        return u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName, OCRD.Cellular AS Mobile, OCPR.Name As Attn, "
               "OCPR.Name AS CName, OCPR.Cellolar AS CMobile"_s;
    default: return {};
    }
}

QString mergeColumns(const MailingOptions& c, short kind)
{
    if (kind != kFax && kind != kLetters)
        return {};
    QString columns;
    for (int row = 0; row < mergeRows().size(); ++row) {
        if (mergeRows()[row].free && c.faxField[row])
            columns += u", "_s + c.faxExpr[row] + u" As "_s + mergeRows()[row].formField;
    }
    return columns;
}

QString fromClause(const MailingOptions& c, short level, int pDocIndex, bool details, short kind)
{
    const DocTypeInfo doc = GetDocTypeInfo(pDocIndex);
    const QString& t = doc.TableName;
    QString from;
    if (documentJoin(c)) {
        from = u" FROM (OCRD INNER JOIN "_s + t + u" ON OCRD.CardCode = "_s + t + u'.' + doc.CardField + u")"_s
            + u" LEFT JOIN OCPR ON"_s;
        from += doc.HasContact
            ? u" (OCPR.CardCode = "_s + t + u'.' + doc.CardField + u" And OCPR.CntctCode = "_s + t + u".CntctCode)"_s
            : u" (OCPR.CardCode = OCRD.CardCode AND OCPR.Name = OCRD.CntctPrsn)"_s;
    } else {
        from = u" FROM OCRD LEFT JOIN OCPR ON (OCPR.CardCode = OCRD.CardCode"_s
            + (c.allContacts ? QString() : u" AND OCPR.Name = OCRD.CntctPrsn"_s) + u" )"_s;
    }
    if (isAddressKind(kind) && details && level == 1) {
        const bool card = c.addressFrom == 1;
        const QString country = card ? u"OCRD.Country"_s : u"OCRD.MailCountr"_s;
        const QString state = card ? u"OCRD.State1"_s : u"OCRD.State2"_s;
        from += u" LEFT JOIN OCRY ON (OCRY.Code = "_s + country + u")"_s + u" LEFT JOIN OCST ON (OCST.Code = "_s + state
            + u" AND OCST.Country = "_s + country + u")"_s;
    }
    return from;
}

// The card name as the column list takes it.
QString nameKey(const MailingOptions& c, int pDocIndex, short kind)
{
    const DocTypeInfo doc = GetDocTypeInfo(pDocIndex);
    return sourceOf(c, kind) == Source::Documents ? doc.TableName + u'.' + doc.NameField : u"OCRD.CardName"_s;
}

// The sort keys of the user's choice, first and (for two of the choices) second.
QStringList sortKeys(const MailingOptions& c, int pDocIndex, short kind)
{
    const Source source = sourceOf(c, kind);
    const bool documents = source == Source::Documents;
    const QString name = nameKey(c, pDocIndex, kind);
    const QString city = documents ? u"MailCity"_s : source == Source::Card ? u"OCRD.City"_s : u"OCRD.MailCity"_s;
    const QString zip = documents ? u"MailZipCod"_s : source == Source::Card ? u"OCRD.ZipCode"_s : u"OCRD.MailZipCod"_s;
    switch (c.sortBy) {
    case 0: return {u"OCRD.CardCode"_s};
    case 2: return {city};
    case 3: return {zip};
    case 4: return {u"OCPR.Name"_s, zip};
    case 5: return {u"OCPR.Cellolar"_s, u"OCRD.Cellular"_s};
    default: return {name};
    }
}

// True when the column list holds key, as a column or as an alias.
bool lists(const QString& columns, const QString& key)
{
    const QRegularExpression token(u"(?:^|[\\s,])"_s + QRegularExpression::escape(key) + u"(?:$|[\\s,])"_s);
    return token.match(columns).hasMatch();
}

// Each sort key as the ORDER BY names it; a key missing from the columns is named by the
// SortKey column BuildSelect adds for it (an alias key of the document address is always '').
struct SortPlan {
    QStringList orderBy;
    QString extraColumns;
};

// A contact column added to a list that has none would give a row per contact; such a key is
// left out (the card list then sorts by its other key, or by name).
QStringList usableKeys(const QStringList& keys, const QString& columns, const QString& nameKey)
{
    if (lists(columns, u"OCPR.Name"_s))
        return keys;
    QStringList usable;
    for (const QString& key : keys) {
        if (!key.startsWith(u"OCPR."_s))
            usable << key;
    }
    return usable.isEmpty() ? QStringList{nameKey} : usable;
}

// The columns the builder itself selects, without the user's own expressions, in which a sort key
// is looked for.
QString ownColumns(const MailingOptions& c, short level, int pDocIndex, bool details, short kind)
{
    MailingOptions plain = c;
    plain.addressBySql = false;
    return columnList(plain, level, pDocIndex, details, kind);
}

SortPlan sortPlan(const MailingOptions& c, const QString& columns, int pDocIndex, short kind)
{
    SortPlan plan;
    const QStringList keys = usableKeys(sortKeys(c, pDocIndex, kind), columns, nameKey(c, pDocIndex, kind));
    for (int i = 0; i < keys.size(); ++i) {
        if (columns.isEmpty() || lists(columns, keys[i])) {
            plan.orderBy << keys[i];
            continue;
        }
        const QString alias = u"SortKey"_s + QString::number(i + 1);
        const QString expression = keys[i].contains(u'.') ? keys[i] : u"''"_s;
        plan.extraColumns += u", "_s + expression + u" AS "_s + alias;
        plan.orderBy << alias;
    }
    return plan;
}

QString direction(int sortDir)
{
    switch (sortDir) {
    case 0: return u"ASC"_s;
    case 1: return u"DESC"_s;
    default: return {};
    }
}

}  // namespace

bool documentJoin(const MailingOptions& options)
{
    return options.dates && options.byDoc != 1;
}

QString BuildSelect(const MailingOptions& c, short level, int pDocIndex, bool pAllDetails, short pOutType)
{
    const QString columns = columnList(c, level, pDocIndex, pAllDetails, pOutType) + mergeColumns(c, pOutType);
    const SortPlan plan = sortPlan(c, ownColumns(c, level, pDocIndex, pAllDetails, pOutType), pDocIndex, pOutType);
    return columns + plan.extraColumns + fromClause(c, level, pDocIndex, pAllDetails, pOutType);
}

QString BuildOrderBy(const MailingOptions& c, short level, int pDocIndex, bool pAllDetails, short pOutType)
{
    const QString columns = ownColumns(c, level, pDocIndex, pAllDetails, pOutType);
    const QString dir = direction(c.sortDir);
    QStringList parts;
    for (const QString& key : sortPlan(c, columns, pDocIndex, pOutType).orderBy)
        parts << key + u' ' + dir;
    return u" ORDER BY "_s + parts.join(u", "_s);
}

QString recipientStatement(const MailingOptions& options, const SessionState& state, short pOutType, bool pAllDetails,
                           bool ordered)
{
    const short level = state.SboVersionLevel;
    QString statement
        = BuildSelect(options, level, options.docType, pAllDetails, pOutType) + BuildWhere(options, state);
    if (ordered)
        statement += BuildOrderBy(options, level, options.docType, pAllDetails, pOutType);
    return statement;
}

}  // namespace pelmar
