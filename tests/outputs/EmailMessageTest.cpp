#include "outputs/MailFixture.h"
#include "outputs/MimeWriter.h"

#include <QStringEncoder>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

// The parts of a message: the message itself when it is not multipart, else each part between
// the boundaries, headers included.
QList<QByteArray> partsOf(const QByteArray& data)
{
    static const QRegularExpression boundaryPattern(u"boundary=\"([^\"]+)\""_s);
    const auto match = boundaryPattern.match(QString::fromLatin1(data));
    if (!match.hasMatch())
        return {data};
    const QByteArray delimiter = "--" + match.captured(1).toLatin1();
    QList<QByteArray> result;
    qsizetype at = data.indexOf(delimiter + "\r\n");
    while (at >= 0) {
        const qsizetype start = at + delimiter.size() + 2;
        const qsizetype next = data.indexOf("\r\n" + delimiter, start);
        result << data.mid(start, next - start);
        at = data.indexOf(delimiter + "\r\n", next + 2);
    }
    return result;
}

// The decoded content of a part (base64 after the blank line).
QByteArray contentOf(const QByteArray& part)
{
    return QByteArray::fromBase64(part.mid(part.indexOf("\r\n\r\n") + 4));
}

class EmailMessageTest : public MailTest {
protected:
    void SetUp() override
    {
        MailTest::SetUp();
        cards(u"M01"_s, u"M01"_s);
    }

    ReceivedMail sendOne(const SmtpSink& sink)
    {
        send(sink);
        EXPECT_EQ(sink.messages().size(), 1) << (messages.boxes.isEmpty() ? "" : messages.boxes[0].text.toStdString());
        return sink.messages().value(0);
    }
};

TEST_F(EmailMessageTest, HebrewSubjectAndSenderAndThePlainBodyArriveAsWritten)
{
    options.emailSubject = u"מבצעי השבוע: 50% הנחה על כל המוצרים בחנות, רק עד סוף החודש!"_s;
    options.emailContent = u"שלום רב.\nמצורף מידע על המבצעים החדשים"_s;
    SmtpSink sink;
    const ReceivedMail mail = sendOne(sink);
    EXPECT_EQ(decodedHeader(mail.header("Subject")), options.emailSubject);
    EXPECT_EQ(decodedHeader(mail.header("From")), u"טרבל - מחלקת שיווק <shivuk@pelmar.test>"_s);
    EXPECT_EQ(mail.header("Importance"), "high");
    EXPECT_EQ(mail.header("X-Priority"), "1");
    EXPECT_FALSE(mail.header("Date").isEmpty());
    EXPECT_TRUE(mail.header("Message-ID").endsWith("@pelmar.test>")) << mail.header("Message-ID").toStdString();
    const QList<QByteArray> parts = partsOf(mail.data);
    ASSERT_EQ(parts.size(), 1);
    EXPECT_TRUE(mail.header("Content-Type").startsWith("text/plain")) << mail.header("Content-Type").toStdString();
    EXPECT_EQ(QString::fromUtf8(contentOf(parts[0])), u"שלום רב.\r\nמצורף מידע על המבצעים החדשים"_s)
        << "text goes with CR LF line ends";
}

TEST_F(EmailMessageTest, TheHtmlBodyFileIsReadAsUtf8OrWindows1255AndSentAsHtml)
{
    const QString html = u"<html><body dir=\"rtl\"><p>שלום רב, €5 הנחה</p></body></html>"_s;
    QStringEncoder hebrew("windows-1255");
    const QByteArray legacy = hebrew.encode(html);
    for (const QByteArray& bytes : {html.toUtf8(), QByteArray("\xEF\xBB\xBF") + html.toUtf8(), legacy}) {
        options.emailHtmlBody = fileWith(u"body.html"_s, bytes);
        SmtpSink sink;
        const ReceivedMail mail = sendOne(sink);
        EXPECT_TRUE(mail.header("Content-Type").startsWith("text/html")) << mail.header("Content-Type").toStdString();
        EXPECT_EQ(QString::fromUtf8(contentOf(partsOf(mail.data).value(0))), html);
        EXPECT_FALSE(mail.data.contains("שלום רב. מצורף")) << "the plain text is not sent with an HTML body";
    }
}

TEST_F(EmailMessageTest, AnHtmlBodyThatCannotBeReadIsReportedAndNothingIsSent)
{
    options.emailHtmlBody = u"/proc/self/mem"_s;  // a file whose first bytes cannot be read
    SmtpSink sink;
    send(sink);
    EXPECT_TRUE(sink.messages().isEmpty());
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_EQ(messages.boxes[0].kind, u"plain"_s);
    EXPECT_TRUE(messages.boxes[0].text.startsWith(u"Error "_s)) << messages.boxes[0].text.toStdString();
    EXPECT_TRUE(messages.boxes[0].text.contains(u" reading file\r\n"_s)) << messages.boxes[0].text.toStdString();
}

TEST_F(EmailMessageTest, TheAttachmentGoesWithItsHebrewNameAndItsBytes)
{
    static const char raw[] = "PK\x03\x04 binary \x00\xFF bytes";
    const QByteArray bytes(raw, sizeof raw - 1);
    options.emailAttachFile = fileWith(u"nover.doc"_s, bytes);
    options.emailAttachFileDesc = u"פרטי המבצע"_s;
    SmtpSink sink;
    const ReceivedMail mail = sendOne(sink);
    const QList<QByteArray> parts = partsOf(mail.data);
    ASSERT_EQ(parts.size(), 2);
    EXPECT_EQ(QString::fromUtf8(contentOf(parts[0])), options.emailContent);
    EXPECT_TRUE(parts[1].contains("filename*=UTF-8''%D7%A4%D7%A8%D7%98%D7%99%20%D7%94%D7%9E%D7%91%D7%A6%D7%A2.doc"))
        << parts[1].left(400).toStdString();
    EXPECT_EQ(contentOf(parts[1]), bytes);
}

TEST_F(EmailMessageTest, StartTlsAndALoginReachAServerThatAsksForThem)
{
    SmtpSink::Options secure;
    secure.startTls = true;
    secure.user = u"shivuk"_s;
    secure.password = u"p@ss: w;rd"_s;
    SmtpSink sink(secure);
    qputenv("PELMAR_SMTP_CA_FILE", sink.certificateFile().toLocal8Bit());
    options.smtpSecurity = 1;
    options.smtpUser = u"shivuk"_s;
    options.smtpPassword = u"p@ss: w;rd"_s;
    sendOne(sink);

    options.smtpPassword = u"wrong"_s;
    send(sink);
    EXPECT_EQ(sink.messages().size(), 1);
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_EQ(messages.boxes[0].title, u"תקלה"_s);

    qunsetenv("PELMAR_SMTP_CA_FILE");
    messages.boxes.clear();
    options.smtpPassword = u"p@ss: w;rd"_s;
    send(sink);
    EXPECT_EQ(sink.messages().size(), 1) << "a certificate nobody vouches for is refused";
    EXPECT_EQ(messages.boxes.value(0).title, u"תקלה"_s);
}

TEST_F(EmailMessageTest, TlsFromTheStartReachesAServerThatSpeaksOnlyTls)
{
    SmtpSink::Options tls;
    tls.implicitTls = true;
    SmtpSink sink(tls);
    qputenv("PELMAR_SMTP_CA_FILE", sink.certificateFile().toLocal8Bit());
    options.smtpSecurity = 2;
    sendOne(sink);
    qunsetenv("PELMAR_SMTP_CA_FILE");
}

TEST_F(EmailMessageTest, StartTlsRequiredRefusesAServerWithoutIt)
{
    SmtpSink plain;
    options.smtpSecurity = 1;
    send(plain);
    EXPECT_TRUE(plain.messages().isEmpty());
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_EQ(messages.boxes[0].title, u"תקלה"_s);
    options.smtpSecurity = 0;
    sendOne(plain);
}

TEST_F(EmailMessageTest, AJournalThatCannotBeKeptStopsTheRunBeforeAnythingIsSent)
{
    writeFile(journalFolder(), "a file where the folder should be");
    SmtpSink sink;
    send(sink);
    EXPECT_TRUE(sink.messages().isEmpty());
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_EQ(messages.boxes[0].title, u"תקלה"_s);
    EXPECT_TRUE(messages.boxes[0].text.contains(journalFolder())) << messages.boxes[0].text.toStdString();
}

TEST(SmtpTransportTest, AConnectionTheServerClosedIsOpenedAgainForTheNextMessage)
{
    const QByteArray headers = "From: a@b.test\r\nTo: c@d.test\r\nSubject: x\r\n";
    const QByteArray content = "MIME-Version: 1.0\r\n\r\nbody\r\n";
    auto first = std::make_unique<SmtpSink>();
    const int port = first->port();
    SmtpTransport transport({u"127.0.0.1"_s, port, SmtpServer::Security::StartTlsWhenOffered, {}, {}, {}});
    EXPECT_EQ(transport.send(u"a@b.test"_s, {u"c@d.test"_s}, headers, content), QString());
    EXPECT_EQ(transport.send(u"a@b.test"_s, {u"e@d.test"_s}, headers, content), QString());
    EXPECT_EQ(first->connections(), 1);
    first.reset();
    SmtpSink::Options samePort;
    samePort.port = port;
    SmtpSink second(samePort);
    EXPECT_EQ(transport.send(u"a@b.test"_s, {u"c@d.test"_s}, headers, content), QString());
    ASSERT_EQ(second.messages().size(), 1);
    EXPECT_TRUE(second.messages()[0].data.startsWith(headers + content.trimmed()));
}

}  // namespace
}  // namespace pelmar::test
