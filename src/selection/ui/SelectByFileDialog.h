#pragma once

#include "outputs/Services.h"

#include <QDialog>
#include <QStringList>

class QCheckBox;
class QLabel;
class QLineEdit;

namespace pelmar {

struct SessionState;

// The dialog that reads the selected-card list from a tab-separated file. Reading fills a list
// of its own; OK stores the options (section "ImportFile") and, when codes were read, replaces
// the selected-card list by them; Cancel hides the dialog, which keeps what it read. Handlers are
// public so the dialog can be driven without a modal loop.
class SelectByFileDialog : public QDialog {
    Q_OBJECT
public:
    SelectByFileDialog(Services services, SessionState& state, QWidget* parent = nullptr);

    void CmdDir_Click();
    void cmdReadFile_Click();
    // True when the file was read; failures are shown and leave the codes read before.
    bool ReadCardsFromFile();
    void cmdOK_Click();
    void cmdClose_Click() { hide(); }
    void SetGetImportParams(unsigned char action);

    const QStringList& FileCrd() const { return fileCrd_; }

    QLabel* Label1 = nullptr;
    QLineEdit* txtFileName = nullptr;
    QLineEdit* txtTabNum = nullptr;
    QCheckBox* ChkIgnoreFirstLine = nullptr;
    QLabel* Msg1 = nullptr;

private:
    void buildControls();

    Services services_;
    SessionState& state_;
    QStringList fileCrd_;
};

}  // namespace pelmar
