#pragma once

#include "common/Progress.h"
#include "control/MainCardControls.h"
#include "options/MailingOptions.h"
#include "outputs/Services.h"

#include <QString>
#include <QWidget>

#include <functional>
#include <memory>
#include <optional>

namespace pelmar {

class OptionsBinder;
class Output;
class SelectByFileDialog;
class SelectCardDialog;
struct RunRequest;
struct SessionState;

// The mailing control: five pages that show the options, the output chosen in cmbOutType, and
// the buttons that run it, preview its recipients and save the options. The pages and the
// options model are kept in step both ways; a run gets a copy of the options and the outputs of
// the table do the work. Everything runs on the user interface thread: a run that yields between
// recipients lets the stop button set the stop flag.
class MainCard : public QWidget, public ProgressSink {
    Q_OBJECT
public:
    MainCard(Services services, SessionState& state, QWidget* parent = nullptr);
    ~MainCard() override;

    // Start-up (see initialiseSession), then the pages show the options, the department caption
    // follows its tag and the criteria page comes to the front. Runs again after the logon dialog.
    void UserControl_Initialize();

    // Button and label handlers.
    void CmdLabPrev_Click();
    void CmdPreview_Click();
    void CmdDef_Click();
    // Asked before the window closes: when the pages hold options that differ from the stored
    // ones, whether to save them (Yes saves as "שמור הגדרות" does, No closes without saving,
    // Cancel keeps the window open). True when the window may close.
    bool mayClose();
    void cmdStop_Click();
    void CmdLabDef_Click();
    void CmdConnect_Click();
    void CmdDir_Click(int index);
    void LblDept_Click();
    void Label56_DblClick();
    void cmbCS_Validate();

    // The pickers: hand-picked cards (the picker keeps its rows and marks until the list is
    // rebuilt), card groups, properties, and the card list from a file (kept with what it read
    // until OK).
    void cmdSelectAccount_Click();
    void CmdSelectGroup_Click();
    void cmdQryGroup_Click();
    void cmdSelByFile_Click();
    SelectCardDialog* cardPicker() const { return cardPicker_.get(); }
    SelectByFileDialog* fileDialog() const { return fileDialog_.get(); }

    // The progress display: Message1 shows the text, the fill takes its share of the frame.
    void report(const QString& text, double fraction) override;

    const MainCardControls& controls() const { return c_; }
    const MailingOptions& options() const { return options_; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void buildPages();
    void connectHandlers();
    void showOptions();
    void showDeptCaption();
    // Runs an output on a copy of the options; its finish text when it returned, nothing when
    // a failure ended it (the failure was shown).
    std::optional<QString> runOutput(const Output& output, const RunRequest& request);
    bool guarded(const std::function<void()>& handler);
    QString PickOpenFile(int index);
    void openCardPage(const QString& code);

    Services services_;
    SessionState& state_;
    MailingOptions options_;
    MainCardControls c_;
    std::unique_ptr<OptionsBinder> binder_;
    std::unique_ptr<SelectCardDialog> cardPicker_;
    std::unique_ptr<SelectByFileDialog> fileDialog_;
};

}  // namespace pelmar
