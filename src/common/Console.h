#pragma once

#include "common/BrowserWindow.h"
#include "common/FileDialogs.h"
#include "common/Messages.h"
#include "common/Progress.h"

namespace pelmar {

// The outside systems of a run without a window, on a terminal or in a scheduled job.

// True for a typed answer that says yes: "y", "yes", "כ" or "כן", in any case, blanks around
// it allowed.
bool isYesAnswer(const QString& answer);

// Message boxes on standard error, each with its title. A question is answered Yes when the
// caller said so beforehand (--yes); otherwise it is asked on the terminal, and answered No when
// standard input is not one.
class ConsoleMessages : public Messages {
public:
    explicit ConsoleMessages(bool yes) : yes_(yes) {}
    bool question(const QString& title, const QString& text) override;
    void information(const QString& title, const QString& text) override;
    void critical(const QString& title, const QString& text) override;
    void exclamation(const QString& text) override;
    void plain(const QString& text) override;

    // True once a critical box was shown: the command then failed.
    bool failed() const { return failed_; }

private:
    bool yes_;
    bool failed_ = false;
};

// Shows a file by printing its path on standard output; opens it in the real browser as well
// only when asked to.
class ConsoleBrowser : public BrowserWindow {
public:
    ConsoleBrowser(BrowserWindow& browser, bool open) : browser_(browser), open_(open) {}
    void open(const QString& path) override;

private:
    BrowserWindow& browser_;
    bool open_;
};

// Answers every file dialog with the path given beforehand ("" = cancel).
class ConsoleFileDialogs : public FileDialogs {
public:
    explicit ConsoleFileDialogs(QString path) : path_(std::move(path)) {}
    QString openFile(const QString&, int) override { return path_; }
    QString saveFile(const QString&, int, const QString&) override { return path_; }

private:
    QString path_;
};

// A progress line on standard error, rewritten in place, when standard error is a terminal;
// nothing otherwise. A fraction of 0 after progress ends the line.
class ConsoleProgress : public ProgressSink {
public:
    ConsoleProgress();
    void report(const QString& text, double fraction) override;

private:
    bool terminal_;
    bool shown_ = false;
};

}  // namespace pelmar
