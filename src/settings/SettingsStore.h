#pragma once

#include <QString>

namespace pelmar {

// The application every setting of the program lives under, and the section of the control's
// options and connection settings.
inline const QString kPelmarApp = QStringLiteral("Pelmar");
inline const QString kParamsSection = QStringLiteral("Params");

// The per-user settings store: application -> section -> key -> text value.
// Each application is one file "<folder>/<application>.conf" in the native (INI) format, with
// one group per section. The file is created readable by its owner only, because it holds the
// database password. Nothing is ever deleted from the store.
class SettingsStore {
public:
    // folder: where the application files live, usually "$XDG_CONFIG_HOME/Pelmar".
    explicit SettingsStore(QString folder);

    // The store of the signed-in user: "$XDG_CONFIG_HOME/Pelmar" (or "~/.config/Pelmar").
    static SettingsStore forCurrentUser();

    // The stored text, or fallback when the key is missing.
    QString value(const QString& app, const QString& section, const QString& key, const QString& fallback) const;

    // Stores the text. Throws Failure when the file cannot be written.
    void setValue(const QString& app, const QString& section, const QString& key, const QString& text);

    bool contains(const QString& app, const QString& section, const QString& key) const;

    QString filePath(const QString& app) const;

private:
    void createPrivateFile(const QString& path) const;

    QString folder_;
};

}  // namespace pelmar
