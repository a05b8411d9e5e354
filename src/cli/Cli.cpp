#include "cli/Cli.h"

#include "cli/CommandLine.h"
#include "common/Console.h"
#include "common/DesktopBrowser.h"
#include "common/Failure.h"
#include "common/SessionState.h"
#include "common/UserText.h"
#include "db/Connection.h"
#include "db/DatabaseClient.h"
#include "db/OdbcDrivers.h"
#include "demo/DemoCompany.h"
#include "options/OptionBindings.h"
#include "outputs/Initialisation.h"
#include "outputs/Output.h"
#include "selection/SelectBuilder.h"
#include "selection/SelectedCards.h"
#include "settings/SettingsStore.h"

#include <QCoreApplication>
#include <QFile>
#include <QTextStream>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

QTextStream& out()
{
    static QTextStream stream(stdout);
    return stream;
}

QTextStream& err()
{
    static QTextStream stream(stderr);
    return stream;
}

void setOption(MailingOptions& options, const QString& name, const QString& value)
{
    const OptionBinding* binding = optionNamed(name);
    if (!binding)
        throw UsageError(u"--set: there is no control \"%1\" to set"_s.arg(name));
    try {
        setOptionText(*binding, options, value);
    } catch (const Failure&) {
        throw UsageError(u"--set: %1 cannot take \"%2\""_s.arg(name, value));
    }
}

QStringList cardsFromFile(const QString& path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        throw UsageError(u"--cards: cannot read %1: %2"_s.arg(path, file.errorString()));
    QStringList codes;
    for (const QString& line : decodeUserText(file.readAll()).split(u'\n')) {
        const QString code = QString(line).remove(u'\r');
        if (!code.isEmpty())
            codes << code;
    }
    return codes;
}

// The options of the command line over the loaded ones; a picked card, group or property
// switches its criterion on, as the pickers of the window do.
void applyOptions(const CommandLine& line, MailingOptions& options, SessionState& state)
{
    for (const auto& [name, value] : line.sets)
        setOption(options, name, value);
    QStringList cards = line.cards;
    if (!line.cardsFile.isEmpty())
        cards += cardsFromFile(line.cardsFile);
    if (!cards.isEmpty()) {
        replaceSelectedCards(state, cards);
        options.selectAccount = true;
    }
    if (line.groups) {
        state.clearCardGroups();
        for (const int code : *line.groups)
            state.SelCardGroups.append({static_cast<short>(code), true});
        options.catCode = true;
    }
    if (line.properties) {
        state.QryGroupSel.fill(false);
        for (const int n : *line.properties)
            state.QryGroupSel[n] = true;
        options.properties = true;
    }
    if (!line.relation.isEmpty())
        state.QryGroupRelation = line.relation;
}

// "sql": the recipient statement of the chosen (or the requested) kind.
void printStatement(const CommandLine& line, const MailingOptions& options, SessionState& state,
                    const DatabaseClient& database)
{
    state.SboVersionLevel = -1;
    state.SboVersionLevel = GetSboVersionLevel(database, companyConnString(state));
    const short kind = line.kind ? static_cast<short>(*line.kind) : chosenOutputKind(options.outType);
    out() << recipientStatement(options, state, kind, line.allDetails, !line.noOrder) << Qt::endl;
}

void runOutput(const Output& output, const CommandLine& line, const MailingOptions& options, SessionState& state,
               const Services& services)
{
    ConsoleProgress progress;
    StopToken stop(state.StopRequested);
    RunRequest request{line.output, {}, line.cardCode.trimmed()};
    if (line.kind)
        request.kind = static_cast<short>(*line.kind);
    RunContext context{options, state, services, progress, stop, request};
    output.run(context);
    const QString finish = finishText(output, context);
    if (!finish.isEmpty())
        services.messages.information(u"הודעה"_s, finish);
}

int runDemo(const CommandLine& line)
{
    SettingsStore store = SettingsStore::forCurrentUser();
    const auto result = createDemoCompany(store, embeddedCompaniesFolder(), line.force);
    out() << result.message << Qt::endl;
    return 0;
}

// Every other command: the start-up of the window, the command line's options, then the run.
int runCommand(const CommandLine& line)
{
    SettingsStore store = SettingsStore::forCurrentUser();
    const DatabaseClient database(chooseSqlServerDriver(configuredSqlServerDriver(store), installedOdbcDrivers()));
    ConsoleMessages messages(line.yes);
    DesktopBrowser desktop;
    ConsoleBrowser browser(desktop, line.open);
    ConsoleFileDialogs files(line.output);
    SessionState state;
    MailingOptions options;
    initialiseSession(store, database, state, options);
    applyOptions(line, options, state);
    if (line.save)
        SetGetRegParams(1, store, options);
    try {
        if (line.command == u"sql"_s)
            printStatement(line, options, state, database);
        else
            runOutput(*outputNamed(line.command), line, options, state, {messages, browser, files, store, database});
    } catch (const Failure& failure) {
        messages.critical(u"תקלה"_s, failure.description());
    }
    return messages.failed() ? 1 : 0;
}

}  // namespace

int runCommandLine(const QStringList& arguments)
{
    try {
        const CommandLine line = CommandLine::parse(arguments);
        if (line.help) {
            out() << usageText();
            return 0;
        }
        if (line.version) {
            out() << u"pelmar "_s << QCoreApplication::applicationVersion() << Qt::endl;
            return 0;
        }
        return line.command == u"demo"_s ? runDemo(line) : runCommand(line);
    } catch (const UsageError& usage) {
        err() << u"pelmar: "_s << usage.message() << Qt::endl
              << u"Run \"pelmar --help\" for the commands."_s << Qt::endl;
        return 2;
    } catch (const Failure& failure) {
        err() << u"תקלה: "_s << failure.description() << Qt::endl;
        return 1;
    }
}

}  // namespace pelmar
