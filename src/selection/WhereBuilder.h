#pragma once

#include <QDate>
#include <QString>

namespace pelmar {

struct MailingOptions;
struct SessionState;

// A value typed by the user, made safe inside an SQL literal: every "'" doubled.
QString sqlText(const QString& value);

// The WHERE clause of the recipient query, starting " Where (1 > 0)", with a fragment for each
// criterion of the options that is switched on; the chosen card groups and properties come from
// the session. Throws Failure naming the criterion when one cannot be read (an unreadable date,
// a document number that is not a whole number, no sales employee chosen).
QString BuildWhere(const MailingOptions& options, const SessionState& state);

// The documents fragment: with relation 0 a date (and number) condition on the joined document
// table; with relation 1 the cards that have no such document; otherwise nothing. Document
// numbers must be whole numbers (or empty); anything else throws Failure.
QString BuildDatesCriteria(const QDate& pFromDate, const QDate& pToDate, int pDocIndex, int pDocRelation,
                           const QString& pFromDocNum, const QString& pToDocNum);

// The items fragment: cards with an A/R invoice or credit note line in the item code range.
QString BuildItemsCriteria(const QString& pFromItem, const QString& pToItem);

// The properties fragment: " And (...)" of the chosen properties joined by the relation.
QString BuildQryGroupCriteria(const SessionState& state);

}  // namespace pelmar
