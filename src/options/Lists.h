#pragma once

#include <QList>
#include <QString>
#include <QStringList>

namespace pelmar {

// The fixed entries of the pages' drop-down lists, in list order. An option of MailingOptions
// holds a position in one of them; the pages show them.
const QStringList& outputTypeEntries();  // cmbOutType: position + 2 is the output kind
const QStringList& cardTypeEntries();  // cmbCS
const QStringList& phoneTypeEntries();  // cmbPhoneType
const QStringList& documentTypeEntries();  // CmbDocType
const QStringList& byDocumentEntries();  // cmbByDoc
const QStringList& sortByEntries();  // CmbSortBy
const QStringList& sortDirectionEntries();  // CmbSortDir
const QStringList& labelTemplateEntries();  // cmbLabFormat
const QStringList& addressSourceEntries();  // cmbAddressFrom
const QStringList& smtpSecurityEntries();  // cmbSmtpSecurity

// A row of the letters page's merge table: the form field of the template it fills and, for
// the fixed rows 0..3, its caption and the recipient column behind it. Rows 4..7 are free rows:
// the user gives an SQL expression, which the recipient query returns under the form field's
// name.
struct MergeRow {
    QString formField;
    QString caption;
    QString column;
    bool free;
};

const QList<MergeRow>& mergeRows();

}  // namespace pelmar
