#pragma once

#include <QDate>
#include <QString>

namespace pelmar {

// Reads a day/month/year date typed by the user: "5/3/05" and "05/03/2005" both mean 5 March
// 2005. Two-digit years 80..99 are 1980..1999, years below 80 are 2000..2079, larger years are
// taken as written. A month or day out of range rolls over into the next month or year.
// Throws Failure naming the text when it is not three whole numbers separated by "/".
QDate DateFromText(const QString& text);

// A date as SQL Server reads it in the statements: 'mm/dd/yyyy' without the quotes.
QString sqlDate(const QDate& date);

}  // namespace pelmar
