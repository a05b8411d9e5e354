#include "selection/CheckListModel.h"

#include "common/UserText.h"

#include <algorithm>

namespace pelmar {

CheckListModel::CheckListModel(QStringList headers, QList<int> columns, QObject* parent)
    : QAbstractTableModel(parent), headers_(std::move(headers)), columns_(std::move(columns))
{}

int CheckListModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : static_cast<int>(rows_.size());
}

int CheckListModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : static_cast<int>(columns_.size());
}

QVariant CheckListModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid())
        return {};
    const Row& row = rows_.at(index.row());
    const int column = columns_.at(index.column());
    if (column == kCheckColumn)
        return role == Qt::CheckStateRole ? QVariant(row.checked ? Qt::Checked : Qt::Unchecked) : QVariant();
    if (role == Qt::DisplayRole)
        return isolated(row.texts.value(column));
    if (role == Qt::TextAlignmentRole)
        return QVariant::fromValue(Qt::AlignLeading | Qt::AlignVCenter);
    return {};
}

bool CheckListModel::setData(const QModelIndex& index, const QVariant& value, int role)
{
    if (!index.isValid() || role != Qt::CheckStateRole || columns_.at(index.column()) != kCheckColumn)
        return false;
    setChecked(index.row(), value.value<Qt::CheckState>() == Qt::Checked);
    return true;
}

Qt::ItemFlags CheckListModel::flags(const QModelIndex& index) const
{
    Qt::ItemFlags flags = Qt::ItemIsEnabled | Qt::ItemIsSelectable;
    if (index.isValid() && columns_.at(index.column()) == kCheckColumn)
        flags |= Qt::ItemIsUserCheckable;
    return flags;
}

QVariant CheckListModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation == Qt::Horizontal && role == Qt::DisplayRole)
        return headers_.value(section);
    return QAbstractTableModel::headerData(section, orientation, role);
}

void CheckListModel::setRows(QVector<Row> rows)
{
    beginResetModel();
    rows_ = std::move(rows);
    endResetModel();
}

void CheckListModel::appendRows(const QVector<Row>& rows)
{
    if (rows.isEmpty())
        return;
    beginInsertRows({}, static_cast<int>(rows_.size()), static_cast<int>(rows_.size() + rows.size() - 1));
    rows_ += rows;
    endInsertRows();
}

void CheckListModel::setChecked(int row, bool checked)
{
    rows_[row].checked = checked;
    const int column = static_cast<int>(columns_.indexOf(kCheckColumn));
    emit dataChanged(index(row, column), index(row, column), {Qt::CheckStateRole});
}

void CheckListModel::setAllChecked(bool checked)
{
    for (Row& row : rows_)
        row.checked = checked;
    if (!rows_.isEmpty())
        emit dataChanged(index(0, 0), index(rowCount() - 1, columnCount() - 1), {Qt::CheckStateRole});
}

void CheckListModel::invertChecks()
{
    for (Row& row : rows_)
        row.checked = !row.checked;
    if (!rows_.isEmpty())
        emit dataChanged(index(0, 0), index(rowCount() - 1, columnCount() - 1), {Qt::CheckStateRole});
}

int CheckListModel::findPrefix(int textIndex, const QString& prefix) const
{
    if (prefix.isEmpty())
        return -1;
    for (int i = 0; i < rows_.size(); ++i) {
        if (rows_[i].texts.value(textIndex).startsWith(prefix, Qt::CaseInsensitive))
            return i;
    }
    return -1;
}

namespace {

// A text as the grid's generic order sees it: numbers by their value, before other texts, which
// compare without regard to case.
struct SortKey {
    bool numeric;
    double number;
    const QString* text;

    bool operator<(const SortKey& other) const
    {
        if (numeric != other.numeric)
            return numeric;
        if (numeric)
            return number < other.number;
        return QString::compare(*text, *other.text, Qt::CaseInsensitive) < 0;
    }
};

SortKey sortKeyOf(const QString& text)
{
    bool numeric = false;
    const double number = text.toDouble(&numeric);
    return {numeric, number, &text};
}

}  // namespace

void CheckListModel::sortRows(int textIndex, bool checkedFirst)
{
    beginResetModel();
    QVector<std::pair<SortKey, qsizetype>> order;
    order.reserve(rows_.size());
    for (qsizetype i = 0; i < rows_.size(); ++i)
        order.append({sortKeyOf(rows_[i].texts.at(textIndex)), i});
    std::stable_sort(order.begin(), order.end(), [&](const auto& a, const auto& b) {
        if (checkedFirst && rows_[a.second].checked != rows_[b.second].checked)
            return rows_[a.second].checked;
        return a.first < b.first;
    });
    QVector<Row> sorted;
    sorted.reserve(rows_.size());
    for (const auto& entry : order)
        sorted.append(rows_[entry.second]);
    rows_ = std::move(sorted);
    endResetModel();
}

void CheckListModel::sortByText(int textIndex)
{
    sortRows(textIndex, false);
}

void CheckListModel::sortByCheckThenText(int textIndex)
{
    sortRows(textIndex, true);
}

QStringList CheckListModel::checkedKeys() const
{
    QStringList keys;
    for (const Row& row : rows_) {
        if (row.checked)
            keys << row.key;
    }
    return keys;
}

}  // namespace pelmar
