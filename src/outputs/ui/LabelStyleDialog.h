#pragma once

#include "outputs/LabelStyles.h"

#include <QDialog>

#include <array>

class QCheckBox;
class QComboBox;
class QLineEdit;
class QPushButton;

namespace pelmar {

class Messages;
class SettingsStore;

// The modal dialog "הגדרות צורה וגודל" in which the user sets each label line's font, size,
// weight, underline and italic, and the fixed texts of lines 11 and 12. Opening loads the styles
// from the settings; OK reads the rows, saves all thirteen styles and closes, unless a size is not
// a whole number 0..255: then it names that row and the dialog stays open with everything typed.
// Cancel stores nothing. Handlers are public so the dialog can be driven without a modal loop.
class LabelStyleDialog : public QDialog {
    Q_OBJECT
public:
    LabelStyleDialog(SettingsStore& store, Messages& messages, LabelDefTable& defs, QWidget* parent = nullptr);

    // 1 fills the rows from the styles; 2 reads them back, stopping at a size that is not a
    // whole number 0..255 (the fields before it take their new values).
    void GetSetFormLabDefs(unsigned char action);
    void cmdOK_Click();
    void cmdCancel_Click();

    std::array<QComboBox*, 13> CmbFont{};
    std::array<QLineEdit*, 13> txtFontSize{};
    std::array<QComboBox*, 13> CmbWeight{};
    std::array<QCheckBox*, 13> ChkUL{};
    std::array<QCheckBox*, 13> ChkItalic{};
    std::array<QLineEdit*, 13> txtFixed{};  // lines 11 and 12 only
    QPushButton* cmdOK = nullptr;
    QPushButton* cmdCancel = nullptr;

private:
    void buildRows();
    void toForm(int line);
    void fromForm(int line);

    SettingsStore& store_;
    Messages& messages_;
    LabelDefTable& defs_;
};

}  // namespace pelmar
