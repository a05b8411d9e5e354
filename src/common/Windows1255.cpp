#include "common/Windows1255.h"

#include <QStringDecoder>
#include <QStringEncoder>

namespace pelmar {

namespace {

bool representable(QStringEncoder& encoder, QStringView piece)
{
    const QByteArray bytes = encoder.encode(piece);
    return !encoder.hasError() && !(bytes == "?" && piece != u"?");
}

}  // namespace

QByteArray toWindows1255(const QString& text, bool html)
{
    QStringEncoder encoder("windows-1255", QStringConverter::Flag::Stateless);
    QByteArray whole = encoder.encode(text);
    if (!encoder.hasError() && !whole.contains('?'))
        return whole;
    // Slow path, only for text that holds a character the code page lacks (or a "?").
    QByteArray out;
    out.reserve(text.size() + 16);
    for (qsizetype i = 0; i < text.size();) {
        const char32_t code = text.at(i).isHighSurrogate() && i + 1 < text.size()
                                  ? QChar::surrogateToUcs4(text.at(i), text.at(i + 1))
                                  : text.at(i).unicode();
        const qsizetype length = code > 0xFFFF ? 2 : 1;
        const QStringView piece = QStringView(text).mid(i, length);
        QStringEncoder single("windows-1255", QStringConverter::Flag::Stateless);
        if (representable(single, piece))
            out += single.encode(piece);
        else
            out += html ? QByteArray("&#") + QByteArray::number(uint(code)) + ';' : QByteArray("?");
        i += length;
    }
    return out;
}

QString fromWindows1255(const QByteArray& bytes)
{
    QStringDecoder decoder("windows-1255");
    return decoder.decode(bytes);
}

}  // namespace pelmar
