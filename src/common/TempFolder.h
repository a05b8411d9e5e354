#pragma once

#include <QString>

namespace pelmar {

// The folder in which the generated files live: the first of the environment variables
// Temp, TEMP, TMP and TMPDIR that is set and not empty, else the system's temporary folder.
QString tempFolder();

// The full path of a file of the temporary folder.
QString tempFile(const QString& name);

}  // namespace pelmar
