#pragma once

#include <QList>
#include <QPair>
#include <QString>
#include <QStringList>

#include <optional>
#include <stdexcept>

namespace pelmar {

// A command line that cannot be understood; its message says what is wrong.
class UsageError : public std::runtime_error {
public:
    explicit UsageError(const QString& message) : std::runtime_error(message.toStdString()), message_(message) {}
    const QString& message() const { return message_; }

private:
    QString message_;
};

// What "pelmar COMMAND [options]" asks for.
struct CommandLine {
    QString command;  // demo, sql or the name of an output; empty with --help or --version
    QString cardCode;
    QString output;
    bool open = false;
    bool force = false;
    std::optional<int> kind;
    bool allDetails = false;
    bool noOrder = false;
    QList<QPair<QString, QString>> sets;  // control name, value
    bool save = false;
    QStringList cards;
    QString cardsFile;
    std::optional<QList<int>> groups;
    std::optional<QList<int>> properties;
    QString relation;
    bool yes = false;
    bool help = false;
    bool version = false;

    // Throws UsageError for an unknown command or option, a missing value or one out of range.
    static CommandLine parse(const QStringList& arguments);
};

QString usageText();

}  // namespace pelmar
