#include "log/RunLog.h"
#include "support/Engines.h"
#include "support/ui/ModalCloser.h"
#include "support/ui/WindowFixture.h"

#include <QComboBox>
#include <QFile>
#include <QLineEdit>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class Initialisation : public MainCardTest {
protected:
    void pointAt(const QString& company)
    {
        for (const auto& [key, value] :
             {std::pair{u"ConnServer"_s, engine->server()}, std::pair{u"ConnUID"_s, engine->user()},
              std::pair{u"ConnPWD"_s, engine->password()}, std::pair{u"ConnDataBase"_s, company}})
            store->setValue(u"Pelmar"_s, u"Params"_s, key, value);
    }

    QStringList agents() const
    {
        QStringList names;
        for (int i = 0; i < c().CmbAgent->count(); ++i) {
            const QString shown = c().CmbAgent->itemText(i);
            EXPECT_TRUE(shown.startsWith(QChar(0x2068)) && shown.endsWith(QChar(0x2069)))
                << "each name shows in its own direction";
            names << shown.mid(1, shown.size() - 2) + u'=' + c().CmbAgent->itemData(i).toString();
        }
        return names;
    }

    std::unique_ptr<Engine> engine = makeSqliteEngine();
};

TEST_F(Initialisation, AConfiguredCompanyFillsTheSalesEmployees)
{
    engine->createCompany(u"SBO_Test"_s, CompanyOptions{});
    pointAt(u"SBO_Test"_s);
    card->UserControl_Initialize();
    EXPECT_EQ(agents(),
              (QStringList{u"-ללא איש מכירות-=-1"_s, u"דנה לוי=1"_s, u"יוסי כהן=2"_s, u"Mark Smith=3"_s,
                           u"רונית אברהם=5"_s, u"O'Neil & <Partners>=7"_s}));
    EXPECT_EQ(c().CmbAgent->currentIndex(), 0) << "the stored agent index 0 is loaded after the list is filled";
}

TEST_F(Initialisation, ClosingTheLogonDialogReloadsTheStoredSettingsAndEmptiesTheLog)
{
    card->UserControl_Initialize();
    control<QLineEdit>(u"txtRows"_s)->setText(u"99"_s);
    WriteLog(u"SELECT 1"_s, u"t"_s);
    QString seenTitle;
    const ModalCloser closer([&](QDialog& dialog) {
        seenTitle = dialog.windowTitle();
        dialog.reject();
    });
    card->CmdConnect_Click();
    EXPECT_EQ(seenTitle, u"Connect to SAP Business One"_s);
    EXPECT_EQ(control<QLineEdit>(u"txtRows"_s)->text(), u"8"_s);
    EXPECT_FALSE(QFile::exists(runLogPath()));
}

}  // namespace
}  // namespace pelmar::test
