#pragma once

#include <QByteArray>
#include <QString>

namespace pelmar {

// Text from a file a user brings (a card list, an HTML body): UTF-8 when it carries a byte-order
// mark or is valid UTF-8, otherwise windows-1255. A byte-order mark is not part of the text.
QString decodeUserText(const QByteArray& bytes);

// A value from the database or a file as a right-to-left widget should show it: between Unicode
// first-strong isolates, so that it reads in its own direction ("O'Brien & Sons <Ltd>" and
// "+972-4-..." keep their punctuation where it stands). For display only; files keep their bytes.
QString isolated(const QString& text);

}  // namespace pelmar
