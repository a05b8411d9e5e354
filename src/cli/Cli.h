#pragma once

#include <QStringList>

namespace pelmar {

// Runs "pelmar COMMAND [options]" without a window, under QCoreApplication: the start-up the
// window runs, the options of the saved settings and of the command line, then the output the
// command names, with the console forms of the outside systems (messages on standard error with
// their titles, --yes for the questions, -o FILE for the file dialogs, a progress line on a
// terminal). Returns the exit status: 0 done, 1 the run failed or was refused, 2 a usage error.
int runCommandLine(const QStringList& arguments);

}  // namespace pelmar
