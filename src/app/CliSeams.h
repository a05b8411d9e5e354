#pragma once

#include "common/BrowserWindow.h"
#include "common/FileDialogs.h"
#include "common/Messages.h"

namespace pelmar {

// Message boxes on standard error, each with its title. A question is answered Yes with --yes;
// otherwise it is asked on the terminal, and answered No when standard input is not one.
class CliMessages : public Messages {
public:
    explicit CliMessages(bool yes) : yes_(yes) {}
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

// Opens files in the desktop's browser only when --open was given.
class CliBrowser : public BrowserWindow {
public:
    CliBrowser(BrowserWindow& desktop, bool open) : desktop_(desktop), open_(open) {}
    void open(const QString& path) override;

private:
    BrowserWindow& desktop_;
    bool open_;
};

// Answers every file dialog with the path given on the command line ("" = cancel).
class CliFileDialogs : public FileDialogs {
public:
    explicit CliFileDialogs(QString path) : path_(std::move(path)) {}
    QString openFile(const QString&, int) override { return path_; }
    QString saveFile(const QString&, int, const QString&) override { return path_; }

private:
    QString path_;
};

}  // namespace pelmar
