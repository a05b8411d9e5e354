#include "common/Windows1255.h"

#include <QStringDecoder>

#include <array>

namespace pelmar {

namespace {

// Unicode → windows-1255 byte for every character of the code page; 0 marks "not in the code
// page" (NUL itself is handled apart). Built once from the system's own decoder.
const std::array<unsigned char, 65536>& encodingTable()
{
    static const std::array<unsigned char, 65536> table = [] {
        std::array<unsigned char, 65536> map{};
        QStringDecoder decoder("windows-1255", QStringConverter::Flag::Stateless);
        for (int byte = 1; byte < 256; ++byte) {
            const char c = static_cast<char>(byte);
            const QString decoded = decoder.decode(QByteArrayView(&c, 1));
            if (decoded.size() == 1 && decoded.at(0) != QChar::ReplacementCharacter)
                map[decoded.at(0).unicode()] = static_cast<unsigned char>(byte);
        }
        return map;
    }();
    return table;
}

void appendReference(QByteArray& out, char32_t code, bool html)
{
    if (html)
        out += "&#" + QByteArray::number(uint(code)) + ';';
    else
        out += '?';
}

}  // namespace

unsigned char windows1255Byte(char16_t unit)
{
    return unit < 0x80 ? static_cast<unsigned char>(unit) : encodingTable()[unit];
}

QByteArray toWindows1255(const QString& text, bool html)
{
    const auto& table = encodingTable();
    QByteArray out;
    out.reserve(text.size());
    for (qsizetype i = 0; i < text.size(); ++i) {
        const char16_t unit = text.at(i).unicode();
        if (unit < 0x80) {
            out += static_cast<char>(unit);
        } else if (table[unit] != 0) {
            out += static_cast<char>(table[unit]);
        } else if (QChar::isHighSurrogate(unit) && i + 1 < text.size() && text.at(i + 1).isLowSurrogate()) {
            appendReference(out, QChar::surrogateToUcs4(unit, text.at(i + 1).unicode()), html);
            ++i;
        } else {
            appendReference(out, unit, html);
        }
    }
    return out;
}

QString fromWindows1255(const QByteArray& bytes)
{
    QStringDecoder decoder("windows-1255");
    return decoder.decode(bytes);
}

}  // namespace pelmar
