#pragma once

namespace pelmar {

class BrowserWindow;
class DatabaseClient;
class FileDialogs;
class Messages;
class SettingsStore;

// The outside systems the control works with. The program hands it the real ones
// (see RealServices); tests hand it recording fakes. The control does not own them.
struct Services {
    Messages& messages;
    BrowserWindow& browser;
    FileDialogs& files;
    SettingsStore& settings;
    const DatabaseClient& database;
};

}  // namespace pelmar
