#include "control/SetGetCtrl.h"

#include "common/Failure.h"
#include "control/OptionButtons.h"
#include "control/Tag.h"
#include "settings/SettingsStore.h"

#include <QAbstractButton>
#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QRadioButton>

namespace pelmar {

namespace {

[[noreturn]] void refuse(const QObject* control, const QString& text)
{
    throw Failure(QStringLiteral("Invalid property value \"%1\" for %2.").arg(text, control->objectName()),
                  380);
}

QString readProperty(const QObject* control, unsigned char prop)
{
    switch (prop) {
    case kPropText:
        if (auto edit = qobject_cast<const QLineEdit*>(control))
            return edit->text();
        if (auto text = qobject_cast<const QPlainTextEdit*>(control))
            return text->toPlainText();
        if (auto label = qobject_cast<const QLabel*>(control))
            return label->text();
        break;
    case kPropListIndex:
        if (auto combo = qobject_cast<const QComboBox*>(control))
            return QString::number(combo->currentIndex());
        break;
    case kPropValue:
        if (auto radio = qobject_cast<const QRadioButton*>(control))
            return radio->isChecked() ? QStringLiteral("True") : QStringLiteral("False");
        if (auto check = qobject_cast<const QCheckBox*>(control))
            return check->isChecked() ? QStringLiteral("1") : QStringLiteral("0");
        break;
    case kPropTag:
        return tagOf(control);
    }
    throw Failure(QStringLiteral("%1 has no such property.").arg(control->objectName()), 438);
}

bool truthOf(const QObject* control, const QString& text)
{
    if (text.compare(QStringLiteral("True"), Qt::CaseInsensitive) == 0)
        return true;
    if (text.compare(QStringLiteral("False"), Qt::CaseInsensitive) == 0)
        return false;
    bool numeric = false;
    const int number = text.trimmed().toInt(&numeric);
    if (!numeric)
        refuse(control, text);
    return number != 0;
}

}  // namespace

void assignProperty(QObject* control, unsigned char prop, const QString& text)
{
    switch (prop) {
    case kPropText:
        if (auto edit = qobject_cast<QLineEdit*>(control))
            return edit->setText(text);
        if (auto plain = qobject_cast<QPlainTextEdit*>(control))
            return plain->setPlainText(text);
        if (auto label = qobject_cast<QLabel*>(control))
            return label->setText(text);
        break;
    case kPropListIndex:
        if (auto combo = qobject_cast<QComboBox*>(control)) {
            bool numeric = false;
            const int index = text.trimmed().toInt(&numeric);
            if (!numeric || index < -1 || index >= combo->count())
                refuse(control, text);
            return combo->setCurrentIndex(index);
        }
        break;
    case kPropValue:
        if (auto radio = qobject_cast<QRadioButton*>(control))
            return setOptionValue(radio, truthOf(control, text));
        if (auto check = qobject_cast<QCheckBox*>(control)) {
            if (text.trimmed() != QStringLiteral("0") && text.trimmed() != QStringLiteral("1"))
                refuse(control, text);
            return check->setChecked(text.trimmed() == QStringLiteral("1"));
        }
        break;
    case kPropTag:
        return setTag(control, text);
    }
    throw Failure(QStringLiteral("%1 has no such property.").arg(control->objectName()), 438);
}

void SetGetCtrl(unsigned char action, SettingsStore& store, const QString& app, const QString& section,
                const QString& key, QObject* control, unsigned char prop, const QString& fallback)
{
    if (prop < kPropText || prop > kPropTag)
        return;
    if (action == kSave)
        store.setValue(app, section, key, readProperty(control, prop));
    else if (action == kLoad)
        assignProperty(control, prop, store.value(app, section, key, fallback));
}

}  // namespace pelmar
