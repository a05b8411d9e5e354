#include "outputs/Initialisation.h"

#include "common/SessionState.h"
#include "db/Connection.h"
#include "log/RunLog.h"
#include "options/OptionBindings.h"
#include "outputs/LabelStyles.h"
#include "selection/SalesEmployees.h"

namespace pelmar {

namespace {

// Runs one start-up step; a step that fails is passed over and the next one runs.
template <typename Step>
void ignoringFailure(Step step)
{
    try {
        step();
    } catch (const std::exception&) {}
}

}  // namespace

void initialiseSession(SettingsStore& store, const DatabaseClient& client, SessionState& state, MailingOptions& options)
{
    ignoringFailure([&] { LoadConnSettings(store, state); });
    ignoringFailure([&] { InitLog(); });
    // The employees are the company's: a company that cannot be reached has none, and a stored
    // choice counts only when the refilled list can show it.
    options.agents.clear();
    options.agentIndex = -1;
    ignoringFailure([&] {
        if (state.ConnDataBase != QString::fromUtf16(kUnconfiguredDatabase)
            && TestConnection(client, state, state.ConnDataBase))
            FillCmbAgent(client, companyConnString(state), options);
    });
    ignoringFailure([&] { SetGetRegParams(2, store, options); });
    ignoringFailure([&] { SetGetLabelDefs(2, store, state.LabelDefs); });
    state.CardListSQL.clear();
    state.clearCardGroups();
}

}  // namespace pelmar
