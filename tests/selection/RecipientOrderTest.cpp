// The order of the rows a recipient statement returns, on both engines: for every sort the user
// can choose, with every output kind, address source and document join, each row's sort key,
// worked out from the generated company, follows the key of the row before it in the chosen
// direction. (So every such statement is also one the database accepts.)

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

struct SortCase {
    short kind;
    int sortBy;
    int addressFrom;
    int docType;  // -1: no document join

    // The address of the list comes from the documents only where the list shows an address.
    bool fromDocuments() const
    {
        const bool addressKind = kind == kCardList || kind == kLabels || kind == kLetters;
        return addressFrom == 2 && docType >= 0 && addressKind;
    }

    // The fields the choice orders by, "card:" or "contact:" and the column; none where the list
    // orders by a constant (the city and zip code of a document address).
    QStringList keyFields() const
    {
        const QString zip = addressFrom == 1 ? u"card:ZipCode"_s : u"card:MailZipCod"_s;
        const QString city = addressFrom == 1 ? u"card:City"_s : u"card:MailCity"_s;
        switch (sortBy) {
        case 0: return {u"card:CardCode"_s};
        case 2: return fromDocuments() ? QStringList{} : QStringList{city};
        case 3: return fromDocuments() ? QStringList{} : QStringList{zip};
        case 4: return fromDocuments() ? QStringList{u"contact:Name"_s} : QStringList{u"contact:Name"_s, zip};
        case 5: return {u"contact:Cellolar"_s, u"card:Cellular"_s};
        default: return {u"card:CardName"_s};
        }
    }

    std::string name(int direction) const
    {
        return u"kind %1, sort %2, address %3, documents %4, %5"_s.arg(kind)
            .arg(sortBy)
            .arg(addressFrom)
            .arg(docType)
            .arg(direction ? u"descending"_s : u"ascending"_s)
            .toStdString();
    }
};

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

    // The contact a row stands for (empty for none); std::nullopt when the card has several of
    // that name, so that the row's key cannot be told.
    std::optional<QVariantMap> contactOf(const QString& card, const QVariant& name) const
    {
        QList<QVariantMap> found;
        for (auto it = contacts_.find(card); !name.isNull() && it != contacts_.end() && it.key() == card; ++it) {
            if (it.value().value(u"Name"_s) == name)
                found << it.value();
        }
        return found.size() > 1 ? std::nullopt : std::optional(found.value(0));
    }

    std::optional<QVariantList> keyOf(const QStringList& fields, const Recordset& row) const
    {
        const QString code = row.value(u"CardCode"_s).toString();
        const bool byContact
            = std::any_of(fields.begin(), fields.end(), [](auto& f) { return f.startsWith(u"contact:"_s); });
        const auto contact = byContact ? contactOf(code, row.value(u"Attn"_s)) : QVariantMap{};
        if (!contact)
            return std::nullopt;
        QVariantList key;
        for (const QString& field : fields)
            key << (field.startsWith(u"card:"_s) ? cards_.value(code) : *contact).value(field.section(u':', 1));
        return key;
    }

    // SQLite puts Null first in an ascending order, PostgreSQL last; texts compare as UTF-8 bytes.
    int compare(const QVariantList& a, const QVariantList& b)
    {
        const bool nullIsLowest = QLatin1String(engine().name()) != u"PostgreSQL"_s;
        for (qsizetype i = 0; i < a.size(); ++i) {
            if (a[i].isNull() != b[i].isNull())
                return a[i].isNull() == nullIsLowest ? -1 : 1;
            const QByteArray left = a[i].toString().toUtf8();
            const QByteArray right = b[i].toString().toUtf8();
            if (left != right)
                return left < right ? -1 : 1;
        }
        return 0;
    }

    // How many rows stand before a row they should follow, and how many rows were read.
    std::pair<int, int> misplacedRows(const SortCase& sort, int direction)
    {
        MailingOptions options;
        options.sortBy = sort.sortBy;
        options.sortDir = direction;
        options.addressFrom = sort.addressFrom;
        options.dates = sort.docType >= 0;
        options.docType = std::max(0, sort.docType);
        options.fromDate = u"1/1/03"_s;
        options.toDate = u"31/12/25"_s;
        options.faxField[4] = true;
        options.faxExpr[4] = u"OCRD.Phone2"_s;
        SessionState state;
        state.SboVersionLevel = 1;
        const QStringList fields = sort.keyFields();
        int misplaced = 0;
        int rows = 0;
        std::optional<QVariantList> previous;
        auto result
            = engine().client().open(recipientStatement(options, state, sort.kind, sort.kind != kCardList, true),
                                     engine().connString(u"selection"_s));
        for (; !result->eof(); result->moveNext(), ++rows) {
            const auto key = keyOf(fields, *result);
            misplaced += key && previous && compare(*previous, *key) * (direction == 1 ? -1 : 1) > 0;
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
    for (short kind = kCardList; kind <= kLetters; ++kind) {
        // The card list has no contact to sort by; it falls back to its other key.
        for (int sortBy = -1; sortBy <= (kind == kCardList ? 3 : 5); ++sortBy) {
            for (const auto& [addressFrom, docType] : {std::pair{0, -1}, {1, -1}, {2, -1}, {2, 0}, {2, 6}}) {
                const SortCase sort{kind, sortBy, addressFrom, docType};
                for (const int direction : {0, 1}) {
                    const auto [misplaced, rows] = misplacedRows(sort, direction);
                    EXPECT_EQ(misplaced, 0) << sort.name(direction);
                    EXPECT_GT(rows, 50) << sort.name(direction);
                }
            }
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Engines, RecipientOrder, ::testing::Values(&makeSqliteEngine, &makePostgresEngine),
                         engineName);

}  // namespace
}  // namespace pelmar::test
