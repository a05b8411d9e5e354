#pragma once

#include <QStringList>

namespace pelmar {

// Runs "pelmar COMMAND [options]" headless through the same control as the window: the control
// is built, initialises itself from the settings store, takes the options and runs the public
// method of the command. Messages go to standard error with their titles.
// Returns the exit status: 0 done, 1 the run failed or was refused, 2 a usage error.
int runCommandLine(const QStringList& arguments);

}  // namespace pelmar
