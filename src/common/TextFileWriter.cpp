#include "common/TextFileWriter.h"

#include "common/Failure.h"
#include "common/Windows1255.h"

#include <cstring>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

constexpr qsizetype kFlushAt = 1 << 16;
// The longest bytes one character can become: a numeric reference "&#1114111;".
constexpr qsizetype kWidest = 10;

const char* entityOf(char16_t c, Html mode)
{
    if (mode == Html::Markup)
        return nullptr;
    switch (c) {
    case u'&': return "&amp;";
    case u'<': return "&lt;";
    case u'>': return "&gt;";
    case u'"': return "&quot;";
    case u'\r': return mode == Html::Text ? nullptr : "<br>";
    case u',': return mode == Html::TextCrCommaBr ? "<br>" : nullptr;
    default: return nullptr;
    }
}

}  // namespace

TextFileWriter::TextFileWriter(const QString& path, bool html) : file_(path), html_(html)
{
    if (QFile::exists(path) && !QFile::remove(path))
        throw Failure(u"לא ניתן למחוק את הקובץ הקודם %1: %2"_s.arg(path, file_.errorString()), 75);
    if (!file_.open(QIODevice::WriteOnly | QIODevice::Truncate))
        fail();
    buffer_.reserve(kFlushAt + 4096);
}

// A run that fails leaves the file as far as it was written, so what is buffered goes out too.
TextFileWriter::~TextFileWriter()
{
    if (file_.isOpen() && !buffer_.isEmpty())
        file_.write(buffer_);
    file_.close();
}

void TextFileWriter::fail() const
{
    throw Failure(u"לא ניתן לכתוב את הקובץ %1: %2"_s.arg(file_.fileName(), file_.errorString()), 75);
}

void TextFileWriter::flush()
{
    if (file_.write(buffer_) != buffer_.size())
        fail();
    buffer_.clear();
}

void TextFileWriter::put(QStringView text, Html mode)
{
    const qsizetype used = buffer_.size();
    buffer_.resize(used + text.size() * kWidest);
    char* out = buffer_.data() + used;
    for (qsizetype i = 0; i < text.size(); ++i) {
        const char16_t c = text[i].unicode();
        if (const char* entity = entityOf(c, mode)) {
            const size_t length = std::strlen(entity);
            std::memcpy(out, entity, length);
            out += length;
        } else if (const unsigned char byte = windows1255Byte(c); byte != 0 || c == 0) {
            *out++ = static_cast<char>(byte);
        } else {
            const qsizetype pair = QChar::isHighSurrogate(c) && i + 1 < text.size() ? 2 : 1;
            const QByteArray encoded = toWindows1255(text.mid(i, pair).toString(), html_);
            std::memcpy(out, encoded.constData(), encoded.size());
            out += encoded.size();
            i += pair - 1;
        }
    }
    buffer_.resize(out - buffer_.data());
}

void TextFileWriter::endLine()
{
    buffer_.append("\r\n", 2);
    if (buffer_.size() >= kFlushAt)
        flush();
}

void TextFileWriter::line(QStringView text)
{
    put(text);
    endLine();
}

void TextFileWriter::bytes(const QByteArray& encoded)
{
    buffer_.append(encoded);
    if (buffer_.size() >= kFlushAt)
        flush();
}

void TextFileWriter::close()
{
    if (!file_.isOpen())
        return;
    flush();
    if (!file_.flush())
        fail();
    file_.close();
}

}  // namespace pelmar
