#include "outputs/EmailCampaign.h"

#include "common/Failure.h"
#include "common/Fields.h"
#include "common/Messages.h"
#include "common/Progress.h"
#include "common/UserText.h"
#include "db/DatabaseClient.h"
#include "db/Recordset.h"
#include "options/MailingOptions.h"
#include "outputs/MailJournal.h"
#include "outputs/MailTransport.h"
#include "outputs/MimeWriter.h"
#include "outputs/Output.h"
#include "outputs/RunParameters.h"
#include "outputs/RunSupport.h"
#include "selection/SelectBuilder.h"

#include <QDateTime>
#include <QFile>
#include <QFileInfo>

#include <cmath>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

constexpr short kEmailKind = 4;
constexpr int kLargestGroup = 32767;

bool numeric(const QString& text)
{
    bool ok = false;
    const double number = QLocale::c().toDouble(text.trimmed(), &ok);
    return ok && std::isfinite(number);
}

// Recipients per message: the group size of method 2 when it is a number, else one. Throws
// Failure naming the box for a number outside 1..32767.
int groupSizeOf(const MailingOptions& o)
{
    if (o.emailMethod != 2 || !numeric(o.emailGroupSize))
        return 1;
    return wholeNumberIn(o.emailGroupSize, u"גודל הקבוצה"_s, 1, kLargestGroup);
}

// The first option that keeps the run from starting, as the message the user is shown; empty
// when the options are complete.
QString optionsRefusal(const MailingOptions& o)
{
    if (!o.emailAttachFile.isEmpty() && !QFileInfo(o.emailAttachFile).isFile())
        return u"הקובץ המצורף אינו נמצא"_s;
    if (!o.emailHtmlBody.isEmpty() && !QFileInfo(o.emailHtmlBody).isFile())
        return u"הקובץ לגוף ההודעה אינו נמצא"_s;
    if (o.emailFrom.isEmpty())
        return u"חובה לציין כתובת השולח"_s;
    if (!isMailbox(o.emailFrom))
        return u"כתובת השולח \"%1\" אינה כתובת דואר אלקטרוני תקינה"_s.arg(o.emailFrom);
    if (o.emailSubject.isEmpty())
        return u"חובה לציין נושא להודעה"_s;
    if (o.emailMethod == 2 && o.emailToMain.isEmpty())
        return u"חובה לציין נמען ראשי בשיטה זו"_s;
    try {
        groupSizeOf(o);
        wholeNumberIn(o.smtpPort, u"פורט"_s, 1, 65535);
    } catch (const Failure& refusal) {
        return refusal.description();
    }
    if (o.smtpServer.trimmed().isEmpty())
        return u"חובה לציין שרת דואר יוצא"_s;
    return {};
}

// How a recipient is named in the box that says it cannot be reached.
QString recipientText(const MailRecipient& recipient)
{
    return recipient.name.isEmpty() ? recipient.address : recipient.name + u'<' + recipient.address + u'>';
}

// The row's reader: the columns are looked up once.
struct RecipientColumns {
    explicit RecipientColumns(const Recordset& rows)
        : code(rows.requiredColumn(u"CardCode"_s)), contactMail(rows.requiredColumn(u"CMail"_s)),
          cardMail(rows.requiredColumn(u"Email"_s)), contactName(rows.requiredColumn(u"CName"_s)),
          attention(rows.requiredColumn(u"Attn"_s)), cardName(rows.requiredColumn(u"CardName"_s))
    {}

    // The contact's e-mail when it has one, else the card's; the contact's name, else the
    // attention name, else the card's name, else the address.
    MailRecipient recipient(const Recordset& rows) const
    {
        MailRecipient result{FieldText(ValueOrDefault(rows.valueAt(contactMail), rows.valueAt(cardMail))), {}};
        for (const int column : {contactName, attention, cardName}) {
            if (!rows.valueAt(column).isNull())
                return {result.address, FieldText(rows.valueAt(column))};
        }
        return {result.address, result.address};
    }

    int code, contactMail, cardMail, contactName, attention, cardName;
};

class Campaign {
public:
    Campaign(RunContext& context, MailTransport& transport, MailMessage message, int groupSize)
        : context_(context), transport_(transport), message_(std::move(message)), groupSize_(groupSize),
          content_(mimeContent(message_))
    {}

    // Counts the recipients the filter lets through.
    void count(Recordset& rows, const std::function<bool(const QString&)>& wanted);
    // Walks the rows again and sends; false when the user stopped the run.
    bool send(Recordset& rows, const std::function<bool(const QString&)>& wanted, MailJournal& journal);
    QString outcome() const;

private:
    void show(const QString& text)
    {
        step_ = text;
        context_.progress.report(step_, fraction_);
    }
    void advance();
    void add(const MailRecipient& recipient, const QString& key);
    void sendMessage(MailJournal& journal);
    void drop(const QString& address);

    RunContext& context_;
    MailTransport& transport_;
    MailMessage message_;
    const int groupSize_;
    const QByteArray content_;
    QStringList keys_;  // the journal's names of the message's own recipients
    int total_ = 0;
    int processed_ = 0;
    QString step_;
    double fraction_ = 0;
    int messagesSent_ = 0;
    int recipientsDropped_ = 0;
    int sentBefore_ = 0;
};

void Campaign::count(Recordset& rows, const std::function<bool(const QString&)>& wanted)
{
    show(u"סורק וסופר נמענים"_s);
    const int code = rows.requiredColumn(u"CardCode"_s);
    for (; !rows.eof(); rows.moveNext()) {
        if (!wanted || wanted(FieldText(rows.valueAt(code))))
            ++total_;
    }
}

bool Campaign::send(Recordset& rows, const std::function<bool(const QString&)>& wanted, MailJournal& journal)
{
    const RecipientColumns columns(rows);
    for (rows.moveFirst(); !rows.eof(); rows.moveNext()) {
        show(u"בונה את הודעה מספר "_s + QString::number(processed_ + 1));
        const QString code = FieldText(rows.valueAt(columns.code));
        if (wanted && !wanted(code))
            continue;
        const MailRecipient recipient = columns.recipient(rows);
        if (!recipient.address.contains(u'@'))
            continue;
        const QString key = code + u'\t' + recipient.address;
        if (journal.wasSent(key)) {
            ++sentBefore_;
            context_.outcome = outcome();
        } else {
            add(recipient, key);
            if (keys_.size() == groupSize_)
                sendMessage(journal);
        }
        advance();
        if (context_.stop.requested())
            return false;
    }
    if (!keys_.isEmpty())
        sendMessage(journal);
    return true;
}

void Campaign::advance()
{
    ++processed_;
    fraction_ = std::min(1.0, static_cast<double>(processed_) / total_);
    context_.progress.report(step_, fraction_);
}

void Campaign::add(const MailRecipient& recipient, const QString& key)
{
    if (groupSize_ == 1)
        message_.toList = {recipient};
    else
        message_.bccList.append(recipient);
    keys_.append(key);
}

void Campaign::sendMessage(MailJournal& journal)
{
    QStringList envelope;
    for (const QList<MailRecipient>* list : {&message_.toList, &message_.bccList}) {
        for (const MailRecipient& recipient : *list) {
            if (!isMailbox(recipient.address)) {
                drop(recipient.address);
                return;
            }
            envelope << recipient.address;
        }
    }
    const QByteArray headers = mimeHeaders(message_, QDateTime::currentDateTime(), newMessageId(message_.from.address));
    const QString refusedAddress = transport_.send(message_.from.address, envelope, headers, content_);
    if (!refusedAddress.isEmpty())
        return drop(refusedAddress);
    journal.record(keys_);
    ++messagesSent_;
    context_.outcome = outcome();
    message_.bccList.clear();
    keys_.clear();
}

// Drops the message being built: the box names the recipient that cannot be reached.
void Campaign::drop(const QString& address)
{
    MailRecipient named{address, {}};
    for (const QList<MailRecipient>* list : {&message_.toList, &message_.bccList}) {
        for (const MailRecipient& recipient : *list) {
            if (recipient.address == address)
                named = recipient;
        }
    }
    context_.services.messages.exclamation(u"Cannot resolve address '"_s + recipientText(named) + u"'"_s);
    recipientsDropped_ += static_cast<int>(keys_.size());
    context_.outcome = outcome();
    message_.bccList.clear();
    keys_.clear();
}

QString Campaign::outcome() const
{
    QString text = u"נשלחו %1 הודעות; %2 נמענים לא קיבלו את ההודעה."_s.arg(messagesSent_).arg(recipientsDropped_);
    if (sentBefore_ > 0)
        text += u" %1 נמענים כבר קיבלו אותה בהפצה הקודמת."_s.arg(sentBefore_);
    return text;
}

// Everything that makes a campaign what it is: its message, its method and its recipients. A
// run with the same of all of these goes on from where the earlier one stopped.
QByteArray campaignKey(const MailMessage& message, const MailingOptions& o, int groupSize, const QString& statement)
{
    const QStringList parts
        = {message.from.address,       message.from.name, message.subject,       message.body,
           message.htmlBody,           o.emailAttachFile, o.emailAttachFileDesc, QString::number(o.emailMethod),
           QString::number(groupSize), o.emailToMain,     o.emailToMainDesc,     statement};
    return parts.join(QChar(0)).toUtf8();
}

MailMessage campaignMessage(const MailingOptions& o, const QString& htmlBody, int groupSize)
{
    MailMessage message;
    message.from = {o.emailFrom, o.emailFromDesc};
    message.subject = o.emailSubject;
    if (o.emailHtmlBody.isEmpty())
        message.body = o.emailContent;
    else
        message.htmlBody = htmlBody;
    message.attachments = {{o.emailAttachFile, o.emailAttachFileDesc}};
    if (groupSize > 1)
        message.toList = {{o.emailToMain, o.emailToMainDesc}};
    return message;
}

void runCampaign(RunContext& context, MailTransport& transport, const QString& journalFolder)
{
    const MailingOptions& o = context.options;
    bool bodyRead = true;
    const QString htmlBody
        = o.emailHtmlBody.isEmpty() ? QString() : ReadTextFile(o.emailHtmlBody, context.services.messages, bodyRead);
    if (!bodyRead)
        return;
    context.progress.report(u"פותח רשימת נמענים המתאימים לטווח"_s, 0);
    const QString connString = openCompany(context);
    const QString statement = recipientStatement(o, context.state, kEmailKind, false, false);
    auto rows = context.services.database.open(statement, connString);
    const auto wanted = selectedCardsFilter(context);
    const int groupSize = groupSizeOf(o);
    const MailMessage message = campaignMessage(o, htmlBody, groupSize);
    MailJournal journal(journalFolder, campaignKey(message, o, groupSize, statement));
    if (journal.sentBefore() > 0
        && !context.services.messages.question(
            u"שאלה"_s,
            u"ההפצה הקודמת של הודעה זו נעצרה אחרי %1 נמענים. להמשיך מהמקום שבו נעצרה?"_s.arg(journal.sentBefore())))
        journal.startOver();
    if (!rows->eof()) {
        Campaign campaign(context, transport, message, groupSize);
        campaign.count(*rows, wanted);
        context.progress.report(u"מכין את הודעת הדואר האלקטרוני"_s, 0);
        const bool completed = campaign.send(*rows, wanted, journal);
        context.outcome = campaign.outcome();
        if (completed)
            journal.finish();
    } else {
        journal.finish();
    }
    context.progress.report(u"הדיוור הסתיים"_s, 0);
}

}  // namespace

void SendEmailCampaign(RunContext& context, MailTransport& transport, const QString& journalFolder)
{
    context.progress.report({}, 0);
    const QString refusal = optionsRefusal(context.options);
    if (!refusal.isEmpty())
        return context.services.messages.critical(u"שגיאה"_s, refusal);
    try {
        runCampaign(context, transport, journalFolder);
    } catch (const Failure& failure) {
        context.stop.request();
        context.services.messages.critical(u"תקלה"_s, failure.description());
    }
}

SmtpServer smtpServerOf(const MailingOptions& options)
{
    SmtpServer server;
    server.host = options.smtpServer.trimmed();
    server.port = options.smtpPort.trimmed().toInt();
    server.security = static_cast<SmtpServer::Security>(std::clamp(options.smtpSecurity, 0, 2));
    server.user = options.smtpUser;
    server.password = options.smtpPassword;
    server.caFile = qEnvironmentVariable("PELMAR_SMTP_CA_FILE");
    return server;
}

QString ReadTextFile(const QString& path, Messages& messages, bool& ok)
{
    QFile file(path);
    QByteArray bytes;
    ok = file.open(QIODevice::ReadOnly);
    if (ok) {
        bytes = file.readAll();
        ok = file.error() == QFileDevice::NoError;
    }
    if (!ok)
        messages.plain(u"Error %1 reading file\r\n%2"_s.arg(static_cast<int>(file.error())).arg(file.errorString()));
    return decodeUserText(bytes);
}

}  // namespace pelmar
