#include "control/OptionsBinder.h"

#include "options/OptionBindings.h"
#include "widgets/OptionButtons.h"
#include "widgets/Tag.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QRadioButton>
#include <QWidget>

namespace pelmar {

OptionsBinder::OptionsBinder(QWidget& pages, MailingOptions& options) : QObject(&pages), options_(options)
{
    for (const OptionBinding& binding : optionBindings()) {
        auto* control = pages.findChild<QWidget*>(binding.control);
        if (!control)
            qFatal("The pages have no control %s for its option.", qPrintable(binding.control));
        bound_.append({&binding, control});
        follow(bound_.last());
    }
}

// A change on the page goes into the options, except while show() itself is changing the page.
void OptionsBinder::follow(const Bound& bound)
{
    const OptionBinding& b = *bound.binding;
    if (auto* edit = qobject_cast<QLineEdit*>(bound.control)) {
        connect(edit, &QLineEdit::textChanged, this, [this, &b](const QString& text) {
            if (!showing_)
                b.text(options_) = text;
        });
    } else if (auto* plain = qobject_cast<QPlainTextEdit*>(bound.control)) {
        connect(plain, &QPlainTextEdit::textChanged, this, [this, &b, plain] {
            if (!showing_)
                b.text(options_) = plain->toPlainText();
        });
    } else if (auto* combo = qobject_cast<QComboBox*>(bound.control)) {
        connect(combo, &QComboBox::currentIndexChanged, this, [this, &b](int index) {
            if (!showing_)
                b.number(options_) = index;
        });
    } else if (auto* radio = qobject_cast<QRadioButton*>(bound.control)) {
        connect(radio, &QRadioButton::toggled, this, [this, &b](bool on) {
            if (!showing_)
                setOptionText(b, options_, on ? QStringLiteral("True") : QStringLiteral("False"));
        });
    } else if (auto* check = qobject_cast<QCheckBox*>(bound.control)) {
        connect(check, &QCheckBox::toggled, this, [this, &b](bool on) {
            if (!showing_)
                b.flag(options_) = on;
        });
    }
    // A tag changes only through the control's own handler, which writes the options itself.
}

void OptionsBinder::showOne(const Bound& bound)
{
    const OptionBinding& b = *bound.binding;
    switch (b.kind) {
    case OptionKind::Text:
        if (auto* edit = qobject_cast<QLineEdit*>(bound.control))
            edit->setText(b.text(options_));
        else if (auto* plain = qobject_cast<QPlainTextEdit*>(bound.control))
            plain->setPlainText(b.text(options_));
        break;
    case OptionKind::ListIndex: qobject_cast<QComboBox*>(bound.control)->setCurrentIndex(b.number(options_)); break;
    case OptionKind::Check: qobject_cast<QCheckBox*>(bound.control)->setChecked(b.flag(options_)); break;
    case OptionKind::Choice:
        setOptionValue(qobject_cast<QRadioButton*>(bound.control), b.number(options_) == b.choice);
        break;
    case OptionKind::Tag: setTag(bound.control, b.text(options_)); break;
    }
}

void OptionsBinder::show()
{
    showing_ = true;
    for (const Bound& bound : bound_)
        showOne(bound);
    showing_ = false;
}

}  // namespace pelmar
