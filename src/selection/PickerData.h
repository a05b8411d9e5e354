#pragma once

#include "selection/CheckListModel.h"

#include <QString>

#include <functional>

namespace pelmar {

class DatabaseClient;

// Appends to rows the card groups of a card type (cmbCS index; leads list the customer groups,
// -1 all groups), ordered by type and code; key = GroupCode, text = GroupName ("-" when empty).
// Throws Failure; the rows appended before stay.
void readCardGroups(const DatabaseClient& client, const QString& connString, short cardType,
                    QVector<CheckListModel::Row>& rows);

// The 64 card properties, row N for property N, each named "-".
QVector<CheckListModel::Row> unnamedProperties();
// Names the properties OCQG names (a property it does not list stays "-"). Throws Failure; the
// names given before stay.
void nameProperties(const DatabaseClient& client, const QString& connString, QVector<CheckListModel::Row>& properties);

// The cards the statement lists, handed over in batches as they are read: key and first text the
// code without blanks around it (rows with an empty code are left out), second text the name
// ("-" when empty). Throws Failure; the batches handed over before stay.
void readCardList(const DatabaseClient& client, const QString& connString, const QString& statement,
                  const std::function<void(const QVector<CheckListModel::Row>&)>& batch);

// The card codes of a tab-separated file, one per line from the column-th field (counted from 1):
// the text up to the next tab, or to the line's end when the field is the last. The first line
// is skipped when asked. Codes are taken unchanged, empty ones and duplicates included. The file
// is UTF-8 when it has a byte-order mark or is valid UTF-8, else windows-1255.
// Throws Failure when the file cannot be read.
QStringList readCardFile(const QString& path, int column, bool skipFirstLine);

// The column number typed by the user; throws Failure unless it is a whole number 1..32767.
int cardFileColumn(const QString& text);

}  // namespace pelmar
