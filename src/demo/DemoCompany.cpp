#include "demo/DemoCompany.h"

#include "db/Connection.h"
#include "demo/SqliteCompanyWriter.h"
#include "settings/SettingsStore.h"

#include <QDir>
#include <QStandardPaths>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

const QString kDemoDatabase = u"demo"_s;
const QString kDemoName = u"פלמר הדגמה בע\"מ"_s;
constexpr int kDemoCards = 400;
constexpr std::uint64_t kDemoSeed = 2026;

// True when the settings name a company other than the demo in that folder (or the default).
bool otherCompanyConfigured(const SettingsStore& store, const QString& folder)
{
    const QString database
        = store.value(kPelmarApp, kParamsSection, u"ConnDataBase"_s, QString::fromUtf16(kUnconfiguredDatabase));
    const QString server = store.value(kPelmarApp, kParamsSection, u"ConnServer"_s, u"server"_s);
    const bool unconfigured = database == QString::fromUtf16(kUnconfiguredDatabase);
    const bool demo = database == kDemoDatabase && server == u"sqlite:"_s + folder;
    return !unconfigured && !demo;
}

}  // namespace

QString embeddedCompaniesFolder()
{
    const QString data = QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation);
    return QDir(data).filePath(u"Pelmar/companies"_s);
}

DemoResult createDemoCompany(SettingsStore& store, const QString& folder, bool force)
{
    QDir().mkpath(folder);
    CompanyOptions options;
    options.seed = kDemoSeed;
    options.cards = kDemoCards;
    options.companyName = kDemoName;
    writeSqliteCompany(QDir(folder).filePath(kDemoDatabase + u".sqlite"_s), options);
    writeSqliteCommon(QDir(folder).filePath(u"sbo-common.sqlite"_s), {{kDemoDatabase, kDemoName}});

    if (otherCompanyConfigured(store, folder) && !force) {
        return {folder, false,
                u"The demo company was written to %1, but the connection settings name another company and were "
                "left alone. Run \"pelmar demo --force\" to switch to the demo company, or choose server "
                "\"sqlite:%1\" and database \"demo\" in the logon dialog."_s.arg(folder)};
    }
    store.setValue(kPelmarApp, kParamsSection, u"ConnServer"_s, u"sqlite:"_s + folder);
    store.setValue(kPelmarApp, kParamsSection, u"ConnUID"_s, u"demo"_s);
    store.setValue(kPelmarApp, kParamsSection, u"ConnPWD"_s, QString());
    store.setValue(kPelmarApp, kParamsSection, u"ConnDataBase"_s, kDemoDatabase);
    // A first sheet of the demo shows the usual lines; lines the user already chose stay as chosen.
    for (int line = 0; line <= 5; ++line) {
        const QString key = u"UseTitle"_s + QString::number(line);
        if (!store.contains(kPelmarApp, kParamsSection, key))
            store.setValue(kPelmarApp, kParamsSection, key, u"1"_s);
    }
    return {folder, true, u"The demo company is ready in %1, and Pelmar is connected to it."_s.arg(folder)};
}

}  // namespace pelmar
