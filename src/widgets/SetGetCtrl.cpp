#include "widgets/SetGetCtrl.h"

#include "common/Failure.h"
#include "settings/SettingsStore.h"

#include <QCheckBox>
#include <QLineEdit>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

[[noreturn]] void noSuchProperty(const QObject* control)
{
    throw Failure(u"%1 has no such property."_s.arg(control->objectName()), 438);
}

QString readProperty(const QObject* control, unsigned char prop)
{
    if (auto edit = qobject_cast<const QLineEdit*>(control); edit && prop == kPropText)
        return edit->text();
    if (auto check = qobject_cast<const QCheckBox*>(control); check && prop == kPropValue)
        return check->isChecked() ? u"1"_s : u"0"_s;
    noSuchProperty(control);
}

void assignProperty(QObject* control, unsigned char prop, const QString& text)
{
    if (auto edit = qobject_cast<QLineEdit*>(control); edit && prop == kPropText)
        return edit->setText(text);
    if (auto check = qobject_cast<QCheckBox*>(control); check && prop == kPropValue) {
        const QString value = text.trimmed();
        if (value != u"0"_s && value != u"1"_s)
            throw Failure(u"Invalid property value \"%1\" for %2."_s.arg(text, control->objectName()), 380);
        return check->setChecked(value == u"1"_s);
    }
    noSuchProperty(control);
}

}  // namespace

void SetGetCtrl(unsigned char action, SettingsStore& store, const QString& app, const QString& section,
                const QString& key, QObject* control, unsigned char prop, const QString& fallback)
{
    if (action == kSave)
        store.setValue(app, section, key, readProperty(control, prop));
    else if (action == kLoad)
        assignProperty(control, prop, store.value(app, section, key, fallback));
}

}  // namespace pelmar
