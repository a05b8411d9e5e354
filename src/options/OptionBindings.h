#pragma once

#include "options/MailingOptions.h"

#include <QList>
#include <QString>

#include <functional>

namespace pelmar {

class SettingsStore;

// How an option's value reads as text: in the settings store, on the command line (--set) and
// for the page control that shows it.
enum class OptionKind {
    Text,  // a text box: the text as it stands
    ListIndex,  // a drop-down list: the position in decimal, "-1" for nothing chosen
    Check,  // a check box: "0" or "1"
    Choice,  // one option button of a group: "True" or "False"
    Tag,  // a label's tag: the text as it stands
};

// One option: the page control that shows it (its objectName, "<name>_<index>" for a member of
// a control array), the settings key that keeps it (empty for an option the page holds only
// while the program runs) and where its value lives in MailingOptions.
struct OptionBinding {
    QString control;
    QString key;
    OptionKind kind;
    std::function<QString&(MailingOptions&)> text;  // Text and Tag
    std::function<int&(MailingOptions&)> number;  // ListIndex; Choice: the group's field
    std::function<bool&(MailingOptions&)> flag;  // Check
    int choice = 0;  // Choice: the value this button stands for
    std::function<int(const MailingOptions&)> entries;  // ListIndex: how many entries the list has
    QString fallback;  // the text a missing key loads: the value of a fresh MailingOptions
};

// Every option: first those of section "Params" in the order they are saved and loaded, then
// those the pages hold only while the program runs.
const QList<OptionBinding>& optionBindings();

// The option shown by the named control (matched exactly); null when there is none.
const OptionBinding* optionNamed(const QString& control);

// The option's value as text (the form the settings store keeps).
QString optionText(const OptionBinding& binding, const MailingOptions& options);

// Assigns a text to the option, read as the control it stands for reads it. Throws Failure, and
// leaves the options as they were, when the control could not take the text: a list position
// beyond the list, a check box value other than 0 or 1, an option button value that is neither
// a truth value nor a number. Turning an option button on turns the others of its group off;
// turning it off leaves the group with none chosen.
void setOptionText(const OptionBinding& binding, MailingOptions& options, const QString& text);

// 1 saves every option of section "Params" to the store, 2 loads them (a missing key loads its
// fallback); any other action changes nothing. A key that cannot be written, read or assigned
// is skipped and the next one is processed.
void SetGetRegParams(unsigned char action, SettingsStore& store, MailingOptions& options);

}  // namespace pelmar
