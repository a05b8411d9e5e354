#pragma once

#include "control/MainCardControls.h"
#include "control/Services.h"
#include "outputs/LabelSheet.h"
#include "outputs/RecipientList.h"
#include "selection/Criteria.h"

#include <QDate>
#include <QString>
#include <QWidget>

#include <functional>
#include <memory>

namespace pelmar {

class SelectByFileDialog;
class SelectCardDialog;
struct SessionState;

// The mailing control: five pages of options, the output chosen in cmbOutType, and the buttons
// that run it, preview its recipients and save the options. Everything runs on the user
// interface thread; a run that yields (processEvents) lets the stop button set the stop flag.
class MainCard : public QWidget {
    Q_OBJECT
public:
    MainCard(Services services, SessionState& state, QWidget* parent = nullptr);
    ~MainCard() override;

    // Start-up: connection settings, run log, connection test and sales employees, every option,
    // label styles, picker state, department caption, criteria page. Each step's failure is
    // passed over. Runs again after the logon dialog.
    void UserControl_Initialize();

    // 1 saves every option of the pages to section "Params", 2 loads them; other values walk the
    // options and change nothing. A key that cannot be written, read or assigned is skipped.
    void SetGetRegParams(unsigned char action);

    // Refills CmbAgent from OSLP (item data = SlpCode); on any failure, or when OSLP is empty,
    // the list keeps what it has.
    void FillCmbAgent();

    // The recipient query. BuildWhere throws Failure naming a criterion that cannot be read.
    Criteria criteria() const;
    QString BuildWhere() const;
    QString BuildSelect(int pDocIndex, bool pAllDetails, short pOutType) const;
    QString BuildOrderBy(int pDocIndex, short pOutType) const;
    QString BuildDatesCriteria(const QDate& pFromDate, const QDate& pToDate, int pDocIndex, int pDocRelation,
                               const QString& pFromDocNum, const QString& pToDocNum) const;
    QString BuildItemsCriteria(const QString& pFromItem, const QString& pToItem) const;
    QString BuildQryGroupCriteria() const;
    // BuildSelect + BuildWhere (+ BuildOrderBy when ordered) with the chosen document type.
    QString recipientStatement(short pOutType, bool pAllDetails, bool ordered) const;

    // The selected-card list: the test and whether the outputs filter by it now.
    bool IsSelectedCard(const QString& pCardCode) const;
    bool selectionFilter() const;

    // The label run: writes "pelmar1.htm" in the temporary folder and opens it in a new browser
    // window. CreateLabFile writes the sheet to a path; false when the schema level could not be
    // read (already reported) and nothing was written. Both throw Failure with the description
    // the user sees; a layout box without a valid number fails before the file is touched.
    void RunLabels();
    bool CreateLabFile(const QString& pFileName);

    // The recipient list of an output kind (2..6) written to a path; the preview writes
    // "pelmar2.htm" in the temporary folder and opens it. False when the schema level could not
    // be read (already reported) and nothing was written. Throws Failure.
    bool CreateHTML(const QString& pFileName, short pOutType);

    // The SMS run: asks for the file, writes the mobile numbers, says that the list is ready.
    // A cancelled dialog is a failure (nothing written). CreateSMSFile is false when the schema
    // level could not be read and nothing was written. Both throw Failure.
    void SaveSMSList();
    bool CreateSMSFile(const QString& pFileName);

    // The page of one card; false when the schema level could not be read. Throws Failure.
    bool CreateCardFile(const QString& pFileName, const QString& pCardCode);

    // 1 when the WinFax option is chosen, else 2 for the fax service, else 0.
    short GetOLEOption() const;

    // Button and label handlers.
    void CmdLabPrev_Click();
    void CmdPreview_Click();
    void CmdDef_Click();
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

    // Progress of a run: the fill gets processed / total of the frame's width; 0 clears it.
    void setProgress(long processed, long total);

    const MainCardControls& controls() const { return c_; }
    SessionState& state() { return state_; }
    const Services& services() const { return services_; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    struct OutputType;
    static const OutputType& outputTypeAt(int listIndex);

    LabelPage labelPage() const;
    ListQuery listQuery(const QString& connString, short kind) const;
    bool readSchemaLevel(QString& connString);
    void buildPages();
    void connectHandlers();
    void showDeptCaption();
    void runOutput(const OutputType& output);
    void guarded(const std::function<void()>& handler);
    QString PickOpenFile(int index);

    void openCardPage(const QString& code);

    Services services_;
    SessionState& state_;
    MainCardControls c_;
    std::unique_ptr<SelectCardDialog> cardPicker_;
    std::unique_ptr<SelectByFileDialog> fileDialog_;
};

}  // namespace pelmar
