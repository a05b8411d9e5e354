#pragma once

#include <QDateTime>
#include <QString>

namespace pelmar {

class BrowserWindow;

// The run log: "pelmar.log" in the temporary folder, windows-1255 with CR LF, in which the runs
// record the statements they execute. Every line ends with "<br>" so that its copy
// "pmlog.htm" reads as HTML. Writing and deleting never fail the caller: a log that cannot be
// written loses the entry silently.
QString runLogPath();
QString runLogViewPath();

// Deletes the log of an earlier use.
void InitLog();

// Appends one entry: ">>dd-mm-yy+hh:nn<br>", then title + "<br>" when the title is not empty,
// then text + "<br>". "<", ">" and "&" in title and text are written as HTML entities so that
// the view shows the statement as it was run.
void WriteLog(const QString& text, const QString& title, const QDateTime& now = QDateTime::currentDateTime());

// The message shown (titled "הודעה") when there is no log to show.
inline constexpr char16_t kNoRunLog[] = u"היומן אינו נמצא";

// Copies the log over its view file and opens the view in a new browser window. False when
// there is no log, and nothing is opened; throws Failure when the browser cannot be opened.
bool ShowLog(BrowserWindow& browser);

}  // namespace pelmar
