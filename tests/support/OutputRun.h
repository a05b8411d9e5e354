#pragma once

#include "common/SessionState.h"
#include "db/DatabaseClient.h"
#include "options/MailingOptions.h"
#include "outputs/Output.h"
#include "settings/SettingsStore.h"
#include "support/Fakes.h"
#include "support/Isolated.h"

#include <memory>

namespace pelmar::test {

// The outputs run on fakes of the outside systems: options and a session of the test's own, a
// settings store in its folder, recording messages, browser, file dialogs and progress.
class OutputRunTest : public Isolated {
protected:
    void SetUp() override;

    Services services() { return {messages, browser, files, *store, database()}; }
    // A context over the test's options and session, as the run button would hand it.
    RunContext context(const RunRequest& request = {});
    // Runs the output the command names.
    void run(const QString& name, const RunRequest& request = {});
    // The database client the runs use; the PostgreSQL driver unless a test says otherwise.
    virtual const DatabaseClient& database() const { return database_; }

    MailingOptions options;
    SessionState state;
    FakeMessages messages;
    FakeBrowser browser;
    FakeFileDialogs files;
    FakeProgress progress;
    StopToken stop{state.StopRequested};
    std::unique_ptr<SettingsStore> store;

private:
    DatabaseClient database_{QStringLiteral("PostgreSQL Unicode")};
};

}  // namespace pelmar::test
