#include "support/Fakes.h"

#include "common/Failure.h"

#include <ostream>

namespace pelmar::test {

bool FakeMessages::question(const QString& title, const QString& text)
{
    boxes.append({QStringLiteral("question"), title, text});
    return answers.isEmpty() ? defaultAnswer : answers.takeFirst();
}

void FakeMessages::information(const QString& title, const QString& text)
{
    boxes.append({QStringLiteral("information"), title, text});
}

void FakeMessages::critical(const QString& title, const QString& text)
{
    boxes.append({QStringLiteral("critical"), title, text});
}

void FakeMessages::exclamation(const QString& text)
{
    boxes.append({QStringLiteral("exclamation"), {}, text});
}

void FakeMessages::plain(const QString& text)
{
    boxes.append({QStringLiteral("plain"), {}, text});
}

std::ostream& operator<<(std::ostream& out, const FakeMessages::Box& box)
{
    return out << box.kind.toStdString() << " [" << box.title.toStdString() << "] " << box.text.toStdString();
}

void FakeBrowser::open(const QString& path)
{
    if (fail)
        throw Failure(QStringLiteral("no browser"));
    opened.append(path);
}

QString FakeFileDialogs::nextAnswer()
{
    return answers.isEmpty() ? QString() : answers.takeFirst();
}

QString FakeFileDialogs::openFile(const QString& filter, int filterIndex)
{
    calls.append({QStringLiteral("open"), filter, filterIndex, {}});
    return nextAnswer();
}

QString FakeFileDialogs::saveFile(const QString& filter, int filterIndex, const QString& defaultName)
{
    calls.append({QStringLiteral("save"), filter, filterIndex, defaultName});
    return nextAnswer();
}

}  // namespace pelmar::test
