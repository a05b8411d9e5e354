#pragma once

#include <QString>

namespace pelmar {

// The modal open and save dialogs. Filters are given in the classic form
// "Description|pattern;pattern|Description|pattern"; filterIndex counts pairs from 1.
class FileDialogs {
public:
    virtual ~FileDialogs() = default;

    // The chosen full path, or the empty string when the user cancels.
    virtual QString openFile(const QString& filter, int filterIndex) = 0;

    // The chosen full path, or the empty string when the user cancels. The dialog asks before
    // replacing an existing file and before creating a new one.
    virtual QString saveFile(const QString& filter, int filterIndex, const QString& defaultName) = 0;
};

}  // namespace pelmar
