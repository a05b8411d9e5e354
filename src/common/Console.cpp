#include "common/Console.h"

#include <QTextStream>

#include <cstdio>
#include <unistd.h>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

void say(const QString& title, const QString& text)
{
    QTextStream err(stderr);
    if (!title.isEmpty())
        err << title << u": "_s;
    err << text << Qt::endl;
}

}  // namespace

bool isYesAnswer(const QString& answer)
{
    const QString word = answer.trimmed().toLower();
    return word == u"y"_s || word == u"yes"_s || word == u"כ"_s || word == u"כן"_s;
}

bool ConsoleMessages::question(const QString& title, const QString& text)
{
    if (yes_)
        return true;
    if (!::isatty(STDIN_FILENO)) {
        say(title, text + u" (no: run with --yes to answer yes)"_s);
        return false;
    }
    say(title, text + u" [y/N]"_s);
    QTextStream in(stdin);
    return isYesAnswer(in.readLine());
}

void ConsoleMessages::information(const QString& title, const QString& text)
{
    say(title, text);
}

void ConsoleMessages::critical(const QString& title, const QString& text)
{
    failed_ = true;
    say(title, text);
}

void ConsoleMessages::exclamation(const QString& text)
{
    say({}, text);
}

void ConsoleMessages::plain(const QString& text)
{
    say({}, text);
}

void ConsoleBrowser::open(const QString& path)
{
    QTextStream(stdout) << path << Qt::endl;
    if (open_)
        browser_.open(path);
}

ConsoleProgress::ConsoleProgress() : terminal_(::isatty(STDERR_FILENO) != 0)
{}

void ConsoleProgress::report(const QString& text, double fraction)
{
    if (!terminal_)
        return;
    QTextStream err(stderr);
    if (fraction <= 0 && shown_) {
        err << Qt::endl;
        shown_ = false;
        return;
    }
    // "\x1b[K" clears what a longer earlier line left on the right.
    err << u'\r' << text << u"  "_s << qRound(fraction * 100) << u"%\x1b[K"_s << Qt::flush;
    shown_ = true;
}

}  // namespace pelmar
