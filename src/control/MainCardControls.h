#pragma once

#include <array>

class QCheckBox;
class QComboBox;
class QFrame;
class QLabel;
class QLineEdit;
class QPushButton;
class QTabWidget;
class QToolButton;

namespace pelmar {

class ClickableLabel;

// The controls of the mailing control that its handlers work with, by the names their code
// uses. The controls that only show an option are reached through the binding table instead.
struct MainCardControls {
    // Below the tab strip.
    QTabWidget* SSTab1 = nullptr;
    QPushButton* CmdLabPrev = nullptr;
    QPushButton* CmdPreview = nullptr;
    QPushButton* CmdDef = nullptr;
    QPushButton* cmdStop = nullptr;
    QLabel* Message1 = nullptr;
    QFrame* ProgressFrame = nullptr;
    QFrame* ProgressFill = nullptr;

    // Label layout page.
    ClickableLabel* LblDept = nullptr;
    QPushButton* CmdLabDef = nullptr;

    // Letters and e-mail pages: the file pickers and the boxes they fill.
    std::array<QToolButton*, 4> CmdDir{};  // 1 HTML body, 2 attachment, 3 Word template
    QLineEdit* txtEmailHTMLBody = nullptr;
    QLineEdit* txtEmailAttachFile = nullptr;
    QLineEdit* txtFaxFile = nullptr;

    // Criteria page: the pickers and the criteria they switch on.
    QCheckBox* ChkCatCode = nullptr;
    QComboBox* cmbCS = nullptr;
    QPushButton* CmdSelectGroup = nullptr;
    QComboBox* CmbAgent = nullptr;
    QCheckBox* ChkItems = nullptr;
    QCheckBox* chkQryGroup = nullptr;
    QPushButton* cmdQryGroup = nullptr;
    QCheckBox* ChkSelectAccount = nullptr;
    QPushButton* cmdSelectAccount = nullptr;
    QPushButton* cmdSelByFile = nullptr;

    // General page.
    QPushButton* CmdConnect = nullptr;
    ClickableLabel* Label56 = nullptr;
};

}  // namespace pelmar
