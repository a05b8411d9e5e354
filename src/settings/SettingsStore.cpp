#include "settings/SettingsStore.h"

#include "common/Failure.h"

#include <QDir>
#include <QFile>
#include <QSettings>
#include <QStandardPaths>

namespace pelmar {

namespace {

QString groupKey(const QString& section, const QString& key)
{
    return section + u'/' + key;
}

}  // namespace

SettingsStore::SettingsStore(QString folder) : folder_(std::move(folder))
{}

SettingsStore SettingsStore::forCurrentUser()
{
    const QString config = QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation);
    return SettingsStore(QDir(config).filePath(QStringLiteral("Pelmar")));
}

QString SettingsStore::filePath(const QString& app) const
{
    return QDir(folder_).filePath(app + QStringLiteral(".conf"));
}

QString SettingsStore::value(const QString& app, const QString& section, const QString& key,
                             const QString& fallback) const
{
    QSettings settings(filePath(app), QSettings::IniFormat);
    return settings.value(groupKey(section, key), fallback).toString();
}

bool SettingsStore::contains(const QString& app, const QString& section, const QString& key) const
{
    QSettings settings(filePath(app), QSettings::IniFormat);
    return settings.contains(groupKey(section, key));
}

void SettingsStore::setValue(const QString& app, const QString& section, const QString& key, const QString& text)
{
    const QString path = filePath(app);
    createPrivateFile(path);
    QSettings settings(path, QSettings::IniFormat);
    settings.setValue(groupKey(section, key), text);
    settings.sync();
    if (settings.status() != QSettings::NoError)
        throw Failure(QStringLiteral("Cannot write the settings file %1.").arg(path));
}

// The settings writer replaces the file but keeps the permissions of the one it replaces, so a
// file made private before the first write stays private.
void SettingsStore::createPrivateFile(const QString& path) const
{
    if (QFile::exists(path))
        return;
    QDir().mkpath(folder_);
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly, QFileDevice::ReadOwner | QFileDevice::WriteOwner))
        throw Failure(QStringLiteral("Cannot create the settings file %1: %2.").arg(path, file.errorString()));
}

}  // namespace pelmar
