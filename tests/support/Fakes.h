#pragma once

#include "common/BrowserWindow.h"
#include "common/FileDialogs.h"
#include "common/Messages.h"
#include "common/Progress.h"

#include <QList>
#include <QString>
#include <QStringList>

namespace pelmar::test {

// Records every box; questions take the scripted answers in order, then defaultAnswer.
class FakeMessages : public Messages {
public:
    struct Box {
        QString kind;  // "question", "information", "critical", "exclamation", "plain"
        QString title;
        QString text;
        bool operator==(const Box&) const = default;
    };

    bool question(const QString& title, const QString& text) override;
    void information(const QString& title, const QString& text) override;
    void critical(const QString& title, const QString& text) override;
    void exclamation(const QString& text) override;
    void plain(const QString& text) override;

    QList<Box> boxes;
    QList<bool> answers;
    bool defaultAnswer = true;
};

std::ostream& operator<<(std::ostream& out, const FakeMessages::Box& box);

// Records the files it was asked to show; can be told to fail.
class FakeBrowser : public BrowserWindow {
public:
    void open(const QString& path) override;
    QStringList opened;
    bool fail = false;
};

// Answers with the scripted paths in order ("" = cancel) and records each call.
class FakeFileDialogs : public FileDialogs {
public:
    struct Call {
        QString kind;  // "open" or "save"
        QString filter;
        int filterIndex = 0;
        QString defaultName;
    };

    QString openFile(const QString& filter, int filterIndex) override;
    QString saveFile(const QString& filter, int filterIndex, const QString& defaultName) override;

    QStringList answers;
    QList<Call> calls;

private:
    QString nextAnswer();
};

// Records every report of a run's progress.
class FakeProgress : public ProgressSink {
public:
    struct Report {
        QString text;
        double fraction;
    };

    void report(const QString& text, double fraction) override { reports.append({text, fraction}); }

    QList<Report> reports;
};

}  // namespace pelmar::test
