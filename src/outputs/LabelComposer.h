#pragma once

#include "outputs/LabelSheet.h"

#include <QStringList>

namespace pelmar {

class Recordset;

// Composes the labels of a run: the printed lines of the current recipient row.
class LabelComposer {
public:
    LabelComposer(const LabelPage& page, const LabelDefTable& styles);

    // The lines "    <tr class=L<i>><td>text</td></tr>" of the row's label, in the template's
    // order, for the enabled lines whose text is not empty (line 6 never stands alone).
    QStringList lines(const Recordset& row) const;

private:
    const LabelPage& page_;
    QString fixedAbove_;
    QString fixedBelow_;
};

// True when the text holds a Hebrew letter (alef to tav).
bool IsHebrew(const QString& text);

}  // namespace pelmar
