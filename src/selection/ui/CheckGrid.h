#pragma once

#include <QString>

class QAbstractItemModel;
class QPushButton;
class QTableView;
class QWidget;

namespace pelmar {

class CheckListModel;

// A picker's grid over its model: whole rows selected, columns right-aligned and sized to their
// content, named for the code that drives it.
QTableView* checkGrid(const QString& name, QAbstractItemModel* model, QWidget* parent = nullptr);

// The five buttons every check-list picker has: check all, none, invert, OK and Cancel, wired to
// the model; OK and Cancel are returned for the dialog to wire.
struct CheckButtons {
    QPushButton* cmdAll;
    QPushButton* cmdNone;
    QPushButton* cmdRevert;
    QPushButton* cmdOK;
    QPushButton* cmdCancel;
};
CheckButtons checkButtons(CheckListModel& model);

}  // namespace pelmar
