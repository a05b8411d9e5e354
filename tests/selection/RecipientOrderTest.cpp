// The order of the rows a recipient statement returns, on both engines: for every sort the user
// can choose, each row's sort key, worked out from the generated company, follows the key of the
// row before it in the chosen direction.

#include "common/SessionState.h"
#include "options/MailingOptions.h"
#include "selection/SelectBuilder.h"
#include "support/GeneratedCompany.h"
#include "support/QtPrinting.h"

#include <QHash>

#include <algorithm>
#include <optional>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

enum class Source { Mailing, Card, Documents };

struct SortCase {
    short kind;
    int sortBy;
    int addressFrom;
    bool documents;

    // Where the address of the list comes from: the document address only where the list shows
    // an address at all.
    Source source() const
    {
        if (addressFrom == 1)
            return Source::Card;
        const bool addressKind = kind == kCardList || kind == kLabels || kind == kLetters;
        return addressFrom == 2 && documents && addressKind ? Source::Documents : Source::Mailing;
    }

    std::string name() const
    {
        return QStringLiteral("kind %1, sort %2, address %3%4")
            .arg(kind)
            .arg(sortBy)
            .arg(addressFrom)
            .arg(documents ? u", documents"_s : QString())
            .toStdString();
    }
};

// The fields a sort choice orders by, as "card:<column>" or "contact:<column>"; none where the
// list orders by a constant (the city and zip code of a document address).
QStringList keyFields(const SortCase& sort)
{
    const Source source = sort.source();
    const QString zip = source == Source::Card ? u"card:ZipCode"_s : u"card:MailZipCod"_s;
    switch (sort.sortBy) {
    case 0: return {u"card:CardCode"_s};
    case 1: return {u"card:CardName"_s};
    case 2:
        if (source == Source::Documents)
            return {};
        return {source == Source::Card ? u"card:City"_s : u"card:MailCity"_s};
    case 3: return source == Source::Documents ? QStringList{} : QStringList{zip};
    case 4: return source == Source::Documents ? QStringList{u"contact:Name"_s} : QStringList{u"contact:Name"_s, zip};
    default: return {u"contact:Cellolar"_s, u"card:Cellular"_s};
    }
}

class RecipientOrder : public ::testing::TestWithParam<EngineFactory> {
protected:
    void SetUp() override
    {
        for (const QVariantMap& card : generatedCompany().rows(u"OCRD"_s))
            cards_.insert(card.value(u"CardCode"_s).toString(), card);
        for (const QVariantMap& contact : generatedCompany().rows(u"OCPR"_s))
            contacts_.insert(contact.value(u"CardCode"_s).toString(), contact);
    }

    Engine& engine() { return generatedCompanyEngine(GetParam()); }
    // SQLite puts Null first in an ascending order, PostgreSQL last.
    bool nullIsLowest() { return QLatin1String(engine().name()) != u"PostgreSQL"_s; }

    // The contact a row stands for; std::nullopt when the card has several of that name.
    std::optional<QVariantMap> contactOf(const QString& card, const QVariant& name) const
    {
        std::optional<QVariantMap> found = QVariantMap{};
        if (name.isNull())
            return found;
        int matches = 0;
        for (auto it = contacts_.find(card); it != contacts_.end() && it.key() == card; ++it) {
            if (it.value().value(u"Name"_s) == name) {
                found = it.value();
                ++matches;
            }
        }
        return matches > 1 ? std::nullopt : found;
    }

    // The row's sort key; std::nullopt when it cannot be told which contact the row stands for.
    std::optional<QVariantList> keyOf(const QStringList& fields, const Recordset& row) const
    {
        const QString code = row.value(u"CardCode"_s).toString();
        const bool byContact = std::any_of(fields.begin(), fields.end(),
                                           [](const QString& field) { return field.startsWith(u"contact:"_s); });
        const auto contact = byContact ? contactOf(code, row.value(u"Attn"_s)) : QVariantMap{};
        if (!contact)
            return std::nullopt;
        QVariantList key;
        for (const QString& field : fields) {
            const QString column = field.section(u':', 1);
            key << (field.startsWith(u"card:"_s) ? cards_.value(code).value(column) : contact->value(column));
        }
        return key;
    }

    int compare(const QVariant& a, const QVariant& b)
    {
        if (a.isNull() || b.isNull())
            return a.isNull() == b.isNull() ? 0 : (a.isNull() == nullIsLowest() ? -1 : 1);
        const QByteArray left = a.toString().toUtf8();
        const QByteArray right = b.toString().toUtf8();
        return left < right ? -1 : (left == right ? 0 : 1);
    }

    int compare(const QVariantList& a, const QVariantList& b)
    {
        for (qsizetype i = 0; i < a.size(); ++i) {
            if (const int order = compare(a[i], b[i]))
                return order;
        }
        return 0;
    }

    // How many rows stand before a row they should follow; and how many rows were checked.
    std::pair<int, int> misplacedRows(const SortCase& sort, int direction)
    {
        MailingOptions options;
        options.sortBy = sort.sortBy;
        options.sortDir = direction;
        options.addressFrom = sort.addressFrom;
        options.dates = sort.documents;
        options.fromDate = u"1/1/03"_s;
        options.toDate = u"31/12/25"_s;
        SessionState state;
        state.SboVersionLevel = 1;
        const QString statement = recipientStatement(options, state, sort.kind, sort.kind != kCardList, true);
        const QStringList fields = keyFields(sort);
        int misplaced = 0;
        int rows = 0;
        std::optional<QVariantList> previous;
        auto result = engine().client().open(statement, engine().connString(u"selection"_s));
        for (; !result->eof(); result->moveNext(), ++rows) {
            const auto key = keyOf(fields, *result);
            if (key && previous && compare(*previous, *key) * (direction == 1 ? -1 : 1) > 0)
                ++misplaced;
            previous = key;
        }
        return {misplaced, rows};
    }

private:
    QHash<QString, QVariantMap> cards_;
    QMultiHash<QString, QVariantMap> contacts_;
};

TEST_P(RecipientOrder, EveryChosenOrderIsTheOrderOfTheRows)
{
    QList<SortCase> cases;
    for (const short kind : {kCardList, kLabels, kEmail, kMobiles}) {
        for (int sortBy = 0; sortBy <= 5; ++sortBy) {
            if (kind == kCardList && sortBy >= 4)
                continue;  // the card list has no contact to sort by
            for (const int addressFrom : {0, 1, 2})
                cases << SortCase{kind, sortBy, addressFrom, false};
            cases << SortCase{kind, sortBy, 2, true};
        }
    }
    for (const SortCase& sort : cases) {
        for (const int direction : {0, 1}) {
            const auto [misplaced, rows] = misplacedRows(sort, direction);
            EXPECT_EQ(misplaced, 0) << sort.name() << (direction ? ", descending" : ", ascending");
            EXPECT_GT(rows, 100) << sort.name();
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Engines, RecipientOrder, ::testing::Values(&makeSqliteEngine, &makePostgresEngine),
                         engineName);

}  // namespace
}  // namespace pelmar::test
