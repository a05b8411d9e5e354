#pragma once

#include "outputs/Services.h"
#include "selection/CheckListModel.h"
#include "selection/ui/CheckGrid.h"

#include <QDialog>

class QRadioButton;
class QTableView;

namespace pelmar {

struct SessionState;

// The card-group picker: the groups of the chosen card type, the earlier choice checked. OK
// stores the checks (and the group codes) into the session's group selection; Cancel stores
// nothing. Handlers are public so the dialog can be driven without a modal loop.
class CardGroupDialog : public QDialog {
    Q_OBJECT
public:
    CardGroupDialog(Services services, SessionState& state, const QString& connString, QWidget* parent = nullptr);

    void UpdateGridByArray();
    void UpdateArrayByGrid();
    void cmdOK_Click();

    CheckListModel model;
    QTableView* CardGroups = nullptr;
    CheckButtons buttons{};

private:
    Services services_;
    SessionState& state_;
};

// The property picker: the 64 properties and the relation (Option1 "או" = OR, Option2 "וגם" = AND).
class QryGroupDialog : public QDialog {
    Q_OBJECT
public:
    QryGroupDialog(Services services, SessionState& state, const QString& connString, QWidget* parent = nullptr);

    void UpdateGridByArray();
    void UpdateArrayByGrid();
    void cmdOK_Click();

    CheckListModel model;
    QTableView* QryGroups = nullptr;
    QRadioButton* Option1 = nullptr;
    QRadioButton* Option2 = nullptr;
    CheckButtons buttons{};

private:
    SessionState& state_;
};

}  // namespace pelmar
