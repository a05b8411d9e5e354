#pragma once

#include <QString>
#include <QStringList>
#include <QVariantMap>

namespace pelmar::test {

// An INSERT of one row into a company table; columns left out are Null. Text is quoted with its
// apostrophes doubled, numbers are written as they are, dates as 'yyyy-mm-dd'.
QString insertRow(const QString& table, const QVariantMap& values);

// The statements that create a small hand-made company: the company tables, CINF with the given
// version, and the rows given.
QStringList handMadeCompany(int version, const QStringList& rows);

}  // namespace pelmar::test
