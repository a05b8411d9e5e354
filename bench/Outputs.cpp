#include "bench/Outputs.h"

#include "common/SessionState.h"
#include "db/DatabaseClient.h"
#include "options/MailingOptions.h"
#include "outputs/Output.h"
#include "outputs/Runs.h"
#include "selection/SelectBuilder.h"
#include "settings/SettingsStore.h"
#include "support/Fakes.h"

#include <QTemporaryDir>

using namespace Qt::StringLiterals;

namespace pelmar::bench {

namespace {

// A plain run over every card: the mailing address, sorted by card code, every label line on.
const MailingOptions& everyCard()
{
    static const MailingOptions options = [] {
        MailingOptions plain;
        plain.addressFrom = 0;
        plain.useTitle.fill(true);
        return plain;
    }();
    return options;
}

QString statement(const SessionState& state, short kind, bool details, bool ordered)
{
    SessionState newer = state;
    newer.SboVersionLevel = 1;
    return recipientStatement(everyCard(), newer, kind, details, ordered);
}

// Runs one operation of the outputs as the window would, with fakes for the boxes and dialogs.
template <typename Operation>
void runOperation(const DatabaseClient& client, SessionState& state, Operation operation)
{
    QTemporaryDir settings;
    SettingsStore store(settings.path());
    test::FakeMessages messages;
    test::FakeBrowser browser;
    test::FakeFileDialogs files;
    test::FakeProgress progress;
    StopToken stop(state.StopRequested);
    RunContext context{everyCard(), state, {messages, browser, files, store, client}, progress, stop, {}};
    operation(context);
}

QStringList labelStatements(const SessionState& state)
{
    return {statement(state, kCardList, true, false), statement(state, kLabels, true, true)};
}

void runLabels(const DatabaseClient& client, SessionState& state, const QString& path)
{
    runOperation(client, state, [&](RunContext& context) { CreateLabFile(path, context); });
}

QStringList listStatements(const SessionState& state)
{
    return {statement(state, kLabels, true, true)};
}

void runList(const DatabaseClient& client, SessionState& state, const QString& path)
{
    runOperation(client, state, [&](RunContext& context) { CreateHTML(path, kLabels, context); });
}

QStringList smsStatements(const SessionState& state)
{
    return {statement(state, kMobiles, true, true)};
}

void runSms(const DatabaseClient& client, SessionState& state, const QString& path)
{
    runOperation(client, state, [&](RunContext& context) { CreateSMSFile(path, context); });
}

}  // namespace

const QList<BenchOutput>& benchOutputs()
{
    static const QList<BenchOutput> outputs = {{u"labels"_s, &labelStatements, &runLabels},
                                               {u"list"_s, &listStatements, &runList},
                                               {u"sms"_s, &smsStatements, &runSms}};
    return outputs;
}

const BenchOutput* benchOutput(const QString& name)
{
    for (const BenchOutput& output : benchOutputs()) {
        if (output.name == name)
            return &output;
    }
    return nullptr;
}

}  // namespace pelmar::bench
