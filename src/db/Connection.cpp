#include "db/Connection.h"

#include "common/Failure.h"
#include "common/SessionState.h"
#include "db/ConnString.h"
#include "db/DatabaseClient.h"
#include "settings/SettingsStore.h"

#include <cmath>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

constexpr int kStartupLoginTimeout = 4;
constexpr long kIgnoredOpenError = 3022;

}  // namespace

void LoadConnSettings(const SettingsStore& store, SessionState& state)
{
    state.ConnServer = store.value(kPelmarApp, kParamsSection, u"ConnServer"_s, u"server"_s);
    state.ConnUID = store.value(kPelmarApp, kParamsSection, u"ConnUID"_s, u"sa"_s);
    state.ConnPWD = store.value(kPelmarApp, kParamsSection, u"ConnPWD"_s, {});
    state.ConnDataBase
        = store.value(kPelmarApp, kParamsSection, u"ConnDataBase"_s, QString::fromUtf16(kUnconfiguredDatabase));
}

QString configuredSqlServerDriver(const SettingsStore& store)
{
    return store.value(kPelmarApp, kParamsSection, u"SqlServerDriver"_s, {});
}

QString companyConnString(const SessionState& state)
{
    return BuildConnString(state.ConnServer, state.ConnUID, state.ConnPWD, state.ConnDataBase);
}

bool TestConnection(const DatabaseClient& client, const SessionState& state, const QString& database)
{
    const QString name = database.isEmpty() ? state.ConnDataBase : database;
    try {
        client.connect(BuildConnString(state.ConnServer, state.ConnUID, state.ConnPWD, name), kStartupLoginTimeout);
    } catch (const Failure& failure) {
        return failure.number() == kIgnoredOpenError;
    }
    return true;
}

short GetSboVersionLevel(const DatabaseClient& client, const QString& connString)
{
    auto versions = client.open(u"SELECT Version FROM CINF"_s, connString);
    bool numeric = false;
    const double stored = versions->value(u"Version"_s).toString().trimmed().toDouble(&numeric);
    if (!numeric || stored < INT32_MIN || stored > INT32_MAX)
        throw Failure(u"Type mismatch: the company database's version is not a number."_s, 13);
    const auto version = static_cast<qint32>(std::nearbyint(stored));
    return version / 1000 >= 62 ? 1 : 0;
}

}  // namespace pelmar
