#pragma once

#include <QDate>
#include <QString>

#include <functional>
#include <optional>

namespace pelmar {

class DatabaseClient;

// The statement of a recipient list and where it is read.
struct ListQuery {
    const DatabaseClient& client;
    QString connString;
    QString statement;  // select + where + order of the kind, with details
    // The selection filter: null when off, else true for the codes the list holds.
    std::function<bool(const QString&)> wanted;
};

// The label layout the labels list (kind 2) counts its pages with.
struct ListPageLayout {
    int rows;
    int cols;
    int copies;
};

// Writes the recipient list of an output kind (2 labels, 3 fax, 4 e-mail, 5 SMS, 6 letters) to
// path: a head, the date, the kind's subtitle and columns, one row per recipient (contact values
// before card values where the kind has both), the count and, for labels, the pages needed.
// A statement without rows leaves the file ending after the header's second separator.
// Database values are HTML-escaped; Null shows as "&nbsp;". pages must be given for kind 2.
// Throws Failure on a database or file failure; the file then holds what was written.
void writeRecipientList(const QString& path, short kind, const ListQuery& query,
                        const std::optional<ListPageLayout>& pages, const QDate& today);

// Pages needed for count recipients of copies labels each on pages of rows × cols.
qint64 labelPagesNeeded(qint64 count, const ListPageLayout& layout);

}  // namespace pelmar
