#include "db/Recordset.h"

#include "common/Failure.h"
#include "db/DatabaseConnection.h"

#include <QSqlRecord>

namespace pelmar {

Recordset::Recordset(std::unique_ptr<DatabaseConnection> connection, const QString& sql)
    : connection_(std::move(connection)), sql_(connection_->adapt(sql)), query_(connection_->database())
{
    query_.setForwardOnly(true);
    execute();
}

Recordset::~Recordset()
{
    close();
}

void Recordset::execute()
{
    if (!query_.exec(sql_))
        throw failureOf(query_.lastError());
    record_ = query_.record();
    positions_.clear();
    readRow();
    bof_ = eof_;
}

void Recordset::readRow()
{
    eof_ = !query_.next();
    if (eof_) {
        row_.clear();
        if (query_.lastError().isValid())
            throw failureOf(query_.lastError());
        return;
    }
    const int columns = record_.count();
    row_.resize(columns);
    for (int i = 0; i < columns; ++i)
        row_[i] = query_.value(i);
}

void Recordset::moveFirst()
{
    if (!connection_)
        throw Failure(QStringLiteral("The recordset is closed."));
    query_.finish();
    execute();
}

void Recordset::moveNext()
{
    if (eof_)
        throw Failure(QStringLiteral("Either BOF or EOF is True, or the current record has been deleted."), 3021);
    bof_ = false;
    readRow();
}

// Callers ask for the same few names row after row, so each name's position is remembered.
int Recordset::indexOf(const QString& column) const
{
    const auto known = positions_.constFind(column);
    if (known != positions_.constEnd())
        return *known;
    const int index = record_.indexOf(column);
    positions_.insert(column, index);
    return index;
}

bool Recordset::hasColumn(const QString& column) const
{
    return connection_ && indexOf(column) >= 0;
}

int Recordset::requiredColumn(const QString& column) const
{
    const int index = columnIndex(column);
    if (index < 0)
        throw Failure(QStringLiteral("Item cannot be found in the collection corresponding to the "
                                     "requested name or ordinal (%1).")
                          .arg(column),
                      3265);
    return index;
}

QVariant Recordset::value(const QString& column) const
{
    if (eof_)
        throw Failure(QStringLiteral("Either BOF or EOF is True, or the current record has been deleted."), 3021);
    return row_.at(requiredColumn(column));
}

void Recordset::close()
{
    if (!connection_)
        return;
    query_.finish();
    query_ = QSqlQuery();
    row_.clear();
    bof_ = eof_ = true;
    connection_.reset();
}

}  // namespace pelmar
