#include "db/SqliteLiterals.h"

#include <QRegularExpression>

namespace pelmar {

namespace {

bool isNameChar(QChar c)
{
    return c.isLetterOrNumber() || c == u'_' || c == u'@' || c == u'#' || c == u'$';
}

// Index just past the literal or quoted name that starts at open (whose quote is sql[open]).
qsizetype endOfQuoted(const QString& sql, qsizetype open)
{
    const QChar quote = sql.at(open);
    const QChar close = quote == u'[' ? QChar(u']') : quote;
    qsizetype i = open + 1;
    while (i < sql.size()) {
        if (sql.at(i) == close) {
            if (i + 1 < sql.size() && sql.at(i + 1) == close) {
                i += 2;
                continue;
            }
            return i + 1;
        }
        ++i;
    }
    return sql.size();
}

QString adaptLiteral(const QString& literal)
{
    static const QRegularExpression usDate(QStringLiteral("^'(\\d{2})/(\\d{2})/(\\d{4})'$"));
    const auto m = usDate.match(literal);
    if (!m.hasMatch())
        return literal;
    return QStringLiteral("'%1-%2-%3'").arg(m.captured(3), m.captured(1), m.captured(2));
}

}  // namespace

QString adaptLiteralsForSqlite(const QString& sql)
{
    QString out;
    out.reserve(sql.size());
    qsizetype i = 0;
    while (i < sql.size()) {
        const QChar c = sql.at(i);
        if (c == u'\'' || c == u'"' || c == u'[') {
            const qsizetype end = endOfQuoted(sql, i);
            const QString quoted = sql.mid(i, end - i);
            out += c == u'\'' ? adaptLiteral(quoted) : quoted;
            i = end;
            continue;
        }
        const bool nationalPrefix = (c == u'N' || c == u'n') && i + 1 < sql.size() && sql.at(i + 1) == u'\''
            && (i == 0 || !isNameChar(sql.at(i - 1)));
        if (!nationalPrefix)
            out += c;
        ++i;
    }
    return out;
}

}  // namespace pelmar
