#pragma once

#include <QHash>
#include <QSqlQuery>
#include <QSqlRecord>
#include <QString>
#include <QVariant>
#include <QVector>

#include <memory>

namespace pelmar {

class DatabaseConnection;

// A forward-only, read-only result of one statement on a connection of its own.
// After opening it stands on the first row; bof() and eof() are both true when the statement
// returned no row. moveFirst() runs the statement again for a second pass. Failures throw
// Failure with the driver's number and description.
class Recordset {
public:
    Recordset(std::unique_ptr<DatabaseConnection> connection, const QString& sql);
    ~Recordset();
    Recordset(const Recordset&) = delete;
    Recordset& operator=(const Recordset&) = delete;

    bool bof() const { return bof_; }
    bool eof() const { return eof_; }
    void moveFirst();
    void moveNext();

    // The column's value on the current row, Null as a null QVariant. The name is matched
    // without regard to case. Throws Failure at BOF/EOF or for a column the row does not have.
    QVariant value(const QString& column) const;
    bool hasColumn(const QString& column) const;
    // The position of a column (without regard to case), -1 when there is none; and the value
    // at a position of the current row. For readers that look up their columns once.
    int columnIndex(const QString& column) const { return connection_ ? indexOf(column) : -1; }
    // The position of a column the reader cannot do without; throws Failure when there is none.
    int requiredColumn(const QString& column) const;
    const QVariant& valueAt(int index) const { return row_.at(index); }

    // Releases the statement and its connection; the recordset then reads as empty.
    void close();

private:
    void execute();
    void readRow();
    int indexOf(const QString& column) const;

    std::unique_ptr<DatabaseConnection> connection_;
    QString sql_;
    QSqlQuery query_;
    QSqlRecord record_;
    mutable QHash<QString, int> positions_;
    QVector<QVariant> row_;
    bool bof_ = true;
    bool eof_ = true;
};

}  // namespace pelmar
