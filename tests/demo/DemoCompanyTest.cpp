#include "common/SessionState.h"
#include "db/ConnString.h"
#include "db/Connection.h"
#include "db/DatabaseClient.h"
#include "demo/DemoCompany.h"
#include "settings/SettingsStore.h"
#include "support/Isolated.h"

#include <QFile>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class DemoCompanyTest : public Isolated {
protected:
    QString setting(const QString& key) { return store.value(u"Pelmar"_s, u"Params"_s, key, u"<none>"_s); }
    SettingsStore store{path(u"config/Pelmar"_s)};
    QString folder = path(u"data/companies"_s);
};

TEST_F(DemoCompanyTest, AFreshInstallationIsPointedAtTheDemoCompany)
{
    const DemoResult result = createDemoCompany(store, folder, false);
    EXPECT_TRUE(result.settingsChanged);
    EXPECT_EQ(setting(u"ConnServer"_s), u"sqlite:"_s + folder);
    EXPECT_EQ(setting(u"ConnDataBase"_s), u"demo"_s);

    SessionState state;
    LoadConnSettings(store, state);
    const DatabaseClient client{QString()};
    EXPECT_EQ(GetSboVersionLevel(client, companyConnString(state)), 1);
    auto cards = client.open(u"SELECT COUNT(*) AS N FROM OCRD"_s, companyConnString(state));
    EXPECT_GE(cards->value(u"N"_s).toInt(), 200);
    auto companies = client.open(u"SELECT dbName FROM SRGC"_s,
                                 BuildConnString(state.ConnServer, state.ConnUID, state.ConnPWD, u"sbo-common"_s));
    EXPECT_EQ(companies->value(u"dbName"_s).toString(), u"demo"_s);
}

TEST_F(DemoCompanyTest, SettingsOfAnotherCompanyAreLeftAloneUnlessForced)
{
    store.setValue(u"Pelmar"_s, u"Params"_s, u"ConnServer"_s, u"sql01"_s);
    store.setValue(u"Pelmar"_s, u"Params"_s, u"ConnDataBase"_s, u"SBO_Live"_s);
    const DemoResult kept = createDemoCompany(store, folder, false);
    EXPECT_FALSE(kept.settingsChanged);
    EXPECT_TRUE(kept.message.contains(u"--force"_s));
    EXPECT_EQ(setting(u"ConnDataBase"_s), u"SBO_Live"_s);
    EXPECT_TRUE(QFile::exists(folder + u"/demo.sqlite"_s));

    EXPECT_TRUE(createDemoCompany(store, folder, true).settingsChanged);
    EXPECT_EQ(setting(u"ConnDataBase"_s), u"demo"_s);
    EXPECT_TRUE(createDemoCompany(store, folder, false).settingsChanged) << "the demo itself may be rebuilt";
}

}  // namespace
}  // namespace pelmar::test
