#pragma once

#include <QString>

namespace pelmar {

class DatabaseClient;
class SettingsStore;
struct SessionState;

// The database name of an installation that was never configured; start-up does not try it.
inline constexpr char16_t kUnconfiguredDatabase[] = u"tarvel02";

// Reads "ConnServer", "ConnUID", "ConnPWD" and "ConnDataBase" of section "Params" into state,
// with the defaults "server", "sa", "" and "tarvel02". A key that cannot be read keeps the
// value state had.
void LoadConnSettings(const SettingsStore& store, SessionState& state);

// The connection string of the company database of the saved settings.
QString companyConnString(const SessionState& state);

// True when the saved server accepts a connection to database (ConnDataBase when empty)
// within 4 seconds. Never throws and shows nothing.
bool TestConnection(const DatabaseClient& client, const SessionState& state, const QString& database);

// Schema level of the company database: 1 when CINF.Version / 1000 is 62 or more, else 0.
// Throws Failure describing why when the version cannot be read (the level is then -1 and the
// caller stops: nothing may be written on a level that is not known).
short GetSboVersionLevel(const DatabaseClient& client, const QString& connString);

// The ODBC driver the settings name for SQL Server connections ("Params" key
// "SqlServerDriver"); empty when none is named.
QString configuredSqlServerDriver(const SettingsStore& store);

}  // namespace pelmar
