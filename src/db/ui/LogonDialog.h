#pragma once

#include "outputs/Services.h"

#include <QDialog>

class QComboBox;
class QLabel;
class QLineEdit;
class QPushButton;

namespace pelmar {

struct SessionState;

// The modal dialog in which the user edits the four connection settings, lists the company
// databases of the server and checks the connection. OK stores the boxes as they are (state and
// settings); Cancel stores nothing. The handlers are public so the dialog can be driven without
// a modal loop.
class LogonDialog : public QDialog {
    Q_OBJECT
public:
    LogonDialog(Services services, SessionState& state, QWidget* parent = nullptr);

    void cmdRefresh_Click();
    void cmbDataBase_Click(int index);
    void CmdCheck_Click();
    void cmdOK_Click();
    void cmdCancel_Click();

    QLineEdit* txtConnServer = nullptr;
    QLineEdit* txtConnUID = nullptr;
    QLineEdit* txtConnPWD = nullptr;
    QLineEdit* txtConnDatabase = nullptr;
    QComboBox* cmbDataBase = nullptr;
    QPushButton* cmdRefresh = nullptr;
    QPushButton* CmdCheck = nullptr;
    QPushButton* cmdOK = nullptr;
    QPushButton* cmdCancel = nullptr;
    QLabel* LblMsg = nullptr;

private:
    void buildControls();
    void FillDBCombo();
    void SetGetRegConnParams(unsigned char action);

    Services services_;
    SessionState& state_;
};

// Shows the dialog modally and returns when it closes, whichever button closed it.
void showLogonDialog(Services services, SessionState& state, QWidget* parent);

}  // namespace pelmar
