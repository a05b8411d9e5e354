#pragma once

#include "control/QtSeams.h"
#include "control/Services.h"
#include "db/DatabaseClient.h"
#include "settings/SettingsStore.h"

namespace pelmar {

// The composition root: the real outside systems of the program, owned here.
class RealServices {
public:
    RealServices();
    Services services();

private:
    QtMessages messages_;
    DesktopBrowser browser_;
    QtFileDialogs files_;
    SettingsStore settings_;
    DatabaseClient database_;
};

}  // namespace pelmar
