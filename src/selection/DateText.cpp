#include "selection/DateText.h"

#include "common/Failure.h"

#include <algorithm>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

[[noreturn]] void refuse(const QString& text)
{
    throw Failure(u"התאריך \"%1\" אינו תקין. יש לכתוב תאריך בצורה יום/חודש/שנה, למשל 15/06/2004."_s.arg(text));
}

int wholeNumber(const QString& piece, const QString& text)
{
    const QString digits = piece.trimmed();
    bool ok = !digits.isEmpty() && std::all_of(digits.begin(), digits.end(), [](QChar c) { return c.isDigit(); });
    const int number = ok ? digits.toInt(&ok) : 0;
    if (!ok)
        refuse(text);
    return number;
}

}  // namespace

// The first "/" is searched from the first character and the second from the fourth, so the
// day may have one or two digits and the month one or two.
QDate DateFromText(const QString& text)
{
    const qsizetype p1 = text.indexOf(u'/');
    const qsizetype p2 = text.indexOf(u'/', 3);
    if (p1 < 0 || p2 <= p1)
        refuse(text);
    int year = wholeNumber(text.mid(p2 + 1), text);
    const int month = wholeNumber(text.mid(p1 + 1, p2 - p1 - 1), text);
    const int day = wholeNumber(text.left(p1), text);
    if (year >= 80 && year <= 99)
        year += 1900;
    else if (year < 80)
        year += 2000;
    const QDate date = QDate(year, 1, 1).addMonths(month - 1).addDays(day - 1);
    if (!date.isValid())
        refuse(text);
    return date;
}

QString sqlDate(const QDate& date)
{
    return date.toString(u"MM/dd/yyyy"_s);
}

}  // namespace pelmar
