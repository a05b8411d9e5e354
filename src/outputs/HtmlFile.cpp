#include "outputs/HtmlFile.h"

#include "common/Failure.h"
#include "common/Windows1255.h"

using namespace Qt::StringLiterals;

namespace pelmar {

TextFileWriter::TextFileWriter(const QString& path, bool html) : file_(path), html_(html)
{
    if (QFile::exists(path) && !QFile::remove(path))
        throw Failure(u"לא ניתן למחוק את הקובץ הקודם %1: %2"_s.arg(path, file_.errorString()), 75);
    if (!file_.open(QIODevice::WriteOnly | QIODevice::Truncate))
        fail();
}

TextFileWriter::~TextFileWriter()
{
    file_.close();
}

void TextFileWriter::fail() const
{
    throw Failure(u"לא ניתן לכתוב את הקובץ %1: %2"_s.arg(file_.fileName(), file_.errorString()), 75);
}

void TextFileWriter::line(const QString& text)
{
    QByteArray bytes = toWindows1255(text, html_);
    bytes += "\r\n";
    if (file_.write(bytes) != bytes.size())
        fail();
}

void TextFileWriter::close()
{
    if (!file_.isOpen())
        return;
    if (!file_.flush())
        fail();
    file_.close();
}

QString htmlText(const QString& text)
{
    return text.toHtmlEscaped();
}

}  // namespace pelmar
