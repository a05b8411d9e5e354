#pragma once

#include "options/OptionBindings.h"

#include <QStringList>

#include <gtest/gtest.h>

namespace pelmar::test {

// Options as a user leaves them: each "Control=value" set through the binding table, as the
// page control or --set would set it, over the options of a fresh page.
inline MailingOptions optionsWith(const QStringList& assignments, MailingOptions options = {})
{
    for (const QString& assignment : assignments) {
        const QString control = assignment.section(u'=', 0, 0);
        const OptionBinding* binding = optionNamed(control);
        EXPECT_NE(binding, nullptr) << control.toStdString();
        if (binding)
            setOptionText(*binding, options, assignment.section(u'=', 1));
    }
    return options;
}

}  // namespace pelmar::test
