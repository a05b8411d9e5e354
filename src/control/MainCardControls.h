#pragma once

#include <array>

class QCheckBox;
class QComboBox;
class QFrame;
class QGroupBox;
class QLabel;
class QLineEdit;
class QPlainTextEdit;
class QPushButton;
class QRadioButton;
class QTabWidget;
class QToolButton;

namespace pelmar {

class ClickableLabel;

// Every control of the mailing control, by the name its code uses. Control arrays keep the
// indexes of their names; entries of an array that has no such index stay null.
struct MainCardControls {
    // Below the tab strip.
    QTabWidget* SSTab1 = nullptr;
    QComboBox* cmbOutType = nullptr;
    QPushButton* CmdLabPrev = nullptr;
    QPushButton* CmdPreview = nullptr;
    QPushButton* CmdDef = nullptr;
    QPushButton* cmdStop = nullptr;
    QLabel* Message1 = nullptr;
    QFrame* ProgressFrame = nullptr;
    QFrame* ProgressFill = nullptr;

    // Label layout page.
    std::array<QCheckBox*, 13> ChkTitle{};
    ClickableLabel* LblDept = nullptr;
    QCheckBox* chkShowAttn = nullptr;
    QCheckBox* chkDeptNewLine = nullptr;
    QLineEdit* txtRows = nullptr;
    QLineEdit* txtCols = nullptr;
    QLineEdit* txtCopies = nullptr;
    QLineEdit* txtStartFrom = nullptr;
    QComboBox* cmbLabFormat = nullptr;
    QComboBox* cmbAddressFrom = nullptr;
    QCheckBox* ChkAllContact = nullptr;
    QCheckBox* chkUseCntctAddrss = nullptr;
    QCheckBox* ChkAddressBySQL = nullptr;
    QLineEdit* txtSQLAddress = nullptr;
    QPushButton* CmdLabDef = nullptr;

    // Letters page.
    QLineEdit* txtFaxFile = nullptr;
    std::array<QToolButton*, 4> CmdDir{};  // 1 HTML body, 2 attachment, 3 Word template
    std::array<QCheckBox*, 8> chkFaxField{};
    std::array<QLabel*, 8> LblFaxFormField{};
    std::array<QLabel*, 8> LblFaxField{};
    std::array<QLineEdit*, 8> txtFaxExpr{};
    QGroupBox* FaxServerType = nullptr;
    std::array<QRadioButton*, 3> OptOLE{};  // 1 WinFax, 2 fax service
    QLineEdit* txtFaxSubject = nullptr;
    QLineEdit* txtFaxDelay = nullptr;
    QLineEdit* TxtLocalAreaPrefix = nullptr;

    // E-mail page.
    QLineEdit* txtEmailFrom = nullptr;
    QLineEdit* txtEmailFromDesc = nullptr;
    QLineEdit* txtEmailSubject = nullptr;
    QPlainTextEdit* txtEmailContent = nullptr;
    QLineEdit* txtEmailHTMLBody = nullptr;
    QLineEdit* txtEmailAttachFile = nullptr;
    QLineEdit* txtEmailAttachFileDesc = nullptr;
    std::array<QRadioButton*, 3> OptEmailMethod{};  // 1 per recipient, 2 per group
    QLineEdit* txtEmailGroupSize = nullptr;
    QLineEdit* txtEmailToMain = nullptr;
    QLineEdit* txtEmailToMainDesc = nullptr;

    // Criteria page.
    QCheckBox* ChkCatCode = nullptr;
    QLabel* LblCatCode = nullptr;
    QComboBox* cmbCS = nullptr;
    QPushButton* CmdSelectGroup = nullptr;
    QCheckBox* ChkAccKey = nullptr;
    QLineEdit* TxtFromCrd = nullptr;
    QLineEdit* TxtToCrd = nullptr;
    QCheckBox* ChkCity = nullptr;
    QLineEdit* TxtCity = nullptr;
    QCheckBox* ChkPhone = nullptr;
    QComboBox* cmbPhoneType = nullptr;
    QLineEdit* txtPhone = nullptr;
    QCheckBox* ChkAgent = nullptr;
    QComboBox* CmbAgent = nullptr;
    QCheckBox* ChkDates = nullptr;
    QLineEdit* TxtFromDate = nullptr;
    QLineEdit* TxtToDate = nullptr;
    QComboBox* CmbDocType = nullptr;
    QComboBox* cmbByDoc = nullptr;
    QLineEdit* txtFromDocNum = nullptr;
    QLineEdit* txtToDocNum = nullptr;
    QCheckBox* ChkItems = nullptr;
    QLineEdit* txtFromItem = nullptr;
    QLineEdit* txtToItem = nullptr;
    QCheckBox* chkQryGroup = nullptr;
    QPushButton* cmdQryGroup = nullptr;
    QCheckBox* ChkUseSQLW = nullptr;
    QLineEdit* txtSQLWhere = nullptr;
    QCheckBox* ChkSelectAccount = nullptr;
    QPushButton* cmdSelectAccount = nullptr;
    QPushButton* cmdSelByFile = nullptr;
    QComboBox* CmbSortBy = nullptr;
    QComboBox* CmbSortDir = nullptr;

    // General page.
    QPushButton* CmdConnect = nullptr;
    ClickableLabel* Label56 = nullptr;
};

}  // namespace pelmar
