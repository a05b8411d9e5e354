#include "widgets/OptionButtons.h"

#include <QButtonGroup>
#include <QRadioButton>

namespace pelmar {

void setOptionValue(QRadioButton* button, bool on)
{
    if (on || !button->isChecked()) {
        button->setChecked(on);
        return;
    }
    QButtonGroup* group = button->group();
    if (group)
        group->setExclusive(false);
    button->setAutoExclusive(false);
    button->setChecked(false);
    button->setAutoExclusive(true);
    if (group)
        group->setExclusive(true);
}

}  // namespace pelmar
