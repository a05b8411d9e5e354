#pragma once

#include "common/BrowserWindow.h"

namespace pelmar {

// Opens files in the desktop's browser through xdg-open. The environment variable
// PELMAR_BROWSER, when set, names the command instead (the file's path is added as its last
// argument). Needs no window of its own, so the command line can use it too.
class DesktopBrowser : public BrowserWindow {
public:
    void open(const QString& path) override;
};

}  // namespace pelmar
