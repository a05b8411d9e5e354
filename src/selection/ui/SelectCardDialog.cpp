#include "selection/ui/SelectCardDialog.h"

#include "common/Failure.h"
#include "common/Messages.h"
#include "common/SessionState.h"
#include "selection/PickerData.h"
#include "selection/SelectedCards.h"
#include "selection/ui/CheckGrid.h"
#include "widgets/Widgets.h"

#include <QApplication>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QIdentityProxyModel>
#include <QKeyEvent>
#include <QLineEdit>
#include <QPushButton>
#include <QStyle>
#include <QTableView>
#include <QVBoxLayout>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

constexpr int kCodeText = 0;
constexpr int kNameText = 1;

// Shows the card-page sign beside each code.
class CardSignModel : public QIdentityProxyModel {
public:
    using QIdentityProxyModel::QIdentityProxyModel;
    QVariant data(const QModelIndex& index, int role) const override
    {
        if (role == Qt::DecorationRole && index.column() == 0)
            return QApplication::style()->standardIcon(QStyle::SP_FileDialogDetailedView);
        return QIdentityProxyModel::data(index, role);
    }
};

}  // namespace

SelectCardDialog::SelectCardDialog(Services services, SessionState& state,
                                   std::function<void(const QString&)> openCardPage, QWidget* parent)
    : QDialog(parent),
      model({u"קוד כרטיס"_s, u"להדפיס"_s, u"שם כרטיס"_s}, {kCodeText, CheckListModel::kCheckColumn, kNameText}),
      services_(services), state_(state), openCardPage_(std::move(openCardPage))
{
    setObjectName(u"frmSelectCard"_s);
    setWindowTitle(u"בחירת כרטיסים"_s);
    buildControls();
}

void SelectCardDialog::buildControls()
{
    auto* proxy = new CardSignModel(this);
    proxy->setSourceModel(&model);
    VSSelectItems = checkGrid(u"VSSelectItems"_s, proxy, this);
    connect(VSSelectItems, &QTableView::doubleClicked, this, &SelectCardDialog::openCurrentCard);

    txtToItemkey = textBox(u"txtToItemkey"_s);
    txtToItemName = textBox(u"txtToItemName"_s);
    auto* find = new QGridLayout;
    const QList<std::tuple<QString, QString, QLineEdit*, void (SelectCardDialog::*)()>> searches
        = {{u"cmdFindKey"_s, u"איתור כרטיס לפי קוד:"_s, txtToItemkey, &SelectCardDialog::cmdFindKey_Click},
           {u"cmdFindByDesc"_s, u"איתור כרטיס לפי תאור:"_s, txtToItemName, &SelectCardDialog::cmdFindByDesc_Click}};
    int row = 0;
    for (const auto& [name, text, box, handler] : searches) {
        QPushButton* search = button(name, text);
        connect(search, &QPushButton::clicked, this, handler);
        find->addWidget(search, row, 0);
        find->addWidget(box, row++, 1);
    }
    auto* buttons = new QHBoxLayout;
    const QList<std::tuple<QString, QString, void (SelectCardDialog::*)()>> actions
        = {{u"CmdAllItems"_s, u"סמן את כולם"_s, &SelectCardDialog::CmdAllItems_Click},
           {u"cmdNoneItems"_s, u"בטל את כולם"_s, &SelectCardDialog::cmdNoneItems_Click},
           {u"cmdShowMarked"_s, u"סדר לפי סימון"_s, &SelectCardDialog::cmdShowMarked_Click},
           {u"cmdShowAll"_s, u"סדר לפי שם"_s, &SelectCardDialog::cmdShowAll_Click},
           {u"cmdOK"_s, u"אישור"_s, &SelectCardDialog::cmdOK_Click},
           {u"cmdClose"_s, u"ביטול"_s, &SelectCardDialog::cmdClose_Click}};
    for (const auto& [name, text, handler] : actions) {
        QPushButton* action = button(name, text);
        connect(action, &QPushButton::clicked, this, handler);
        buttons->addWidget(action);
    }
    auto* layout = new QVBoxLayout(this);
    layout->addLayout(find);
    layout->addWidget(VSSelectItems, 1);
    layout->addLayout(buttons);
    resize(640, 560);
}

void SelectCardDialog::FillCardList(const QString& connString, const QString& statement)
{
    model.setRows({});
    try {
        readCardList(services_.database, connString, statement,
                     [this](const QVector<CheckListModel::Row>& rows) { model.appendRows(rows); });
    } catch (const Failure& failure) {
        services_.messages.critical(u"תקלה"_s, failure.description());
    }
}

void SelectCardDialog::findAndCheck(int textIndex, const QString& prefix)
{
    const int found = model.findPrefix(textIndex, prefix);
    if (found < 0)
        return;
    model.setChecked(found, true);
    const QModelIndex cell = VSSelectItems->model()->index(found, 0);
    VSSelectItems->setCurrentIndex(cell);
    VSSelectItems->scrollTo(cell);
}

void SelectCardDialog::cmdFindKey_Click()
{
    findAndCheck(kCodeText, txtToItemkey->text());
}

void SelectCardDialog::cmdFindByDesc_Click()
{
    findAndCheck(kNameText, txtToItemName->text());
}

void SelectCardDialog::selectTopLeft()
{
    if (model.rowCount() > 0)
        VSSelectItems->setCurrentIndex(VSSelectItems->model()->index(0, 1));
}

void SelectCardDialog::cmdShowMarked_Click()
{
    model.sortByCheckThenText(kNameText);
    selectTopLeft();
}

void SelectCardDialog::cmdShowAll_Click()
{
    model.sortByText(kNameText);
    selectTopLeft();
}

void SelectCardDialog::cmdOK_Click()
{
    replaceSelectedCards(state_, model.checkedKeys());
    hide();
}

void SelectCardDialog::openCurrentCard()
{
    const QModelIndex current = VSSelectItems->currentIndex();
    if (current.isValid())
        openCardPage_(model.row(current.row()).key.trimmed());
}

void SelectCardDialog::keyPressEvent(QKeyEvent* event)
{
    if ((event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter) && VSSelectItems->hasFocus()) {
        openCurrentCard();
        return;
    }
    QDialog::keyPressEvent(event);
}

}  // namespace pelmar
