#include "common/SessionState.h"
#include "options/Lists.h"
#include "options/MailingOptions.h"
#include "selection/SelectBuilder.h"
#include "selection/WhereBuilder.h"
#include "support/GeneratedCompany.h"
#include "support/OptionsWith.h"
#include "support/QtPrinting.h"

#include <QDate>
#include <QSet>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

const MemoryCompany& company()
{
    return generatedCompany();
}

QString text(const QVariantMap& row, const QString& column)
{
    return row.value(column).isNull() ? QString() : row.value(column).toString();
}

bool startsWith(const QVariantMap& row, const QString& column, const QString& prefix)
{
    return !row.value(column).isNull() && row.value(column).toString().startsWith(prefix);
}

QList<QVariantMap> contactsOf(const QVariantMap& card, bool mainOnly)
{
    QList<QVariantMap> found;
    for (const QVariantMap& contact : company().rows(u"OCPR"_s)) {
        if (contact.value(u"CardCode"_s) != card.value(u"CardCode"_s))
            continue;
        if (!mainOnly
            || (!card.value(u"CntctPrsn"_s).isNull() && contact.value(u"Name"_s) == card.value(u"CntctPrsn"_s)))
            found << contact;
    }
    return found;
}

bool hasDocument(const QVariantMap& card, const QString& table, const QString& cardField, const QString& dateField,
                 QDate from, QDate to, int fromNum = INT_MIN)
{
    for (const QVariantMap& doc : company().rows(table)) {
        const QDate date = doc.value(dateField).toDate();
        if (doc.value(cardField) == card.value(u"CardCode"_s) && date >= from && date <= to
            && doc.value(u"DocNum"_s).toInt() >= fromNum)
            return true;
    }
    return false;
}

bool boughtItem(const QVariantMap& card, const QString& from, const QString& to)
{
    for (const auto& [head, lines] : {std::pair{u"OINV"_s, u"INV1"_s}, std::pair{u"ORIN"_s, u"RIN1"_s}}) {
        QSet<int> entries;
        for (const QVariantMap& doc : company().rows(head)) {
            if (doc.value(u"CardCode"_s) == card.value(u"CardCode"_s))
                entries.insert(doc.value(u"DocEntry"_s).toInt());
        }
        for (const QVariantMap& line : company().rows(lines)) {
            const QString item = line.value(u"ItemCode"_s).toString();
            if (entries.contains(line.value(u"DocEntry"_s).toInt()) && item >= from && item <= to)
                return true;
        }
    }
    return false;
}

// The type letter of the first card whose code holds an apostrophe.
QString apostropheCodeType()
{
    for (const QVariantMap& card : company().rows(u"OCRD"_s)) {
        if (text(card, u"CardCode"_s).contains(u'\''))
            return text(card, u"CardType"_s);
    }
    return {};
}

struct SelectionCase {
    QStringList options;  // "Control=value", as the user sets them
    std::function<bool(const QVariantMap& card)> selects;
    std::function<void(MailingOptions&, SessionState&)> pick = {};  // what the pickers choose
};

bool any(const QList<QVariantMap>& contacts, const std::function<bool(const QVariantMap&)>& test)
{
    return std::any_of(contacts.begin(), contacts.end(), test);
}

QList<SelectionCase> selectionCases()
{
    const QDate from(2010, 1, 1);
    const QDate to(2015, 12, 31);
    const QStringList period = {u"ChkDates=1"_s, u"TxtFromDate=1/1/10"_s, u"TxtToDate=31/12/2015"_s};
    const QString apostrophes = apostropheCodeType() + u'\'';
    return {
        {{u"ChkCatCode=1"_s},
         [](const QVariantMap& card) {
             const int group = card.value(u"GroupCode"_s).toInt();
             return text(card, u"CardType"_s) == u"C"_s && (group == 100 || group == 103);
         },
         [](MailingOptions&, SessionState& s) {
             s.SelCardGroups
                 = {CardGroupSel{}, CardGroupSel{100, true}, CardGroupSel{101, false}, CardGroupSel{103, true}};
         }},
        {{u"ChkCatCode=1"_s, u"cmbCS=2"_s},
         [](const QVariantMap& card) { return text(card, u"CardType"_s) == u"L"_s; }},
        {{u"ChkAccKey=1"_s, u"TxtFromCrd=C0000010"_s, u"TxtToCrd=L0000200"_s},
         [](const QVariantMap& card) {
             return text(card, u"CardCode"_s) >= u"C0000010"_s && text(card, u"CardCode"_s) <= u"L0000200"_s;
         }},
        {{u"ChkAccKey=1"_s, u"TxtFromCrd="_s + apostrophes + u"0000000"_s, u"TxtToCrd="_s + apostrophes + u"9999999"_s},
         [=](const QVariantMap& card) { return text(card, u"CardCode"_s).startsWith(apostrophes); }},
        {{u"ChkCity=1"_s, u"TxtCity=חי"_s, u"cmbAddressFrom=0"_s},
         [](const QVariantMap& card) { return startsWith(card, u"MailCity"_s, u"חי"_s); }},
        {{u"ChkCity=1"_s, u"TxtCity=ב"_s, u"cmbAddressFrom=1"_s},
         [](const QVariantMap& card) { return startsWith(card, u"City"_s, u"ב"_s); }},
        {{u"ChkCity=1"_s, u"TxtCity=x' OR '1'='1"_s}, [](const QVariantMap&) { return false; }},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=0"_s, u"txtPhone=04 "_s},
         [](const QVariantMap& card) { return startsWith(card, u"Phone1"_s, u"04 "_s); }},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=1"_s, u"txtPhone=+972"_s},
         [](const QVariantMap& card) { return startsWith(card, u"Phone2"_s, u"+972"_s); }},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=2"_s, u"txtPhone=052"_s},
         [](const QVariantMap& card) { return startsWith(card, u"Cellular"_s, u"052"_s); }},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=3"_s, u"txtPhone=04-"_s},
         [](const QVariantMap& card) { return startsWith(card, u"Fax"_s, u"04-"_s); }},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=4"_s, u"txtPhone=05"_s},
         [](const QVariantMap& card) {
             return any(contactsOf(card, true),
                        [](const QVariantMap& p) { return startsWith(p, u"Cellolar"_s, u"05"_s); });
         }},
        {{u"ChkPhone=1"_s, u"cmbPhoneType=4"_s, u"txtPhone=05"_s, u"ChkAllContact=1"_s},
         [](const QVariantMap& card) {
             return any(contactsOf(card, false),
                        [](const QVariantMap& p) { return startsWith(p, u"Cellolar"_s, u"05"_s); });
         }},
        {{u"ChkAgent=1"_s},
         [](const QVariantMap& card) { return card.value(u"SlpCode"_s).toInt() == 2; },
         [](MailingOptions& c, SessionState&) {
             c.agents = {{u"דנה לוי"_s, 1}, {u"יוסי כהן"_s, 2}};
             c.agentIndex = 1;
         }},
        {period + QStringList{u"txtFromDocNum=1010"_s},
         [=](const QVariantMap& card) {
             return hasDocument(card, u"OINV"_s, u"CardCode"_s, u"DocDate"_s, from, to, 1010);
         }},
        {period + QStringList{u"CmbDocType=8"_s},
         [=](const QVariantMap& card) { return hasDocument(card, u"OCRV"_s, u"CardCode"_s, u"PayDate"_s, from, to); }},
        {period + QStringList{u"CmbDocType=6"_s, u"cmbByDoc=1"_s},
         [=](const QVariantMap& card) {
             return !hasDocument(card, u"OCHO"_s, u"VendorCode"_s, u"PmntDate"_s, from, to);
         }},
        {period + QStringList{u"CmbDocType=4"_s, u"cmbByDoc=1"_s},
         [=](const QVariantMap& card) { return !hasDocument(card, u"OQUT"_s, u"CardCode"_s, u"DocDate"_s, from, to); }},
        {{u"ChkItems=1"_s, u"txtFromItem=I0010"_s, u"txtToItem=I0050"_s},
         [](const QVariantMap& card) { return boughtItem(card, u"I0010"_s, u"I0050"_s); }},
        {{u"ChkItems=1"_s, u"txtFromItem=I'0000"_s, u"txtToItem=I'9999"_s},
         [](const QVariantMap& card) { return boughtItem(card, u"I'0000"_s, u"I'9999"_s); }},
        {{u"chkQryGroup=1"_s},
         [](const QVariantMap& card) {
             return text(card, u"QryGroup3"_s) == u"Y"_s && text(card, u"QryGroup7"_s) == u"Y"_s;
         },
         [](MailingOptions&, SessionState& s) { s.QryGroupSel[3] = s.QryGroupSel[7] = true; }},
        {{u"chkQryGroup=1"_s},
         [](const QVariantMap& card) {
             return text(card, u"QryGroup3"_s) == u"Y"_s || text(card, u"QryGroup7"_s) == u"Y"_s;
         },
         [](MailingOptions&, SessionState& s) {
             s.QryGroupSel[3] = s.QryGroupSel[7] = true;
             s.QryGroupRelation = u"OR"_s;
         }},
        {{u"ChkCatCode=1"_s, u"cmbCS=1"_s, u"ChkCity=1"_s, u"TxtCity=ת"_s, u"ChkDates=1"_s, u"TxtFromDate=1/1/03"_s,
          u"TxtToDate=31/12/25"_s, u"CmbDocType=6"_s},
         [](const QVariantMap& card) {
             return text(card, u"CardType"_s) == u"S"_s && startsWith(card, u"MailCity"_s, u"ת"_s)
                 && hasDocument(card, u"OCHO"_s, u"VendorCode"_s, u"PmntDate"_s, QDate(2003, 1, 1),
                                QDate(2025, 12, 31));
         }},
    };
}

class RecipientSelection : public ::testing::TestWithParam<EngineFactory> {
protected:
    Engine& engine() { return generatedCompanyEngine(GetParam()); }

    std::unique_ptr<Recordset> run(const QString& statement)
    {
        return engine().client().open(statement, engine().connString(u"selection"_s));
    }

    QSet<QString> cardsOf(const MailingOptions& c, const SessionState& s)
    {
        QSet<QString> codes;
        for (auto rows = run(BuildSelect(c, 1, c.docType, false, kCardList) + BuildWhere(c, s)); !rows->eof();
             rows->moveNext())
            codes.insert(rows->value(u"CardCode"_s).toString());
        return codes;
    }
};

TEST_P(RecipientSelection, EachCriterionSelectsExactlyTheCardsItDescribes)
{
    for (const SelectionCase& selection : selectionCases()) {
        MailingOptions criteria = optionsWith(selection.options);
        SessionState state;
        if (selection.pick)
            selection.pick(criteria, state);
        const std::string name = selection.options.join(u' ').toStdString();
        QSet<QString> expected;
        for (const QVariantMap& card : company().rows(u"OCRD"_s)) {
            if (selection.selects(card))
                expected.insert(card.value(u"CardCode"_s).toString());
        }
        const QSet<QString> actual = cardsOf(criteria, state);
        EXPECT_EQ(actual.size(), expected.size()) << name;
        EXPECT_TRUE(actual == expected) << name;
        if (!name.ends_with("TxtCity=x' OR '1'='1")) {
            EXPECT_FALSE(expected.isEmpty()) << name << ": the fixture must make the case meaningful";
        }
    }
}

TEST_P(RecipientSelection, AllContactsGivesOneRowPerContactAndCardsWithoutContactsOnce)
{
    for (const bool all : {false, true}) {
        MailingOptions c;
        c.allContacts = all;
        int expected = 0;
        for (const QVariantMap& card : company().rows(u"OCRD"_s)) {
            QSet<QString> distinct;
            for (const QVariantMap& contact : contactsOf(card, !all))
                distinct.insert(text(contact, u"Name"_s) + u'\x1f' + text(contact, u"E_MailL"_s)
                                + (contact.value(u"E_MailL"_s).isNull() ? u"<null>"_s : QString()));
            expected += std::max<int>(1, static_cast<int>(distinct.size()));
        }
        int rows = 0;
        for (auto result = run(BuildSelect(c, 1, 0, false, kEmail) + BuildWhere(c, SessionState{})); !result->eof();
             result->moveNext())
            ++rows;
        EXPECT_EQ(rows, expected) << (all ? "all contacts" : "main contact only");
    }
}

TEST_P(RecipientSelection, TheAddressSourceAndSchemaLevelChooseTheLabelColumns)
{
    struct AddressCase {
        int source;
        bool join;
        short level;
        std::function<QString(const QVariantMap&)> city;
        std::function<QString(const QVariantMap&)> country;
    };
    const auto countryName = [](const QString& code) {
        for (const QVariantMap& row : company().rows(u"OCRY"_s))
            if (row.value(u"Code"_s).toString() == code)
                return row.value(u"Name"_s).toString();
        return QString();
    };
    const AddressCase cases[] = {
        {0, false, 1, [](const QVariantMap& c) { return text(c, u"MailCity"_s); },
         [&](const QVariantMap& c) { return countryName(text(c, u"MailCountr"_s)); }},
        {1, false, 0, [](const QVariantMap& c) { return text(c, u"City"_s); },
         [](const QVariantMap& c) { return text(c, u"Country"_s); }},
        {2, false, 0, [](const QVariantMap& c) { return text(c, u"MailCity"_s); },
         [](const QVariantMap& c) { return text(c, u"MailCountr"_s); }},
        {2, true, 1, [](const QVariantMap&) { return QString(); }, nullptr},
    };
    QHash<QString, QVariantMap> cards;
    for (const QVariantMap& card : company().rows(u"OCRD"_s))
        cards.insert(card.value(u"CardCode"_s).toString(), card);
    for (const AddressCase& a : cases) {
        MailingOptions c;
        c.addressFrom = a.source;
        if (a.join) {
            c.dates = true;
            c.fromDate = u"1/1/03"_s;
            c.toDate = u"31/12/25"_s;
        }
        int checked = 0;
        auto rows = run(BuildSelect(c, a.level, 0, true, kLabels) + BuildWhere(c, SessionState{})
                        + BuildOrderBy(c, a.level, 0, true, kLabels));
        for (; !rows->eof(); rows->moveNext(), ++checked) {
            const QVariantMap& card = cards[rows->value(u"CardCode"_s).toString()];
            ASSERT_EQ(rows->value(u"MailCity"_s).toString(), a.city(card)) << a.source;
            if (a.country)
                ASSERT_EQ(rows->value(u"MailCountry"_s).toString(), a.country(card)) << a.source;
            else
                ASSERT_FALSE(rows->hasColumn(u"MailCountry"_s));
        }
        EXPECT_GT(checked, 50) << a.source;
    }
}

TEST_P(RecipientSelection, ADocumentsContactIsTheLabelsContactWhereTheDocumentNamesOne)
{
    struct Table {
        QString name, cardField;
        bool namesContact;
    };
    const Table tables[]
        = {{u"OINV"_s, u"CardCode"_s, true},    {u"ORIN"_s, u"CardCode"_s, true}, {u"ODLN"_s, u"CardCode"_s, true},
           {u"OPOR"_s, u"CardCode"_s, true},    {u"OQUT"_s, u"CardCode"_s, true}, {u"ORCT"_s, u"CardCode"_s, true},
           {u"OCHO"_s, u"VendorCode"_s, false}, {u"OVPM"_s, u"CardCode"_s, true}, {u"OCRV"_s, u"CardCode"_s, false}};
    QHash<int, QString> contactNames;
    for (const QVariantMap& contact : company().rows(u"OCPR"_s))
        contactNames.insert(contact.value(u"CntctCode"_s).toInt(), text(contact, u"Name"_s));
    QHash<QString, QString> mainContacts;
    for (const QVariantMap& card : company().rows(u"OCRD"_s)) {
        const auto main = contactsOf(card, true);
        mainContacts.insert(text(card, u"CardCode"_s), main.isEmpty() ? QString() : text(main.first(), u"Name"_s));
    }
    for (int docType = 0; docType < 9; ++docType) {
        const Table& table = tables[docType];
        QMultiHash<QString, QString> documentContacts;
        for (const QVariantMap& doc : company().rows(table.name)) {
            const QVariant contact = doc.value(u"CntctCode"_s);
            documentContacts.insert(text(doc, table.cardField),
                                    contact.isNull() ? QString() : contactNames.value(contact.toInt()));
        }
        MailingOptions c;
        c.dates = true;
        c.fromDate = u"1/1/03"_s;
        c.toDate = u"31/12/25"_s;
        c.docType = docType;
        int otherThanMain = 0;
        for (auto rows = run(recipientStatement(c, SessionState{}, kLabels, true, false)); !rows->eof();
             rows->moveNext()) {
            const QString code = rows->value(u"CardCode"_s).toString();
            const QString attn = rows->value(u"Attn"_s).toString();
            const QString expected
                = table.namesContact && documentContacts.values(code).contains(attn) ? attn : mainContacts.value(code);
            ASSERT_EQ(attn, expected) << table.name.toStdString() << " " << code.toStdString();
            otherThanMain += attn != mainContacts.value(code);
        }
        if (table.namesContact) {
            EXPECT_GT(otherThanMain, 0) << table.name.toStdString() << ": the fixture must tell the two apart";
        }
    }
}

TEST_P(RecipientSelection, EveryKindWithOrWithoutDetailsRunsWithEverySortKeyAndAddressSource)
{
    SessionState state;
    state.SboVersionLevel = 1;
    for (short kind = kCardList; kind <= kLetters; ++kind) {
        for (const bool details : {false, true}) {
            for (int sortBy = -1; sortBy < sortByEntries().size(); ++sortBy) {
                for (const int source : {0, 1, 2}) {
                    MailingOptions c;
                    c.sortBy = sortBy;
                    c.addressFrom = source;
                    c.dates = source == 2;
                    c.fromDate = u"1/1/03"_s;
                    const QString statement = recipientStatement(c, state, kind, details, true);
                    EXPECT_NO_THROW(run(statement)) << statement.toStdString();
                }
            }
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Engines, RecipientSelection, ::testing::Values(&makeSqliteEngine, &makePostgresEngine),
                         engineName);

}  // namespace
}  // namespace pelmar::test
