#include "common/TempFolder.h"

#include <QDir>

namespace pelmar {

QString tempFolder()
{
    for (const char* name : {"Temp", "TEMP", "TMP", "TMPDIR"}) {
        const QString value = qEnvironmentVariable(name);
        if (!value.isEmpty())
            return value;
    }
    return QDir::tempPath();
}

QString tempFile(const QString& name)
{
    return QDir(tempFolder()).filePath(name);
}

}  // namespace pelmar
