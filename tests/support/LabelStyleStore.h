#pragma once

#include "outputs/LabelStyles.h"
#include "settings/SettingsStore.h"
#include "support/Isolated.h"

namespace pelmar::test {

// Label styles and a settings store of the test's own.
class LabelStyleStore : public Isolated {
protected:
    // The stored text of a key of line's section, "<none>" when the key is missing.
    QString key(int line, const QString& name)
    {
        return store.value(QStringLiteral("Pelmar"), QStringLiteral("LabelDef") + QString::number(line), name,
                           QStringLiteral("<none>"));
    }

    SettingsStore store{configFolder()};
    LabelDefTable defs{};
};

}  // namespace pelmar::test
