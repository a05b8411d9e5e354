#pragma once

#include <QByteArray>
#include <QFile>
#include <QString>
#include <QStringView>

namespace pelmar {

// How a piece of text goes into an HTML file.
enum class Html {
    Markup,  // as it is: the file's own markup
    Text,  // a value: "&", "<", ">" and '"' become entities
    TextCrBr,  // a value whose carriage returns become "<br>"
    TextCrCommaBr,  // a value whose carriage returns and commas become "<br>"
};

// A text file written in windows-1255 with CR LF line ends, as every generated file of the
// system is, through a buffer of its own. A character the code page lacks is written as an HTML
// numeric reference in HTML files and as "?" in plain text files. An earlier file of the same
// name is replaced. Every failure throws Failure naming the file. A writer destroyed without
// close() (a run that failed) still writes what it had buffered.
class TextFileWriter {
public:
    TextFileWriter(const QString& path, bool html);
    ~TextFileWriter();
    TextFileWriter(const TextFileWriter&) = delete;
    TextFileWriter& operator=(const TextFileWriter&) = delete;

    // A whole line of markup (or of plain text).
    void line(QStringView text);
    // Bytes already in the code page, written as they are (constant ASCII lines).
    void bytes(const QByteArray& encoded);
    // A piece of a line; endLine() ends it.
    void put(QStringView text, Html mode = Html::Markup);
    void endLine();
    // Writes what is buffered and closes; throws Failure when it cannot.
    void close();

private:
    void flush();
    [[noreturn]] void fail() const;

    QFile file_;
    QByteArray buffer_;
    bool html_;
};

}  // namespace pelmar
