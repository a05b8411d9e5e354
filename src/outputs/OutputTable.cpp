#include "common/BrowserWindow.h"
#include "common/Messages.h"
#include "options/Lists.h"
#include "options/MailingOptions.h"
#include "outputs/EmailCampaign.h"
#include "outputs/MailJournal.h"
#include "outputs/Output.h"
#include "outputs/RunSupport.h"
#include "outputs/Runs.h"

#include <algorithm>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

using Argument = CommandLineUse::Argument;

class LabelSheetOutput : public Output {
public:
    LabelSheetOutput()
        : Output({.name = u"labels"_s,
                  .kind = 2,
                  .question = u"להתחיל בהכנת המדבקות?"_s,
                  .commandLine = {u"labels [-o FILE] [--open]"_s,
                                  u"the label sheet (default: pelmar1.htm in the temporary folder)"_s}})
    {}
    void run(RunContext& context) const override { RunLabels(context); }
};

class SmsListOutput : public Output {
public:
    SmsListOutput()
        : Output({.name = u"sms"_s,
                  .kind = 5,
                  .question = u"להתחיל בהכנת קובץ למשלוח הודעות לסלולריים?"_s,
                  .commandLine = {u"sms -o FILE"_s, u"the SMS list"_s, Argument::None, true}})
    {}
    void run(RunContext& context) const override { SaveSMSList(context); }
};

// The tracking list of the preview button: the recipients of the chosen output type, or of the
// requested kind.
class RecipientListOutput : public Output {
public:
    RecipientListOutput()
        : Output({.name = u"list"_s,
                  .commandLine = {u"list [--kind 2..6] [-o FILE] [--open]"_s,
                                  u"the recipient list (default kind: the chosen output type)"_s, Argument::Kind}})
    {}
    void run(RunContext& context) const override
    {
        const QString path = runFile(context, u"pelmar2.htm"_s);
        CreateHTML(path, context.request.kind.value_or(chosenOutputKind(context.options.outType)), context);
        context.services.browser.open(path);
    }
};

// The page of the card the card picker opens.
class CardPageOutput : public Output {
public:
    CardPageOutput()
        : Output(
            {.name = u"card"_s,
             .commandLine = {u"card CODE [-o FILE] [--open]"_s,
                             u"the card page (default: pelmar3.htm in the temporary folder)"_s, Argument::CardCode}})
    {}
    void run(RunContext& context) const override
    {
        const QString path = runFile(context, u"pelmar3.htm"_s);
        CreateCardFile(path, context.request.cardCode, context);
        context.services.browser.open(path);
    }
};

// The e-mail campaign, through the outgoing mail server of the options.
class EmailOutput : public Output {
public:
    EmailOutput()
        : Output({.name = u"email"_s,
                  .kind = 4,
                  .question = u"להתחיל במשלוח דואר אלקטרוני?"_s,
                  .finishMessage = u"הדיוור האלקטרוני הסתיים"_s,
                  .commandLine
                  = {u"email [--yes]"_s, u"the e-mail campaign, through the outgoing mail server of the options"_s}})
    {}
    void run(RunContext& context) const override
    {
        SmtpTransport transport(smtpServerOf(context.options));
        SendEmailCampaign(context, transport, MailJournal::userFolder());
    }
};

// An output of the run button that this version does not have yet: it says so and does nothing,
// so no finish message follows.
class UnavailableOutput : public Output {
public:
    UnavailableOutput(short kind, const QString& question) : Output({.kind = kind, .question = question}) {}
    void run(RunContext& context) const override
    {
        context.services.messages.information(
            u"הודעה"_s,
            u"הפלט \"%1\" עדיין אינו זמין בגרסה זו. לא בוצע דבר."_s.arg(outputTypeEntries().at(kind() - 2)));
    }
};

}  // namespace

const QList<const Output*>& outputTable()
{
    static const LabelSheetOutput labels;
    static const UnavailableOutput fax(3, u"להתחיל במשלוח הפקסים?"_s);
    static const EmailOutput email;
    static const SmsListOutput sms;
    static const UnavailableOutput letters(6, u"להתחיל בהדפסת המכתבים?"_s);
    static const RecipientListOutput list;
    static const CardPageOutput card;
    static const QList<const Output*> table = {&labels, &fax, &email, &sms, &letters, &list, &card};
    return table;
}

QString finishText(const Output& output, const RunContext& context)
{
    if (output.finishMessage().isEmpty() || context.outcome.isEmpty())
        return output.finishMessage();
    return output.finishMessage() + u'\n' + context.outcome;
}

short chosenOutputKind(int listIndex)
{
    return static_cast<short>(std::max(0, listIndex) + 2);
}

const Output& outputChosenAt(int listIndex)
{
    const short kind = chosenOutputKind(listIndex);
    for (const Output* output : outputTable()) {
        if (output->kind() == kind)
            return *output;
    }
    return *outputTable().front();
}

const Output* outputNamed(const QString& name)
{
    for (const Output* output : outputTable()) {
        if (!name.isEmpty() && output->name() == name)
            return output;
    }
    return nullptr;
}

}  // namespace pelmar
