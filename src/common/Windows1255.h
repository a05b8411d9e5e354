#pragma once

#include <QByteArray>
#include <QString>

namespace pelmar {

// Encodes text as windows-1255, the code page of every file the system writes. A character the
// code page cannot hold is written as an HTML numeric character reference ("&#8364;" style)
// when html is true, so that no character is ever lost; in plain text it becomes "?".
QByteArray toWindows1255(const QString& text, bool html);

// The windows-1255 byte of one UTF-16 unit; 0 when the code page has no such character.
unsigned char windows1255Byte(char16_t unit);

// Decodes windows-1255 bytes.
QString fromWindows1255(const QByteArray& bytes);

}  // namespace pelmar
