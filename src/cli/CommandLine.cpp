#include "cli/CommandLine.h"

#include "outputs/Output.h"

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

using Argument = CommandLineUse::Argument;

// The commands that are not outputs.
const QString kDemo = u"demo"_s;
const QString kSql = u"sql"_s;

bool isCommand(const QString& word)
{
    return word == kDemo || word == kSql || outputNamed(word);
}

// The output commands that take the argument, joined for a message.
QString commandsTaking(Argument argument)
{
    QStringList names;
    for (const Output* output : outputTable()) {
        if (!output->name().isEmpty() && output->commandLine().argument == argument)
            names << output->name();
    }
    return names.join(u" and "_s);
}

QList<int> numbers(const QString& option, const QString& text)
{
    QList<int> list;
    for (const QString& piece : text.split(u',', Qt::SkipEmptyParts)) {
        bool ok = false;
        list << piece.trimmed().toInt(&ok);
        if (!ok)
            throw UsageError(u"%1 takes whole numbers separated by commas, not \"%2\""_s.arg(option, text));
    }
    return list;
}

int kindIn(const QString& text, int low, int high)
{
    bool ok = false;
    const int kind = text.toInt(&ok);
    if (!ok || kind < low || kind > high)
        throw UsageError(u"--kind takes a number from %1 to %2, not \"%3\""_s.arg(low).arg(high).arg(text));
    return kind;
}

class Parser {
public:
    explicit Parser(const QStringList& arguments) : arguments_(arguments) {}

    CommandLine parse()
    {
        CommandLine line;
        while (position_ < arguments_.size()) {
            const QString word = arguments_[position_++];
            if (!word.startsWith(u'-'))
                positional(line, word);
            else
                option(line, word);
        }
        if (line.command.isEmpty() && !line.help && !line.version)
            throw UsageError(u"no command given"_s);
        checkOutputArguments(line);
        return line;
    }

private:
    static void checkOutputArguments(const CommandLine& line)
    {
        const Output* output = outputNamed(line.command);
        const CommandLineUse use = output ? output->commandLine() : CommandLineUse{};
        if (use.argument == Argument::CardCode && line.cardCode.isEmpty())
            throw UsageError(u"%1 needs the code of the card"_s.arg(line.command));
        if (use.fileRequired && line.output.isEmpty())
            throw UsageError(u"%1 needs the file to write: -o FILE"_s.arg(line.command));
        if (line.kind) {
            if (line.command != kSql && use.argument != Argument::Kind)
                throw UsageError(u"--kind belongs to %1 and sql"_s.arg(commandsTaking(Argument::Kind)));
            kindIn(QString::number(*line.kind), line.command == kSql ? 1 : 2, 6);
        }
    }

    QString value(const QString& option)
    {
        if (position_ >= arguments_.size())
            throw UsageError(u"%1 needs a value"_s.arg(option));
        return arguments_[position_++];
    }

    static bool takes(const QString& command, Argument argument)
    {
        const Output* output = outputNamed(command);
        return output && output->commandLine().argument == argument;
    }

    void positional(CommandLine& line, const QString& word)
    {
        if (line.command.isEmpty()) {
            if (!isCommand(word))
                throw UsageError(u"unknown command \"%1\""_s.arg(word));
            line.command = word;
        } else if (takes(line.command, Argument::CardCode) && line.cardCode.isEmpty()) {
            line.cardCode = word;
        } else {
            throw UsageError(u"unexpected \"%1\""_s.arg(word));
        }
    }

    void option(CommandLine& line, const QString& word)
    {
        if (word == u"-o"_s || word == u"--output"_s) {
            line.output = value(word);
        } else if (word == u"--open"_s) {
            line.open = true;
        } else if (word == u"--force"_s) {
            line.force = true;
        } else if (word == u"--kind"_s) {
            line.kind = kindIn(value(word), 1, 6);
        } else if (word == u"--all-details"_s) {
            line.allDetails = true;
        } else if (word == u"--no-order"_s) {
            line.noOrder = true;
        } else if (word == u"--set"_s) {
            const QString assignment = value(word);
            const qsizetype equals = assignment.indexOf(u'=');
            if (equals <= 0)
                throw UsageError(u"--set takes NAME=VALUE, not \"%1\""_s.arg(assignment));
            line.sets.append({assignment.left(equals), assignment.mid(equals + 1)});
        } else if (word == u"--save"_s) {
            line.save = true;
        } else if (word == u"--card"_s) {
            line.cards << value(word);
        } else if (word == u"--cards"_s) {
            line.cardsFile = value(word);
        } else if (word == u"--groups"_s) {
            line.groups = numbers(word, value(word));
        } else if (word == u"--properties"_s) {
            line.properties = numbers(word, value(word));
            for (const int n : *line.properties) {
                if (n < 1 || n > 64)
                    throw UsageError(u"properties are numbered 1 to 64, not %1"_s.arg(n));
            }
        } else if (word == u"--relation"_s) {
            line.relation = value(word).toUpper();
            if (line.relation != u"AND"_s && line.relation != u"OR"_s)
                throw UsageError(u"--relation takes AND or OR"_s);
        } else if (word == u"--yes"_s) {
            line.yes = true;
        } else if (word == u"--help"_s || word == u"-h"_s) {
            line.help = true;
        } else if (word == u"--version"_s) {
            line.version = true;
        } else {
            throw UsageError(u"unknown option \"%1\""_s.arg(word));
        }
    }

    const QStringList& arguments_;
    qsizetype position_ = 0;
};

}  // namespace

CommandLine CommandLine::parse(const QStringList& arguments)
{
    return Parser(arguments).parse();
}

namespace {

// "  SYNOPSIS   summary", the summary on a line of its own under a synopsis too long to share one.
QString commandLine(const QString& synopsis, const QString& summary)
{
    constexpr int kSummaryColumn = 42;
    QString line = u"  "_s + synopsis;
    if (line.size() + 1 > kSummaryColumn)
        line += u'\n' + QString(kSummaryColumn, u' ');
    else
        line = line.leftJustified(kSummaryColumn);
    return line + summary + u'\n';
}

}  // namespace

QString usageText()
{
    QString commands = commandLine(u"demo [--force]"_s, u"create the demo company and point the settings at it"_s);
    for (const Output* output : outputTable()) {
        if (!output->name().isEmpty())
            commands += commandLine(output->commandLine().synopsis, output->commandLine().summary);
    }
    commands += commandLine(u"sql [--kind 1..6] [--all-details] [--no-order]"_s, u"print the recipient statement"_s);
    return uR"(Usage: pelmar                       open the window
       pelmar COMMAND [options]     run headless from the saved settings

Commands:
)"_s + commands
        + uR"(
Options for every command:
  --set NAME=VALUE      set a control after the settings are loaded (text, list index, 0/1,
                        true/false, or LblDept's tag); repeatable
  --save                store the options afterwards, as the save button does
  --card CODE           hand-pick a card (repeatable); --cards FILE reads one code per line
  --groups CODE,...     card groups (turns the card type criterion on)
  --properties N,...    card properties 1..64 (turns the properties criterion on)
  --relation AND|OR     how the properties combine
  --yes                 answer Yes to the questions a run asks
  --help, --version

Exit status: 0 done, 1 the run failed or was refused, 2 a usage error.
)"_s;
}

}  // namespace pelmar
