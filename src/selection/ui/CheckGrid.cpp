#include "selection/ui/CheckGrid.h"

#include "selection/CheckListModel.h"
#include "widgets/Widgets.h"

#include <QHeaderView>
#include <QPushButton>
#include <QTableView>

using namespace Qt::StringLiterals;

namespace pelmar {

QTableView* checkGrid(const QString& name, QAbstractItemModel* model, QWidget* parent)
{
    auto* grid = new QTableView(parent);
    grid->setObjectName(name);
    grid->setModel(model);
    grid->setSelectionBehavior(QAbstractItemView::SelectRows);
    grid->setSelectionMode(QAbstractItemView::SingleSelection);
    grid->verticalHeader()->hide();
    grid->horizontalHeader()->setDefaultAlignment(Qt::AlignLeading | Qt::AlignVCenter);
    grid->horizontalHeader()->setSectionResizeMode(QHeaderView::ResizeToContents);
    grid->horizontalHeader()->setStretchLastSection(true);
    return grid;
}

CheckButtons checkButtons(CheckListModel& model)
{
    CheckButtons buttons{button(u"cmdAll"_s, u"בחר בכולם"_s), button(u"cmdNone"_s, u"בטל לכולם"_s),
                         button(u"cmdRevert"_s, u"הפוך בחירה"_s), button(u"cmdOK"_s, u"אישור"_s),
                         button(u"cmdCancel"_s, u"ביטול"_s)};
    QObject::connect(buttons.cmdAll, &QPushButton::clicked, &model, [&model] { model.setAllChecked(true); });
    QObject::connect(buttons.cmdNone, &QPushButton::clicked, &model, [&model] { model.setAllChecked(false); });
    QObject::connect(buttons.cmdRevert, &QPushButton::clicked, &model, [&model] { model.invertChecks(); });
    return buttons;
}

}  // namespace pelmar
