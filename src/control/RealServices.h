#pragma once

#include "common/DesktopBrowser.h"
#include "db/DatabaseClient.h"
#include "outputs/Services.h"
#include "settings/SettingsStore.h"
#include "widgets/QtSeams.h"

namespace pelmar {

// The composition root of the window: the real outside systems, owned here.
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
