#pragma once

#include <QString>

namespace pelmar {

// Rewrites the literals of a statement written for SQL Server so that the embedded engine reads
// them the same way: N'text' becomes 'text', and a date literal 'mm/dd/yyyy' becomes the ISO
// 'yyyy-mm-dd' under which the embedded databases store dates. Nothing else is touched, and
// text inside literals and quoted names is never rewritten.
QString adaptLiteralsForSqlite(const QString& sql);

}  // namespace pelmar
