#pragma once

#include <QString>

namespace pelmar {

class DatabaseClient;

// The saved-from address in the page's second line.
inline constexpr char16_t kCardPageAddress[] = u"http://www.pelmar.co.il/";

// Writes the HTML page of one business partner to path: general data, properties, addresses
// (the card's two addresses at schema level 0, its address rows at level 1) and contact persons,
// read straight from the company database. The code's apostrophes are doubled in the statements.
// A code that matches no card leaves the page ending after its head. Database values are
// HTML-escaped; Null shows as "&nbsp;". Throws Failure on a database or file failure.
void writeCardPage(const QString& path, const QString& cardCode, const DatabaseClient& client,
                   const QString& connString, short level);

}  // namespace pelmar
