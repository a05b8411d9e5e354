#pragma once

#include <QAbstractTableModel>
#include <QStringList>
#include <QVector>

namespace pelmar {

// The rows of a picker: each row a key (the card code, the group code, the property number), the
// texts it shows and a check box. Columns show either one of the texts or the check box, in the
// order the picker gives. Built for large lists: filling, sorting and searching 100,000 rows take
// well under a second.
class CheckListModel : public QAbstractTableModel {
    Q_OBJECT
public:
    struct Row {
        QString key;
        QStringList texts;
        bool checked = false;
    };

    static constexpr int kCheckColumn = -1;

    // headers: one per column; columns: for each, the index of the text it shows, or kCheckColumn.
    CheckListModel(QStringList headers, QList<int> columns, QObject* parent = nullptr);

    int rowCount(const QModelIndex& parent = {}) const override;
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    bool setData(const QModelIndex& index, const QVariant& value, int role) override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

    void setRows(QVector<Row> rows);
    // Adds rows at the end (a list read in batches shows what it has read so far).
    void appendRows(const QVector<Row>& rows);
    const Row& row(int index) const { return rows_.at(index); }
    const QVector<Row>& rows() const { return rows_; }

    void setChecked(int row, bool checked);
    void setAllChecked(bool checked);
    void invertChecks();

    // The first row, from the top, whose text begins with prefix without regard to case; -1 when
    // none does or the prefix is empty.
    int findPrefix(int textIndex, const QString& prefix) const;

    // Sorts by a text in the grid's generic ascending order (numbers by value first, then other
    // texts without regard to case); or checked rows first and then by the text.
    void sortByText(int textIndex);
    void sortByCheckThenText(int textIndex);

    // The keys of the checked rows, in the order the rows stand.
    QStringList checkedKeys() const;

private:
    void sortRows(int textIndex, bool checkedFirst);

    QStringList headers_;
    QList<int> columns_;
    QVector<Row> rows_;
};

}  // namespace pelmar
