#pragma once

#include <QString>

namespace pelmar {

class SettingsStore;

// The folder of the embedded companies: "$XDG_DATA_HOME/Pelmar/companies".
QString embeddedCompaniesFolder();

struct DemoResult {
    QString folder;  // where "demo.sqlite" and "sbo-common.sqlite" were written
    bool settingsChanged;  // the connection settings now point at the demo company
    QString message;  // what happened, for the user
};

// Creates the embedded company "demo" (a few hundred cards of the newer schema, listed in
// sbo-common) in folder and points the connection settings at it, unless settings for another
// company already exist and force is false: those are left alone and the message says how to
// switch. Throws Failure when the files cannot be written; the settings are then unchanged.
DemoResult createDemoCompany(SettingsStore& store, const QString& folder, bool force);

}  // namespace pelmar
