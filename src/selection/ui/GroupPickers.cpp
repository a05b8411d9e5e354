#include "selection/ui/GroupPickers.h"

#include "common/Failure.h"
#include "common/Messages.h"
#include "common/SessionState.h"
#include "selection/PickerData.h"

#include <QGroupBox>
#include <QHBoxLayout>
#include <QPushButton>
#include <QRadioButton>
#include <QTableView>
#include <QVBoxLayout>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

void layOut(QDialog& dialog, QTableView* grid, const CheckButtons& buttons, QWidget* extra = nullptr)
{
    auto* layout = new QVBoxLayout(&dialog);
    layout->addWidget(grid, 1);
    if (extra)
        layout->addWidget(extra);
    auto* row = new QHBoxLayout;
    for (QPushButton* button : {buttons.cmdAll, buttons.cmdNone, buttons.cmdRevert})
        row->addWidget(button);
    row->addStretch(1);
    row->addWidget(buttons.cmdOK);
    row->addWidget(buttons.cmdCancel);
    layout->addLayout(row);
    dialog.resize(420, 480);
}

}  // namespace

CardGroupDialog::CardGroupDialog(Services services, SessionState& state, const QString& connString, QWidget* parent)
    : QDialog(parent), model({u"השתייכות"_s, u"משתתפת"_s}, {0, CheckListModel::kCheckColumn}), services_(services),
      state_(state)
{
    setObjectName(u"frmCardGroup"_s);
    setWindowTitle(u"בחירת קבוצות השתייכות"_s);
    CardGroups = checkGrid(u"CardGroups"_s, &model);
    buttons = checkButtons(model);
    connect(buttons.cmdOK, &QPushButton::clicked, this, &CardGroupDialog::cmdOK_Click);
    connect(buttons.cmdCancel, &QPushButton::clicked, this, &QDialog::reject);
    layOut(*this, CardGroups, buttons);
    QVector<CheckListModel::Row> groups;
    try {
        readCardGroups(services_.database, connString, state_.GroupCardType, groups);
        // The stored choice follows the groups of the type, as many as were read.
        model.setRows(groups);
        state_.SelCardGroups.resize(model.rowCount() + 1);
    } catch (const Failure& failure) {
        // Groups that cannot be read say nothing of the stored choice: it stays as it was.
        services_.messages.plain(failure.description());
    }
    UpdateGridByArray();
}

void CardGroupDialog::UpdateGridByArray()
{
    for (int r = 0; r < model.rowCount(); ++r)
        model.setChecked(r, state_.SelCardGroups[r + 1].Selected);
}

void CardGroupDialog::UpdateArrayByGrid()
{
    for (int r = 0; r < model.rowCount(); ++r)
        state_.SelCardGroups[r + 1] = {static_cast<short>(model.row(r).key.toInt()), model.row(r).checked};
}

void CardGroupDialog::cmdOK_Click()
{
    UpdateArrayByGrid();
    accept();
}

QryGroupDialog::QryGroupDialog(Services services, SessionState& state, const QString& connString, QWidget* parent)
    : QDialog(parent), model({u"מאפיין"_s, u"משתתף"_s}, {0, CheckListModel::kCheckColumn}), state_(state)
{
    setObjectName(u"frmQryGroup"_s);
    setWindowTitle(u"בחירת מאפיינים"_s);
    QryGroups = checkGrid(u"QryGroups"_s, &model);
    buttons = checkButtons(model);
    connect(buttons.cmdOK, &QPushButton::clicked, this, &QryGroupDialog::cmdOK_Click);
    connect(buttons.cmdCancel, &QPushButton::clicked, this, &QDialog::reject);
    auto* relation = new QGroupBox(u"יחס בין המאפייינים:"_s);
    relation->setObjectName(u"Relation"_s);
    Option1 = new QRadioButton(u"או"_s);
    Option1->setObjectName(u"Option1"_s);
    Option2 = new QRadioButton(u"וגם"_s);
    Option2->setObjectName(u"Option2"_s);
    auto* options = new QHBoxLayout(relation);
    options->addWidget(Option1);
    options->addWidget(Option2);
    layOut(*this, QryGroups, buttons, relation);
    QVector<CheckListModel::Row> properties = unnamedProperties();
    try {
        nameProperties(services.database, connString, properties);
    } catch (const Failure& failure) {
        services.messages.critical(u"תקלה"_s, failure.description());
    }
    model.setRows(properties);
    UpdateGridByArray();
}

void QryGroupDialog::UpdateGridByArray()
{
    for (int n = 1; n <= 64 && n <= model.rowCount(); ++n)
        model.setChecked(n - 1, state_.QryGroupSel[n]);
    (state_.QryGroupRelation == u"OR"_s ? Option1 : Option2)->setChecked(true);
}

void QryGroupDialog::UpdateArrayByGrid()
{
    for (int n = 1; n <= 64 && n <= model.rowCount(); ++n)
        state_.QryGroupSel[n] = model.row(n - 1).checked;
    state_.QryGroupRelation = Option1->isChecked() ? u"OR"_s : u"AND"_s;
}

void QryGroupDialog::cmdOK_Click()
{
    UpdateArrayByGrid();
    accept();
}

}  // namespace pelmar
