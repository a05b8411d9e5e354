#include "common/SessionState.h"
#include "options/MailingOptions.h"
#include "selection/SelectBuilder.h"
#include "selection/WhereBuilder.h"
#include "support/GeneratedCompany.h"
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
    const char* name;
    std::function<void(MailingOptions&, SessionState&)> set;
    std::function<bool(const QVariantMap& card)> selects;
};

QList<SelectionCase> selectionCases()
{
    const QDate from(2010, 1, 1);
    const QDate to(2015, 12, 31);
    return {
        {"customers of two groups",
         [](MailingOptions& c, SessionState& s) {
             c.catCode = true;
             s.SelCardGroups
                 = {CardGroupSel{}, CardGroupSel{100, true}, CardGroupSel{101, false}, CardGroupSel{103, true}};
         },
         [](const QVariantMap& card) {
             const int group = card.value(u"GroupCode"_s).toInt();
             return text(card, u"CardType"_s) == u"C"_s && (group == 100 || group == 103);
         }},
        {"leads",
         [](MailingOptions& c, SessionState&) {
             c.catCode = true;
             c.cardType = 2;
         },
         [](const QVariantMap& card) { return text(card, u"CardType"_s) == u"L"_s; }},
        {"code range",
         [](MailingOptions& c, SessionState&) {
             c.codeRange = true;
             c.fromCard = u"C0000010"_s;
             c.toCard = u"L0000200"_s;
         },
         [](const QVariantMap& card) {
             const QString code = text(card, u"CardCode"_s);
             return code >= u"C0000010"_s && code <= u"L0000200"_s;
         }},
        {"codes with an apostrophe",
         [](MailingOptions& c, SessionState&) {
             c.codeRange = true;
             c.fromCard = apostropheCodeType() + u"'0000000"_s;
             c.toCard = apostropheCodeType() + u"'9999999"_s;
         },
         [](const QVariantMap& card) { return text(card, u"CardCode"_s).startsWith(apostropheCodeType() + u'\''); }},
        {"city of the mailing address",
         [](MailingOptions& c, SessionState&) {
             c.city = true;
             c.cityPrefix = u"חי"_s;
             c.addressFrom = 0;
         },
         [](const QVariantMap& card) { return startsWith(card, u"MailCity"_s, u"חי"_s); }},
        {"city of the card address",
         [](MailingOptions& c, SessionState&) {
             c.city = true;
             c.cityPrefix = u"ב"_s;
             c.addressFrom = 1;
         },
         [](const QVariantMap& card) { return startsWith(card, u"City"_s, u"ב"_s); }},
        {"hostile city",
         [](MailingOptions& c, SessionState&) {
             c.city = true;
             c.cityPrefix = u"x' OR '1'='1"_s;
         },
         [](const QVariantMap&) { return false; }},
        {"phone 1",
         [](MailingOptions& c, SessionState&) {
             c.phone = true;
             c.phoneType = 0;
             c.phonePrefix = u"04 "_s;
         },
         [](const QVariantMap& card) { return startsWith(card, u"Phone1"_s, u"04 "_s); }},
        {"phone 2",
         [](MailingOptions& c, SessionState&) {
             c.phone = true;
             c.phoneType = 1;
             c.phonePrefix = u"+972"_s;
         },
         [](const QVariantMap& card) { return startsWith(card, u"Phone2"_s, u"+972"_s); }},
        {"mobile",
         [](MailingOptions& c, SessionState&) {
             c.phone = true;
             c.phoneType = 2;
             c.phonePrefix = u"052"_s;
         },
         [](const QVariantMap& card) { return startsWith(card, u"Cellular"_s, u"052"_s); }},
        {"fax",
         [](MailingOptions& c, SessionState&) {
             c.phone = true;
             c.phoneType = 3;
             c.phonePrefix = u"04-"_s;
         },
         [](const QVariantMap& card) { return startsWith(card, u"Fax"_s, u"04-"_s); }},
        {"main contact's mobile",
         [](MailingOptions& c, SessionState&) {
             c.phone = true;
             c.phoneType = 4;
             c.phonePrefix = u"05"_s;
         },
         [](const QVariantMap& card) {
             const auto contacts = contactsOf(card, true);
             return std::any_of(contacts.begin(), contacts.end(),
                                [](const QVariantMap& p) { return startsWith(p, u"Cellolar"_s, u"05"_s); });
         }},
        {"any contact's mobile",
         [](MailingOptions& c, SessionState&) {
             c.phone = true;
             c.phoneType = 4;
             c.phonePrefix = u"05"_s;
             c.allContacts = true;
         },
         [](const QVariantMap& card) {
             const auto contacts = contactsOf(card, false);
             return std::any_of(contacts.begin(), contacts.end(),
                                [](const QVariantMap& p) { return startsWith(p, u"Cellolar"_s, u"05"_s); });
         }},
        {"sales employee",
         [](MailingOptions& c, SessionState&) {
             c.agent = true;
             c.agents = {{u"יוסי כהן"_s, 2}};
             c.agentIndex = 0;
         },
         [](const QVariantMap& card) { return card.value(u"SlpCode"_s).toInt() == 2; }},
        {"invoices in a period from a number",
         [](MailingOptions& c, SessionState&) {
             c.dates = true;
             c.fromDate = u"1/1/10"_s;
             c.toDate = u"31/12/2015"_s;
             c.fromDocNum = u"1010"_s;
         },
         [=](const QVariantMap& card) {
             return hasDocument(card, u"OINV"_s, u"CardCode"_s, u"DocDate"_s, from, to, 1010);
         }},
        {"credit card payments in a period",
         [](MailingOptions& c, SessionState&) {
             c.dates = true;
             c.fromDate = u"1/1/10"_s;
             c.toDate = u"31/12/15"_s;
             c.docType = 8;
         },
         [=](const QVariantMap& card) { return hasDocument(card, u"OCRV"_s, u"CardCode"_s, u"PayDate"_s, from, to); }},
        {"no checks in a period",
         [](MailingOptions& c, SessionState&) {
             c.dates = true;
             c.fromDate = u"1/1/10"_s;
             c.toDate = u"31/12/15"_s;
             c.docType = 6;
             c.byDoc = 1;
         },
         [=](const QVariantMap& card) {
             return !hasDocument(card, u"OCHO"_s, u"VendorCode"_s, u"PmntDate"_s, from, to);
         }},
        {"no quotations in a period",
         [](MailingOptions& c, SessionState&) {
             c.dates = true;
             c.fromDate = u"1/1/10"_s;
             c.toDate = u"31/12/15"_s;
             c.docType = 4;
             c.byDoc = 1;
         },
         [=](const QVariantMap& card) { return !hasDocument(card, u"OQUT"_s, u"CardCode"_s, u"DocDate"_s, from, to); }},
        {"items bought",
         [](MailingOptions& c, SessionState&) {
             c.items = true;
             c.fromItem = u"I0010"_s;
             c.toItem = u"I0050"_s;
         },
         [](const QVariantMap& card) { return boughtItem(card, u"I0010"_s, u"I0050"_s); }},
        {"items with an apostrophe",
         [](MailingOptions& c, SessionState&) {
             c.items = true;
             c.fromItem = u"I'0000"_s;
             c.toItem = u"I'9999"_s;
         },
         [](const QVariantMap& card) { return boughtItem(card, u"I'0000"_s, u"I'9999"_s); }},
        {"properties 3 and 7",
         [](MailingOptions& c, SessionState& s) {
             c.properties = true;
             s.QryGroupSel[3] = s.QryGroupSel[7] = true;
         },
         [](const QVariantMap& card) {
             return text(card, u"QryGroup3"_s) == u"Y"_s && text(card, u"QryGroup7"_s) == u"Y"_s;
         }},
        {"properties 3 or 7",
         [](MailingOptions& c, SessionState& s) {
             c.properties = true;
             s.QryGroupSel[3] = s.QryGroupSel[7] = true;
             s.QryGroupRelation = u"OR"_s;
         },
         [](const QVariantMap& card) {
             return text(card, u"QryGroup3"_s) == u"Y"_s || text(card, u"QryGroup7"_s) == u"Y"_s;
         }},
        {"suppliers in a city with checks",
         [](MailingOptions& c, SessionState&) {
             c.catCode = true;
             c.cardType = 1;
             c.city = true;
             c.cityPrefix = u"ת"_s;
             c.dates = true;
             c.fromDate = u"1/1/03"_s;
             c.toDate = u"31/12/25"_s;
             c.docType = 6;
         },
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
        MailingOptions criteria;
        SessionState state;
        selection.set(criteria, state);
        QSet<QString> expected;
        for (const QVariantMap& card : company().rows(u"OCRD"_s)) {
            if (selection.selects(card))
                expected.insert(card.value(u"CardCode"_s).toString());
        }
        const QSet<QString> actual = cardsOf(criteria, state);
        EXPECT_EQ(actual.size(), expected.size()) << selection.name;
        EXPECT_TRUE(actual == expected) << selection.name;
        if (!QStringList{u"hostile city"_s}.contains(QLatin1String(selection.name))) {
            EXPECT_FALSE(expected.isEmpty()) << selection.name << ": the fixture must make the case meaningful";
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
                        + BuildOrderBy(c, a.level, 0, kLabels));
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

TEST_P(RecipientSelection, EveryOrderTheUserCanChooseIsAcceptedByTheDatabase)
{
    for (short kind = 1; kind <= 6; ++kind) {
        for (int sortBy = -1; sortBy <= 5; ++sortBy) {
            for (int source = 0; source <= 2; ++source) {
                for (const int docType : {-1, 0, 6}) {
                    MailingOptions c;
                    c.sortBy = sortBy;
                    c.addressFrom = source;
                    c.dates = docType >= 0;
                    c.docType = docType;
                    c.fromDate = u"1/1/03"_s;
                    c.toDate = u"31/12/25"_s;
                    c.faxField[4] = true;
                    c.faxExpr[4] = u"OCRD.Phone2"_s;
                    const bool details = kind != kCardList;
                    const QString statement = BuildSelect(c, 1, docType, details, kind) + BuildWhere(c, SessionState{})
                        + BuildOrderBy(c, 1, docType, kind);
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
