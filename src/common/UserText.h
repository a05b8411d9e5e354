#pragma once

#include <QByteArray>
#include <QString>

namespace pelmar {

// Text from a file a user brings (a card list, an HTML body): UTF-8 when it carries a byte-order
// mark or is valid UTF-8, otherwise windows-1255. A byte-order mark is not part of the text.
QString decodeUserText(const QByteArray& bytes);

}  // namespace pelmar
