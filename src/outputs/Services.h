#pragma once

namespace pelmar {

class BrowserWindow;
class DatabaseClient;
class FileDialogs;
class Messages;
class SettingsStore;

// The outside systems the program works with, as interfaces. The window hands out the real ones
// with their boxes and dialogs on screen, the command line their console forms, tests recording
// fakes; whoever makes the bundle owns the systems, and they outlive it.
struct Services {
    Messages& messages;
    BrowserWindow& browser;
    FileDialogs& files;
    SettingsStore& settings;
    const DatabaseClient& database;
};

}  // namespace pelmar
