#pragma once

#include <QString>

namespace pelmar {

struct MailingOptions;
struct SessionState;

// Output kinds of the recipient query.
enum OutputKind : short {
    kCardList = 1,
    kLabels = 2,
    kFax = 3,
    kEmail = 4,
    kMobiles = 5,
    kLetters = 6,
};

// True when the recipient query joins the document table: the documents criterion is on and
// does not ask for the cards without such documents.
bool documentJoin(const MailingOptions& options);

// The SELECT list and FROM clause of the recipient query for an output kind. The aliases are
// the names every output reads (CardCode, CardName, MailAddres, Attn, ...). level is the
// company's schema level (1, 0 or -1). A sort key the list would not otherwise hold is added
// as a column "SortKey1"/"SortKey2", because the database refuses to order a DISTINCT result
// by a column outside its list. A kind outside 1..6 gives no column list.
QString BuildSelect(const MailingOptions& options, short level, int pDocIndex, bool pAllDetails, short pOutType);

// " ORDER BY key direction[, key2 direction]" from the sort choice and the address source. It
// names the SortKey columns BuildSelect adds, so it must be given the same inputs.
QString BuildOrderBy(const MailingOptions& options, short level, int pDocIndex, bool pAllDetails, short pOutType);

// The whole recipient statement of an output kind: BuildSelect + BuildWhere (+ BuildOrderBy when
// ordered), for the chosen document type at the session's schema level. Throws Failure as
// BuildWhere does.
QString recipientStatement(const MailingOptions& options, const SessionState& state, short pOutType, bool pAllDetails,
                           bool ordered);

}  // namespace pelmar
