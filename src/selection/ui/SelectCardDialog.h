#pragma once

#include "outputs/Services.h"
#include "selection/CheckListModel.h"

#include <QDialog>

#include <functional>

class QLineEdit;
class QPushButton;
class QTableView;

namespace pelmar {

struct SessionState;

// The card picker: the cards of the current criteria with a check box each. OK replaces the
// selected-card list by the checked codes in grid order and hides the picker; Cancel hides it.
// The picker keeps its rows and marks while hidden. A double click, or Enter, on a row opens that
// card's page through openCardPage. Handlers are public so the dialog can be driven without a
// modal loop.
class SelectCardDialog : public QDialog {
    Q_OBJECT
public:
    SelectCardDialog(Services services, SessionState& state, std::function<void(const QString&)> openCardPage,
                     QWidget* parent = nullptr);

    // Reads the list of statement; a failure is shown and the rows read so far stay.
    void FillCardList(const QString& connString, const QString& statement);

    void cmdFindKey_Click();
    void cmdFindByDesc_Click();
    void CmdAllItems_Click() { model.setAllChecked(true); }
    void cmdNoneItems_Click() { model.setAllChecked(false); }
    void cmdShowMarked_Click();
    void cmdShowAll_Click();
    void cmdOK_Click();
    void cmdClose_Click() { hide(); }
    void openCurrentCard();

    CheckListModel model;
    QTableView* VSSelectItems = nullptr;
    QLineEdit* txtToItemkey = nullptr;
    QLineEdit* txtToItemName = nullptr;

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    void buildControls();
    void findAndCheck(int textIndex, const QString& prefix);
    void selectTopLeft();

    Services services_;
    SessionState& state_;
    std::function<void(const QString&)> openCardPage_;
};

}  // namespace pelmar
