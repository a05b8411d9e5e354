#pragma once

#include <QString>

class QObject;

namespace pelmar {

class SettingsStore;

// Which property of a control a setting carries.
enum CtrlProp : unsigned char {
    kPropText = 1,      // text box text, label caption
    kPropListIndex = 2, // list index of a drop-down list ("-1" when nothing is chosen)
    kPropValue = 3,     // check box "0"/"1"; option button "True"/"False"
    kPropTag = 4,       // the control's tag
};

enum SetGetAction : unsigned char {
    kSave = 1,
    kLoad = 2,
};

// Assigns a text to one property of a control, converted as a stored setting is. Throws
// Failure (and leaves the control as it was) when the control cannot take the text.
void assignProperty(QObject* control, unsigned char prop, const QString& text);

// Moves one control property to (action 1) or from (action 2) one settings key; fallback is
// used when the key is missing. Any other action or property does nothing.
// Throws Failure when the store cannot be written or the control cannot take the stored text
// (a list index beyond the list, a check box value that is not 0 or 1, ...): the control then
// keeps its previous value.
void SetGetCtrl(unsigned char action, SettingsStore& store, const QString& app, const QString& section,
                const QString& key, QObject* control, unsigned char prop, const QString& fallback);

}  // namespace pelmar
