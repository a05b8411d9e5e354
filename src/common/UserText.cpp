#include "common/UserText.h"

#include "common/Windows1255.h"

#include <QStringDecoder>

namespace pelmar {

QString decodeUserText(const QByteArray& bytes)
{
    static const QByteArray bom("\xEF\xBB\xBF");
    if (bytes.startsWith(bom))
        return QString::fromUtf8(bytes.mid(bom.size()));
    QStringDecoder utf8(QStringConverter::Utf8, QStringConverter::Flag::Stateless);
    const QString text = utf8.decode(bytes);
    return utf8.hasError() ? fromWindows1255(bytes) : text;
}

QString isolated(const QString& text)
{
    return QChar(0x2068) + text + QChar(0x2069);
}

}  // namespace pelmar
