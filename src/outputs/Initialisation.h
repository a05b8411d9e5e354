#pragma once

namespace pelmar {

class DatabaseClient;
class SettingsStore;
struct MailingOptions;
struct SessionState;

// The start-up that the window and the command line share, step by step, each step's failure
// passed over: the connection settings; the run log of an earlier use deleted; unless the company
// database is still the unconfigured one, a connection test and, when it succeeds, the sales
// employee list; every option of the pages; the label line styles; the card picker's statement
// and the chosen card groups cleared.
void initialiseSession(SettingsStore& store, const DatabaseClient& client, SessionState& state,
                       MailingOptions& options);

}  // namespace pelmar
