#pragma once

#include <QString>
#include <QVariant>

namespace pelmar {

// A database value as text with leading and trailing blanks (spaces) removed; Null gives "".
QString TrimField(const QVariant& value);

// The value unless it is Null or the empty text, else the default.
QVariant ValueOrDefault(const QVariant& value, const QVariant& fallback);

// A database value as text, unchanged; Null gives "".
QString FieldText(const QVariant& value);

}  // namespace pelmar
