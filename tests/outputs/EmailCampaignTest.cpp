#include "outputs/MailFixture.h"

#include <QSet>

#include <functional>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

using Box = FakeMessages::Box;

QSet<QString> addressesOf(const QList<ReceivedMail>& mails)
{
    QSet<QString> all;
    for (const ReceivedMail& mail : mails) {
        for (const QString& recipient : mail.recipients)
            all.insert(recipient);
    }
    return all;
}

QString mAddress(int n)
{
    return u"m"_s + QString::number(n).rightJustified(2, u'0') + u"@example.test"_s;
}

class EmailCampaignTest : public MailTest {};

// Accepts every message and notes, as each one starts, how many recipients the journal on disk
// holds.
class JournalWatchingTransport : public MailTransport {
public:
    explicit JournalWatchingTransport(std::function<QStringList()> journal) : journal_(std::move(journal)) {}
    QString send(const QString&, const QStringList&, const QByteArray&, const QByteArray&) override
    {
        seen.append(journal_().size());
        return {};
    }
    QList<qsizetype> seen;

private:
    std::function<QStringList()> journal_;
};

TEST_F(EmailCampaignTest, EachAcceptedMessageIsOnDiskBeforeTheNextStarts)
{
    cards(u"M01"_s, u"M04"_s);
    JournalWatchingTransport transport([this] { return journal(); });
    RunContext run = context();
    SendEmailCampaign(run, transport, journalFolder());
    EXPECT_EQ(transport.seen, (QList<qsizetype>{0, 1, 2, 3}));
}

TEST_F(EmailCampaignTest, EachRecipientGetsAMessageOfItsOwnOverOneConnection)
{
    SmtpSink sink;
    EXPECT_EQ(send(sink), u"נשלחו 45 הודעות; 0 נמענים לא קיבלו את ההודעה."_s);
    const QList<ReceivedMail> mails = sink.messages();
    ASSERT_EQ(mails.size(), 45);
    QSet<QString> seen;
    for (const ReceivedMail& mail : mails) {
        ASSERT_EQ(mail.recipients.size(), 1);
        const QString address = mail.recipients.front();
        const QString number = address.mid(1, 2);
        EXPECT_EQ(decodedHeader(mail.header("To")), u"לקוח "_s + number + u" <"_s + address + u'>');
        EXPECT_EQ(mail.mailFrom, u"shivuk@pelmar.test"_s);
        EXPECT_TRUE(mail.header("Bcc").isEmpty());
        seen.insert(address);
    }
    EXPECT_EQ(seen.size(), 45);
    EXPECT_EQ(sink.connections(), 1);
    EXPECT_TRUE(messages.boxes.isEmpty());
    EXPECT_TRUE(journal().isEmpty()) << "a finished campaign removes its journal";
}

TEST_F(EmailCampaignTest, GroupsGoInBlindCopyToTheMainRecipientAndTheLastGroupGoesPartlyFilled)
{
    options.emailMethod = 2;
    options.emailGroupSize = u"20"_s;
    SmtpSink sink;
    EXPECT_EQ(send(sink), u"נשלחו 3 הודעות; 0 נמענים לא קיבלו את ההודעה."_s);
    const QList<ReceivedMail> mails = sink.messages();
    ASSERT_EQ(mails.size(), 3);
    QSet<QString> earlier;
    const QList<int> sizes = {20, 20, 5};
    for (int i = 0; i < 3; ++i) {
        const ReceivedMail& mail = mails[i];
        ASSERT_EQ(mail.recipients.size(), sizes[i] + 1) << i;
        EXPECT_EQ(mail.recipients.front(), u"lakohot@pelmar.test"_s);
        EXPECT_EQ(decodedHeader(mail.header("To")), u"לקוחות טרבל <lakohot@pelmar.test>"_s);
        EXPECT_TRUE(mail.header("Bcc").isEmpty());
        const QStringList group = mail.recipients.mid(1);
        for (const QString& address : group) {
            EXPECT_FALSE(earlier.contains(address)) << address.toStdString();
            EXPECT_FALSE(mail.data.contains(address.toUtf8())) << "a blind copy is named in the message";
        }
        for (const QString& address : std::as_const(earlier))
            EXPECT_FALSE(mail.data.contains(address.toUtf8()));
        earlier.unite(QSet<QString>(group.begin(), group.end()));
    }
    EXPECT_EQ(earlier.size(), 45);
}

TEST_F(EmailCampaignTest, AGroupSizeThatIsNoNumberSendsOneMessageARecipientAndOneThatIsNotPositiveIsRefused)
{
    options.emailMethod = 2;
    options.emailGroupSize = u"twenty"_s;
    cards(u"M01"_s, u"M03"_s);
    SmtpSink sink;
    send(sink);
    ASSERT_EQ(sink.messages().size(), 3);
    EXPECT_EQ(sink.messages()[0].recipients, QStringList{mAddress(1)});
    EXPECT_EQ(decodedHeader(sink.messages()[0].header("To")), u"לקוח 01 <m01@example.test>"_s);

    for (const QString& size : {u"0"_s, u"-3"_s, u"0.4"_s, u"32768"_s}) {
        messages.boxes.clear();
        options.emailGroupSize = size;
        send(sink);
        ASSERT_EQ(messages.boxes.size(), 1) << size.toStdString();
        EXPECT_EQ(messages.boxes[0].title, u"שגיאה"_s);
        EXPECT_TRUE(messages.boxes[0].text.contains(u"גודל הקבוצה"_s)) << messages.boxes[0].text.toStdString();
    }
    options.emailGroupSize = u"32767"_s;
    messages.boxes.clear();
    send(sink);
    EXPECT_TRUE(messages.boxes.isEmpty());
    EXPECT_EQ(sink.messages().size(), 4) << "32767 is the largest group";
    EXPECT_EQ(sink.connections(), 2) << "a refused run never reaches the server";
}

TEST_F(EmailCampaignTest, EachMissingOptionStopsTheRunBeforeAnythingIsSent)
{
    SmtpSink sink;
    options.smtpPort = QString::number(sink.port());
    const auto refusal = [&](auto change) {
        const MailingOptions kept = options;
        change(options);
        messages.boxes.clear();
        runCampaign();
        options = kept;
        return messages.boxes.value(0);
    };
    using O = MailingOptions;
    const QString missing = path(u"missing.html"_s);
    EXPECT_EQ(refusal([&](O& o) { o.emailAttachFile = missing; }),
              (Box{u"critical"_s, u"שגיאה"_s, u"הקובץ המצורף אינו נמצא"_s}));
    EXPECT_EQ(refusal([&](O& o) { o.emailHtmlBody = missing; }).text, u"הקובץ לגוף ההודעה אינו נמצא"_s);
    EXPECT_EQ(refusal([&](O& o) { o.emailAttachFile = folder(); }).text, u"הקובץ המצורף אינו נמצא"_s);
    EXPECT_EQ(refusal([](O& o) { o.emailFrom.clear(); }).text, u"חובה לציין כתובת השולח"_s);
    EXPECT_EQ(refusal([](O& o) { o.emailFrom = u"Dana <d@x.test>"_s; }).text,
              u"כתובת השולח \"Dana <d@x.test>\" אינה כתובת דואר אלקטרוני תקינה"_s);
    EXPECT_EQ(refusal([](O& o) { o.emailSubject.clear(); }).text, u"חובה לציין נושא להודעה"_s);
    EXPECT_EQ(refusal([](O& o) { o.emailMethod = 2, o.emailToMain.clear(); }).text, u"חובה לציין נמען ראשי בשיטה זו"_s);
    EXPECT_EQ(refusal([](O& o) { o.emailToMain.clear(); }).text, QString()) << "method 1 needs no main recipient";
    EXPECT_EQ(refusal([](O& o) { o.smtpPort = u"port"_s; }).text,
              u"הערך \"port\" בשדה \"פורט\" אינו מספר. יש לתקן אותו ולהפעיל שוב."_s);
    EXPECT_EQ(refusal([](O& o) { o.smtpServer = u" "_s; }).text, u"חובה לציין שרת דואר יוצא"_s);
    EXPECT_EQ(sink.connections(), 1) << "only the run that was not refused";
}

TEST_F(EmailCampaignTest, AddressesAndNamesComeFromTheContactTheCardOrTheAddressAndBadOnesAreDropped)
{
    cards(u"A1"_s, u"A9"_s);
    SmtpSink::Options refusing;
    refusing.refused = {u"refuse@a5.test"_s};
    SmtpSink sink(refusing);
    EXPECT_EQ(send(sink), u"נשלחו 5 הודעות; 2 נמענים לא קיבלו את ההודעה."_s);
    QStringList to;
    for (const ReceivedMail& mail : sink.messages())
        to << decodedHeader(mail.header("To"));
    to.sort();
    EXPECT_EQ(to,
              (QStringList{u"\"Evil  Bcc: spy@evil.test\" <hostile@a6.test>"_s,
                           u"\"noname@a4.test\" <noname@a4.test>"_s, u"Contact Eight <fallback@a8.test>"_s,
                           u"דנה כהן <dana@a1.test>"_s, u"כרטיס \"שלוש\" <plain@a3.test>"_s}))
        << to.join(u" | "_s).toStdString();
    EXPECT_FALSE(addressesOf(sink.messages()).contains(u"spy@evil.test"_s));
    for (const ReceivedMail& mail : sink.messages())
        EXPECT_TRUE(mail.header("Bcc").isEmpty());
    std::sort(messages.boxes.begin(), messages.boxes.end(),
              [](const Box& a, const Box& b) { return a.text.size() < b.text.size(); });
    EXPECT_EQ(
        messages.boxes,
        (QList<Box>{{u"exclamation"_s, {}, u"Cannot resolve address 'חמש<refuse@a5.test>'"_s},
                    {u"exclamation"_s, {}, u"Cannot resolve address 'שבע<x@a7.test>\r\nRCPT TO:<spy@evil.test>'"_s}}));
}

TEST_F(EmailCampaignTest, ARecipientThatCannotBeReachedDropsItsWholeGroup)
{
    cards(u"A1"_s, u"A9"_s);
    options.emailMethod = 2;
    options.emailGroupSize = u"7"_s;
    SmtpSink sink;
    EXPECT_EQ(send(sink), u"נשלחו 0 הודעות; 7 נמענים לא קיבלו את ההודעה."_s);
    EXPECT_TRUE(sink.messages().isEmpty());
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_TRUE(messages.boxes[0].text.startsWith(u"Cannot resolve address 'שבע<x@a7.test>"_s));
}

TEST_F(EmailCampaignTest, ARecipientTheServerPutsOffIsDroppedLikeOneItRefuses)
{
    cards(u"M01"_s, u"M03"_s);
    SmtpSink::Options busy;
    busy.deferred = {mAddress(2)};
    SmtpSink sink(busy);
    EXPECT_EQ(send(sink), u"נשלחו 2 הודעות; 1 נמענים לא קיבלו את ההודעה."_s);
    EXPECT_EQ(messages.boxes,
              (QList<Box>{{u"exclamation"_s, {}, u"Cannot resolve address 'לקוח 02<m02@example.test>'"_s}}));
    EXPECT_FALSE(state.StopRequested);
}

TEST_F(EmailCampaignTest, AServerThatGoesAwayEndsTheRunAndARerunGoesOnOrStartsOver)
{
    options.emailMethod = 2;
    options.emailGroupSize = u"4"_s;
    {
        SmtpSink::Options failing;
        failing.acceptLimit = 2;
        SmtpSink sink(failing);
        send(sink);
        EXPECT_EQ(sink.messages().size(), 2);
    }
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_EQ(messages.boxes[0].title, u"תקלה"_s);
    EXPECT_TRUE(messages.boxes[0].text.startsWith(u"שרת הדואר היוצא 127.0.0.1:"_s))
        << messages.boxes[0].text.toStdString();
    EXPECT_TRUE(state.StopRequested);
    EXPECT_EQ(journal().size(), 8) << "exactly the recipients of the accepted messages";

    state.StopRequested = false;
    messages.boxes.clear();
    messages.answers = {true};
    SmtpSink rest;
    EXPECT_EQ(send(rest), u"נשלחו 10 הודעות; 0 נמענים לא קיבלו את ההודעה. 8 נמענים כבר קיבלו אותה בהפצה הקודמת."_s);
    ASSERT_FALSE(messages.boxes.isEmpty());
    EXPECT_EQ(
        messages.boxes[0],
        (Box{u"question"_s, u"שאלה"_s, u"ההפצה הקודמת של הודעה זו נעצרה אחרי 8 נמענים. להמשיך מהמקום שבו נעצרה?"_s}));
    QSet<QString> restAddresses = addressesOf(rest.messages());
    restAddresses.remove(options.emailToMain);
    EXPECT_EQ(restAddresses.size(), 37);
    EXPECT_TRUE(journal().isEmpty());
}

TEST_F(EmailCampaignTest, NoStartsTheStoppedCampaignOverAndTheStopFlagKeepsThePartlyFilledGroup)
{
    options.emailMethod = 2;
    options.emailGroupSize = u"20"_s;
    int rows = 0;
    StopToken stopping(state.StopRequested, [&] {
        if (++rows == 25)
            state.StopRequested = true;
    });
    {
        SmtpSink sink;
        options.smtpPort = QString::number(sink.port());
        SmtpTransport transport(smtpServerOf(options));
        RunContext run{options, state, services(), progress, stopping, {}};
        SendEmailCampaign(run, transport, journalFolder());
        EXPECT_EQ(sink.messages().size(), 1) << "the five of the partly filled group are not sent";
        EXPECT_EQ(progress.reports.last().text, u"הדיוור הסתיים"_s);
    }
    EXPECT_EQ(journal().size(), 20);
    state.StopRequested = false;
    messages.answers = {false};
    SmtpSink again;
    send(again);
    EXPECT_EQ(again.messages().size(), 3) << "No sends to everyone again";
    EXPECT_TRUE(journal().isEmpty());
}

TEST_F(EmailCampaignTest, AnotherMessageOrSelectionIsAnotherCampaignThatAsksNothing)
{
    StopToken stopAtOnce(state.StopRequested, [&] { state.StopRequested = true; });
    {
        SmtpSink sink;
        options.smtpPort = QString::number(sink.port());
        SmtpTransport transport(smtpServerOf(options));
        RunContext run{options, state, services(), progress, stopAtOnce, {}};
        SendEmailCampaign(run, transport, journalFolder());
    }
    state.StopRequested = false;
    const MailingOptions stopped = options;
    for (const auto& change : {std::function<void()>([&] { options.emailSubject += u"!"_s; }),
                               std::function<void()>([&] { options.toCard = u"M44"_s; })}) {
        options = stopped;
        change();
        SmtpSink sink;
        send(sink);
        EXPECT_TRUE(messages.boxes.isEmpty()) << messages.boxes.value(0).text.toStdString();
    }
}

TEST_F(EmailCampaignTest, ProgressCountsTheRecipientsAndClearsAtTheEnd)
{
    cards(u"M01"_s, u"M04"_s);
    SmtpSink sink;
    send(sink);
    QStringList texts;
    for (const auto& report : progress.reports) {
        if (texts.isEmpty() || texts.last() != report.text)
            texts << report.text;
    }
    EXPECT_EQ(texts,
              (QStringList{{},
                           u"פותח רשימת נמענים המתאימים לטווח"_s,
                           u"סורק וסופר נמענים"_s,
                           u"מכין את הודעת הדואר האלקטרוני"_s,
                           u"בונה את הודעה מספר 1"_s,
                           u"בונה את הודעה מספר 2"_s,
                           u"בונה את הודעה מספר 3"_s,
                           u"בונה את הודעה מספר 4"_s,
                           u"הדיוור הסתיים"_s}));
    EXPECT_DOUBLE_EQ(progress.reports[progress.reports.size() - 2].fraction, 1.0);
    EXPECT_DOUBLE_EQ(progress.reports.last().fraction, 0.0);
}

}  // namespace
}  // namespace pelmar::test
