#include "settings/SettingsStore.h"

#include "common/Failure.h"
#include "support/Isolated.h"

#include <QDir>
#include <QFile>

#include <sys/stat.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class SettingsStoreTest : public Isolated {};

TEST_F(SettingsStoreTest, MissingKeysGiveTheCallersDefaultAndStoredTextComesBackUnchanged)
{
    SettingsStore store(configFolder());
    EXPECT_EQ(store.value(u"Pelmar"_s, u"Params"_s, u"FaxSubject"_s, u"מבצע השבוע"_s), u"מבצע השבוע"_s);

    store.setValue(u"Pelmar"_s, u"Params"_s, u"SQLWhere"_s, u"OCRD.City = N'חיפה' ; -- \"x\""_s);
    store.setValue(u"Pelmar"_s, u"LabelDef6"_s, u"Font"_s, u"2"_s);
    SettingsStore again(configFolder());
    EXPECT_EQ(again.value(u"Pelmar"_s, u"Params"_s, u"SQLWhere"_s, {}), u"OCRD.City = N'חיפה' ; -- \"x\""_s);
    EXPECT_EQ(again.value(u"Pelmar"_s, u"LabelDef6"_s, u"Font"_s, {}), u"2"_s);
    EXPECT_FALSE(again.contains(u"Pelmar"_s, u"LabelDef5"_s, u"Font"_s));
}

TEST_F(SettingsStoreTest, TheFileIsReadableByItsOwnerOnlyAndStaysSoAfterRewrites)
{
    SettingsStore store(configFolder());
    store.setValue(u"Pelmar"_s, u"Params"_s, u"ConnPWD"_s, u"secret"_s);
    store.setValue(u"Pelmar"_s, u"Params"_s, u"ConnUID"_s, u"sa"_s);
    const QString file = configFolder() + u"/Pelmar.conf"_s;
    ASSERT_TRUE(QFile::exists(file));
    struct stat info {};
    ASSERT_EQ(::stat(file.toLocal8Bit().constData(), &info), 0);
    EXPECT_EQ(info.st_mode & 0777, 0600u);
}

// The description of the failure a write meets; empty when it succeeds.
QString writeFailure(SettingsStore& store)
{
    try {
        store.setValue(u"Pelmar"_s, u"Params"_s, u"Rows"_s, u"8"_s);
    } catch (const Failure& failure) {
        return failure.description();
    }
    return {};
}

TEST_F(SettingsStoreTest, AStoreThatCannotBeWrittenReportsItByName)
{
    writeFile(path(u"blocked"_s), "not a folder");
    SettingsStore blocked(path(u"blocked"_s));
    EXPECT_TRUE(writeFailure(blocked).startsWith(u"Cannot create the settings file %1/Pelmar.conf"_s.arg(path(u"blocked"_s))));

    QDir().mkpath(configFolder() + u"/Pelmar.conf"_s);
    SettingsStore folder(configFolder());
    EXPECT_EQ(writeFailure(folder), u"Cannot write the settings file %1/Pelmar.conf."_s.arg(configFolder()))
        << "the file is a folder";
}

}  // namespace
}  // namespace pelmar::test
