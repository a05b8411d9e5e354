#include "common/Fields.h"

namespace pelmar {

QString FieldText(const QVariant& value)
{
    return value.isNull() ? QString() : value.toString();
}

QString TrimField(const QVariant& value)
{
    // Only blanks are removed: line breaks inside an address are part of it.
    const QString text = FieldText(value);
    qsizetype first = 0;
    qsizetype last = text.size();
    while (first < last && text.at(first) == u' ')
        ++first;
    while (last > first && text.at(last - 1) == u' ')
        --last;
    return text.mid(first, last - first);
}

QVariant ValueOrDefault(const QVariant& value, const QVariant& fallback)
{
    if (value.isNull() || value.toString().isEmpty())
        return fallback;
    return value;
}

}  // namespace pelmar
