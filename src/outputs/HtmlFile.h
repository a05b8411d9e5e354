#pragma once

#include <QFile>
#include <QString>
#include <QStringEncoder>

namespace pelmar {

// A text file written line by line in windows-1255 with CR LF line ends, as every generated
// file of the system is. A character the code page lacks is written as an HTML numeric
// reference in HTML files and as "?" in plain text files. An earlier file of the same name is
// replaced. Every failure throws Failure naming the file.
class TextFileWriter {
public:
    TextFileWriter(const QString& path, bool html);
    ~TextFileWriter();
    TextFileWriter(const TextFileWriter&) = delete;
    TextFileWriter& operator=(const TextFileWriter&) = delete;

    void line(const QString& text);
    // Flushes and closes; throws Failure when the last bytes cannot be written.
    void close();

private:
    void fail() const;

    QFile file_;
    bool html_;
};

// Text from the database or the user, made safe to stand in HTML: "&", "<", ">" and '"' become
// entities.
QString htmlText(const QString& text);

}  // namespace pelmar
