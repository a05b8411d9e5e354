#pragma once

#include <QString>

class QObject;

namespace pelmar {

class SettingsStore;

// Which property of a dialog's control a setting carries. The options of the control's pages go
// through the binding table instead (options/OptionBindings.h).
enum CtrlProp : unsigned char {
    kPropText = 1,  // a text box's text
    kPropValue = 3,  // a check box: "0" or "1"
};

enum SetGetAction : unsigned char {
    kSave = 1,
    kLoad = 2,
};

// Moves one control property to (action 1) or from (action 2) one settings key; fallback is
// used when the key is missing. Any other action does nothing.
// Throws Failure when the store cannot be written, the control has no such property, or the
// control cannot take the stored text (a check box value that is not 0 or 1): the control then
// keeps its previous value.
void SetGetCtrl(unsigned char action, SettingsStore& store, const QString& app, const QString& section,
                const QString& key, QObject* control, unsigned char prop, const QString& fallback);

}  // namespace pelmar
