#pragma once

#include <QString>

namespace pelmar {

struct Criteria;

// Output kinds of the recipient query.
enum OutputKind : short {
    kCardList = 1,
    kLabels = 2,
    kFax = 3,
    kEmail = 4,
    kMobiles = 5,
    kLetters = 6,
};

// The SELECT list and FROM clause of the recipient query for an output kind. The aliases are
// the names every output reads (CardCode, CardName, MailAddres, Attn, ...). level is the
// company's schema level (1, 0 or -1). A sort key the list would not otherwise hold is added
// as a column "SortKey1"/"SortKey2", because the database refuses to order a DISTINCT result
// by a column outside its list. A kind outside 1..6 gives no column list.
QString BuildSelect(const Criteria& criteria, short level, int pDocIndex, bool pAllDetails, short pOutType);

// " ORDER BY key direction[, key2 direction]" from the sort choice and the address source.
QString BuildOrderBy(const Criteria& criteria, short level, int pDocIndex, short pOutType);

}  // namespace pelmar
