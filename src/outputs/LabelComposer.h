#pragma once

#include "outputs/LabelSheet.h"

#include <QByteArray>

#include <array>

namespace pelmar {

class Recordset;
class TextFileWriter;
struct MailingOptions;

// Composes the labels of a run from the rows of one recordset, whose columns it looks up once.
class LabelComposer {
public:
    LabelComposer(const MailingOptions& options, const LabelDefTable& styles, const Recordset& rows);

    // Writes the current row's label: a line "    <tr class=L<i>><td>text</td></tr>" for each
    // enabled line whose text is not empty, in the template's order (line 6, the department,
    // only inside line 3). A column the statement does not select reads as Null.
    void write(TextFileWriter& file) const;

private:
    enum Column {
        CardCode,
        CardName,
        MailAddres,
        MailCity,
        MailZipCod,
        Attn,
        Department,
        CntctAddrs,
        MailBlock,
        MailCounty,
        MailState,
        MailCountry,
        ColumnCount
    };

    QString text(Column column) const;

    const MailingOptions& options_;
    const Recordset& rows_;
    QString fixedAbove_;
    QString fixedBelow_;
    std::array<int, ColumnCount> columns_{};
    std::array<QByteArray, 13> hebrewPrefix_;
    std::array<QByteArray, 13> otherPrefix_;
};

// True when the text holds a Hebrew letter (alef to tav).
bool IsHebrew(QStringView text);

}  // namespace pelmar
