#include "app/CliSeams.h"

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

bool CliMessages::question(const QString& title, const QString& text)
{
    if (yes_)
        return true;
    if (!::isatty(STDIN_FILENO)) {
        say(title, text + u" (no: run with --yes to answer yes)"_s);
        return false;
    }
    say(title, text + u" [y/N]"_s);
    QTextStream in(stdin);
    const QString answer = in.readLine().trimmed().toLower();
    return answer == u"y"_s || answer == u"yes"_s || answer == u"כ"_s || answer == u"כן"_s;
}

void CliMessages::information(const QString& title, const QString& text)
{
    say(title, text);
}

void CliMessages::critical(const QString& title, const QString& text)
{
    failed_ = true;
    say(title, text);
}

void CliMessages::exclamation(const QString& text)
{
    say({}, text);
}

void CliMessages::plain(const QString& text)
{
    say({}, text);
}

void CliBrowser::open(const QString& path)
{
    if (open_)
        desktop_.open(path);
}

}  // namespace pelmar
