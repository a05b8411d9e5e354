#pragma once

#include <QString>

namespace pelmar {

// Shows a local HTML file in a new browser window: not full screen, with a menu bar and without
// an address bar, left open after the call returns. Throws Failure when no window can be opened.
class BrowserWindow {
public:
    virtual ~BrowserWindow() = default;
    virtual void open(const QString& path) = 0;
};

}  // namespace pelmar
