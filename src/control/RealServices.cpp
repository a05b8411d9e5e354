#include "control/RealServices.h"

#include "db/Connection.h"
#include "db/OdbcDrivers.h"

namespace pelmar {

RealServices::RealServices()
    : settings_(SettingsStore::forCurrentUser()),
      database_(chooseSqlServerDriver(configuredSqlServerDriver(settings_), installedOdbcDrivers()))
{}

Services RealServices::services()
{
    return Services{messages_, browser_, files_, settings_, database_};
}

}  // namespace pelmar
