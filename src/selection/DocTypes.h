#pragma once

#include <QString>

namespace pelmar {

// The document table behind an entry of CmbDocType.
struct DocTypeInfo {
    QString TableName;
    QString CardField;
    QString NameField;
    QString DateField;
    bool HasContact;
};

// Index 0..8 as listed in CmbDocType; any other index gives the A/R invoices.
DocTypeInfo GetDocTypeInfo(int pDocIndex);

// "C", "S" or "L" for cmbCS entries 0, 1, 2 ("C" for leads when forGroups: leads use the
// customer groups); "All" for any other index.
QString CardTypeCode(int index, bool forGroups);

}  // namespace pelmar
