#include "outputs/MimeWriter.h"
#include "support/FailureOf.h"
#include "support/Isolated.h"

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QLocale>
#include <QProcess>

#include <gtest/gtest.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

const QByteArray kId("<id@example.com>");
const QDateTime kDate(QDate(2026, 12, 7), QTime(2, 11, 20), Qt::UTC);

MailMessage messageFrom(const QString& name, const QString& subject)
{
    MailMessage message;
    message.from = {u"sender@example.com"_s, name};
    message.subject = subject;
    return message;
}

// The lines of written text without their CR LF; a bare CR or LF fails the test.
QList<QByteArray> linesOf(const QByteArray& text)
{
    EXPECT_EQ(text.count('\n'), text.count("\r\n")) << text.constData();
    EXPECT_EQ(text.count('\r'), text.count("\r\n")) << text.constData();
    EXPECT_TRUE(text.isEmpty() || text.endsWith("\r\n"));
    QList<QByteArray> lines = text.split('\n');
    lines.removeLast();
    for (QByteArray& line : lines)
        line.chop(1);
    return lines;
}

// The header fields, each unfolded (a line starting with a blank continues the one before).
QList<QByteArray> fieldsOf(const QByteArray& headers)
{
    QList<QByteArray> fields;
    for (const QByteArray& line : linesOf(headers)) {
        if (line.startsWith(' ') && !fields.isEmpty())
            fields.last() += line;
        else
            fields.append(line);
    }
    return fields;
}

QList<QByteArray> namesOf(const QByteArray& headers)
{
    QList<QByteArray> names;
    for (const QByteArray& field : fieldsOf(headers))
        names.append(field.left(field.indexOf(':')));
    return names;
}

QByteArray fieldValue(const QByteArray& headers, const QByteArray& name)
{
    for (const QByteArray& field : fieldsOf(headers)) {
        if (field.startsWith(name + ": "))
            return field.mid(name.size() + 2);
    }
    return "<absent>";
}

const QList<QByteArray> kHeaderNames{"From", "To", "Subject", "Date", "Message-ID", "Importance", "X-Priority"};

TEST(MimeHeadersTest, AnAsciiMessageIsWrittenExactlyAndNeverNamesABlindCopy)
{
    MailMessage message = messageFrom(u"Dana Levi"_s, u"Spring offer"_s);
    message.toList = {{u"a@example.com"_s, {}}, {u"b@example.org"_s, u"Levi, Dana"_s}};
    message.bccList = {{u"secret@example.net"_s, u"Secret"_s}};
    EXPECT_EQ(mimeHeaders(message, kDate, kId),
              QByteArray("From: Dana Levi <sender@example.com>\r\n"
                         "To: a@example.com, \"Levi, Dana\" <b@example.org>\r\n"
                         "Subject: Spring offer\r\n"
                         "Date: Mon, 07 Dec 2026 02:11:20 +0000\r\n"
                         "Message-ID: <id@example.com>\r\n"
                         "Importance: high\r\n"
                         "X-Priority: 1\r\n"));
    message.toList.clear();
    EXPECT_EQ(mimeHeaders(message, kDate, kId),
              QByteArray("From: Dana Levi <sender@example.com>\r\n"
                         "Subject: Spring offer\r\n"
                         "Date: Mon, 07 Dec 2026 02:11:20 +0000\r\n"
                         "Message-ID: <id@example.com>\r\n"
                         "Importance: high\r\n"
                         "X-Priority: 1\r\n"));
}

TEST(MimeHeadersTest, TheDateIsInEnglishWithItsOwnOffsetWhateverTheUsersLocale)
{
    const QLocale saved;
    QLocale::setDefault(QLocale(QLocale::Hebrew, QLocale::Israel));
    const struct {
        QDateTime date;
        QByteArray expected;
    } cases[] = {
        {kDate, "Mon, 07 Dec 2026 02:11:20 +0000"},
        {QDateTime(QDate(2027, 1, 3), QTime(23, 59, 59), Qt::OffsetFromUTC, 2 * 3600),
         "Sun, 03 Jan 2027 23:59:59 +0200"},
        {QDateTime(QDate(2024, 2, 29), QTime(0, 0), Qt::OffsetFromUTC, -(3 * 3600 + 30 * 60)),
         "Thu, 29 Feb 2024 00:00:00 -0330"},
        {QDateTime(QDate(2025, 8, 15), QTime(12, 5, 9), Qt::OffsetFromUTC, 5 * 3600 + 45 * 60),
         "Fri, 15 Aug 2025 12:05:09 +0545"},
    };
    for (const auto& c : cases)
        EXPECT_EQ(fieldValue(mimeHeaders(messageFrom({}, {}), c.date, kId), "Date"), c.expected);
    QLocale::setDefault(saved);
}

TEST(MimeHeadersTest, EachDisplayNameIsWrittenInTheFormItNeeds)
{
    const struct {
        QString name;
        QByteArray expected;
    } cases[] = {
        {u""_s, "a@example.com"},
        {u"   "_s, "a@example.com"},
        {u"Dana Levi"_s, "Dana Levi <a@example.com>"},
        {u"O'Brien & Sons"_s, "O'Brien & Sons <a@example.com>"},
        {u"Levi, Dana"_s, "\"Levi, Dana\" <a@example.com>"},
        {u"J. Smith"_s, "\"J. Smith\" <a@example.com>"},
        {u"Say \"hi\" \\o/"_s, "\"Say \\\"hi\\\" \\\\o/\" <a@example.com>"},
        {u"Eve <e@evil.com>"_s, "\"Eve <e@evil.com>\" <a@example.com>"},
        {u"Dana\r\nBcc: x@evil.com"_s, "\"Dana  Bcc: x@evil.com\" <a@example.com>"},
        {u"\r\n"_s, "a@example.com"},
        {u"דנה"_s, "=?UTF-8?B?15PXoNeU?= <a@example.com>"},
        {u"Tab\there"_s, "=?UTF-8?B?VGFiCWhlcmU=?= <a@example.com>"},
        {u"=?UTF-8?B?QQ==?="_s, "=?UTF-8?B?PT9VVEYtOD9CP1FRPT0/PQ==?= <a@example.com>"},
    };
    for (const auto& c : cases)
        EXPECT_EQ(mailboxHeaderValue({u"a@example.com"_s, c.name}), c.expected) << c.name.toStdString();
}

TEST(MimeHeadersTest, AnAddressThatIsNoMailboxIsRefusedRatherThanWritten)
{
    const QString hostile[] = {u"x@example.com, victim@example.org"_s, u"a@example.com\r\nBcc: c@example.org"_s,
                               u"a@example.com>"_s, u""_s};
    for (const QString& address : hostile) {
        const QString expected = u"הכתובת \"%1\" אינה כתובת דואר אלקטרוני תקינה."_s.arg(address);
        EXPECT_EQ(failureOf([&] { mailboxHeaderValue({address, u"Dana"_s}); }), expected);
        MailMessage message = messageFrom({}, {});
        message.toList = {{u"ok@example.com"_s, {}}, {address, {}}};
        EXPECT_EQ(failureOf([&] { mimeHeaders(message, kDate, kId); }), expected);
    }
}

TEST(MimeHeadersTest, HostileNamesAndSubjectsAddNoHeaderLine)
{
    MailMessage message = messageFrom(u"Eve\r\nTo: x@evil.com"_s, u"Hi\r\nBcc: victim@evil.com\r\n\r\nbody"_s);
    message.toList = {{u"a@example.com"_s, u"\"><\r\nCc: y@evil.com"_s}, {u"b@example.com"_s, u"\nX: 1"_s}};
    const QByteArray headers = mimeHeaders(message, kDate, "<a\r\nBcc: z@evil.com>");
    EXPECT_EQ(namesOf(headers), kHeaderNames);
    EXPECT_EQ(fieldValue(headers, "Subject"), "Hi  Bcc: victim@evil.com    body");
    EXPECT_EQ(fieldValue(headers, "To"), "\"\\\"><  Cc: y@evil.com\" <a@example.com>, \" X: 1\" <b@example.com>");
}

TEST(MimeEncodedTextTest, PlainAsciiStaysAndAnythingElseBecomesEncodedWords)
{
    const struct {
        QString text;
        QByteArray expected;
    } cases[] = {
        {u"Spring offer"_s, "Spring offer"},
        {u""_s, ""},
        {u"a\r\nb\rc\nd"_s, "a  b c d"},
        {u"(50% off!) <now>, \"really\""_s, "(50% off!) <now>, \"really\""},
        {u"מבצע"_s, "=?UTF-8?B?157Xkdem16I=?="},
        {u"\x01"_s, "=?UTF-8?B?AQ==?="},
        {u"100% =?off"_s, "=?UTF-8?B?MTAwJSA9P29mZg==?="},
    };
    for (const auto& c : cases)
        EXPECT_EQ(encodedText(c.text), c.expected) << c.text.toStdString();
}

// The text of encoded words, each checked to hold whole UTF-8 characters on its own.
QByteArray decodedWords(const QByteArray& words)
{
    QByteArray text;
    for (const QByteArray& word : words.split(' ')) {
        EXPECT_LE(word.size(), 75) << word.constData();
        EXPECT_TRUE(word.startsWith("=?UTF-8?B?") && word.endsWith("?=")) << word.constData();
        const QByteArray bytes = QByteArray::fromBase64(word.mid(10, word.size() - 12));
        EXPECT_EQ(QString::fromUtf8(bytes).toUtf8(), bytes) << "a character split across words";
        text += bytes;
    }
    return text;
}

TEST(MimeEncodedTextTest, ALongTextIsCutIntoShortWordsOfWholeCharacters)
{
    const QString texts[] = {
        u"מבצע חורף גדול לכל לקוחות החברה: הנחה של עשרים אחוז על כל המוצרים, עד סוף החודש בלבד!"_s,
        u"x"_s + u"😀"_s.repeated(60),
        u"ab"_s + u"€"_s.repeated(70),
    };
    for (const QString& text : texts) {
        const QByteArray words = encodedText(text);
        EXPECT_GT(words.count(' '), 1);
        EXPECT_EQ(decodedWords(words), text.toUtf8());
        const QByteArray headers = mimeHeaders(messageFrom(text, text), kDate, kId);
        for (const QByteArray& line : linesOf(headers))
            EXPECT_LE(line.size(), 78) << line.constData();
        EXPECT_EQ(decodedWords(fieldValue(headers, "Subject")), text.toUtf8());
    }
}

TEST(MimeHeadersTest, LongValuesFoldAtBlanksIntoLinesOf78)
{
    MailMessage message = messageFrom(u"Dana"_s, u"word "_s.repeated(40).trimmed());
    for (int i = 0; i < 12; ++i)
        message.toList.append({u"person%1@example.com"_s.arg(i), u"Person Number %1"_s.arg(i)});
    const QByteArray headers = mimeHeaders(message, kDate, kId);
    for (const QByteArray& line : linesOf(headers))
        EXPECT_LE(line.size(), 78) << line.constData();
    EXPECT_EQ(namesOf(headers), kHeaderNames);
    EXPECT_EQ(fieldValue(headers, "Subject"), message.subject.toLatin1());
    EXPECT_TRUE(fieldValue(headers, "To").startsWith("Person Number 0 <person0@example.com>, Person Number 1"));
    EXPECT_TRUE(fieldValue(headers, "To").endsWith(", Person Number 11 <person11@example.com>"));

    // A word no blank breaks stays whole; one too long for any line at all is encoded.
    const QString word = u"w"_s.repeated(100);
    EXPECT_TRUE(mimeHeaders(messageFrom({}, word), kDate, kId).contains("\r\nSubject: " + word.toLatin1() + "\r\n"));
    const QString huge = u"w"_s.repeated(1000);
    const QByteArray encoded = mimeHeaders(messageFrom({}, huge), kDate, kId);
    for (const QByteArray& line : linesOf(encoded))
        EXPECT_LE(line.size(), 78);
    EXPECT_EQ(decodedWords(fieldValue(encoded, "Subject")), huge.toLatin1());
}

TEST(MimeIsMailboxTest, OnlyPlainDotAtomAddressesWithinTheSizeLimitsPass)
{
    const QString local64 = u"l"_s.repeated(64);
    const QString domain189 = u"a"_s.repeated(63) + u'.' + u"b"_s.repeated(63) + u'.' + u"c"_s.repeated(61);
    const struct {
        QString address;
        bool accepted;
    } cases[] = {
        {u"a@b.co"_s, true},
        {u"first.last+tag@mail.example.co.il"_s, true},
        {u"x@localhost"_s, true},
        {u"!#$%&'*+-/=?^_`{|}~@example.com"_s, true},
        {u"a@xn--4dbrk0ce.com"_s, true},
        {local64 + u'@' + domain189, true},  // 254 characters
        {local64 + u'@' + domain189 + u'c', false},  // 255
        {u"m"_s.repeated(65) + u"@example.com"_s, false},
        {u"a@"_s + u"d"_s.repeated(63) + u".com"_s, true},
        {u"a@"_s + u"d"_s.repeated(64) + u".com"_s, false},
        {u""_s, false},
        {u"@"_s, false},
        {u"a"_s, false},
        {u"a@"_s, false},
        {u"@b.co"_s, false},
        {u".a@b.co"_s, false},
        {u"a.@b.co"_s, false},
        {u"a..b@c.co"_s, false},
        {u"a@.b.co"_s, false},
        {u"a@b.co."_s, false},
        {u"a@b..co"_s, false},
        {u"a@b@c.co"_s, false},
        {u"a b@c.co"_s, false},
        {u"a@b c.co"_s, false},
        {u"\"a\"@b.co"_s, false},
        {u"<a@b.co>"_s, false},
        {u"a@b.co\r\n"_s, false},
        {u"a@b.co\r\nBcc: c@d.co"_s, false},
        {u"a@b.co, c@d.co"_s, false},
        {u"a\u0000@b.co"_s, false},
        {u"דנה@example.com"_s, false},
        {u"a@דוגמה.com"_s, false},
        {u"a@-b.co"_s, false},
        {u"a@b-.co"_s, false},
        {u"a@b_c.co"_s, false},
        {u"a@[192.0.2.1]"_s, false},
    };
    for (const auto& c : cases)
        EXPECT_EQ(isMailbox(c.address), c.accepted) << c.address.toStdString();
}

TEST(MimeMessageIdTest, IdsAreUniqueAndCarryTheSendersDomainOrLocalhost)
{
    const struct {
        QString sender;
        QByteArray domain;
    } cases[] = {
        {u"dana@example.com"_s, "example.com"},
        {u"nobody"_s, "localhost"},
        {u""_s, "localhost"},
        {u"a@"_s, "localhost"},
        {u"a@example.com>\r\nBcc: x@evil.com"_s, "localhost"},
    };
    for (const auto& c : cases) {
        const QByteArray id = newMessageId(c.sender);
        ASSERT_TRUE(id.startsWith('<') && id.endsWith("@" + c.domain + ">")) << id.constData();
        const QString unique = QString::fromLatin1(id.mid(1, id.size() - c.domain.size() - 3));
        EXPECT_TRUE(isMailbox(unique + u"@x.co"_s)) << "not a dot-atom: " << id.constData();
        EXPECT_NE(newMessageId(c.sender), id);
    }
}

struct BodyCase {
    int bytes;
    QList<qsizetype> lineLengths;
};

TEST(MimeContentTest, TheBodyIsBase64InLinesOf76AndAnEmptyBodyStillHasItsPart)
{
    const QByteArray plainHeaders("MIME-Version: 1.0\r\n"
                                  "Content-Type: text/plain; charset=UTF-8\r\n"
                                  "Content-Transfer-Encoding: base64\r\n\r\n");
    MailMessage message;
    EXPECT_EQ(mimeContent(message), plainHeaders);
    message.body = u"Hi\n"_s;
    EXPECT_EQ(mimeContent(message), plainHeaders + "SGkNCg==\r\n");
    message.body = u"a\nb\r\nc\rd"_s;
    EXPECT_EQ(mimeContent(message), plainHeaders + "YQ0KYg0KYw0KZA==\r\n");
    message.htmlBody = u"<p>שלום</p>\n"_s;
    EXPECT_EQ(mimeContent(message),
              QByteArray("MIME-Version: 1.0\r\n"
                         "Content-Type: text/html; charset=UTF-8\r\n"
                         "Content-Transfer-Encoding: base64\r\n\r\n"
                         "PHA+16nXnNeV1508L3A+DQo=\r\n"));

    const BodyCase cases[] = {{57, {76}}, {58, {76, 4}}, {114, {76, 76}}, {115, {76, 76, 4}}};
    for (const BodyCase& c : cases) {
        message = {};
        message.body = u"a"_s.repeated(c.bytes);
        const QList<QByteArray> lines = linesOf(mimeContent(message));
        QList<qsizetype> lengths;
        for (const QByteArray& line : lines.mid(lines.indexOf(QByteArray()) + 1))
            lengths.append(line.size());
        EXPECT_EQ(lengths, c.lineLengths) << c.bytes;
    }
}

class MimeAttachmentTest : public Isolated {
protected:
    // The Content-Disposition of the only attachment, unfolded.
    QByteArray dispositionOf(const QString& displayName, const QString& fileName)
    {
        MailMessage message;
        message.attachments = {{fileWith(fileName, "x"), displayName}};
        for (const QByteArray& field : fieldsOf(mimeContent(message))) {
            if (field.startsWith("Content-Disposition: "))
                return field.mid(21);
        }
        return "<absent>";
    }
};

TEST_F(MimeAttachmentTest, TheShownNameTakesTheFilesSuffixWhenItHasNone)
{
    const struct {
        QString displayName;
        QString fileName;
        QByteArray expected;
    } cases[] = {
        {u"פרטי המבצע"_s, u"nover.doc"_s,
         "attachment; filename*=UTF-8''%D7%A4%D7%A8%D7%98%D7%99%20%D7%94%D7%9E%D7%91%D7%A6%D7%A2.doc"},
        {u""_s, u"report.txt"_s, "attachment; filename=\"report.txt\""},
        {u"\r\n"_s, u"report.txt"_s, "attachment; filename=\"report.txt\""},
        {u"Prices.xlsx"_s, u"p.pdf"_s, "attachment; filename=\"Prices.xlsx\""},
        {u"Offer v1.2 final"_s, u"o.pdf"_s, "attachment; filename=\"Offer v1.2 final.pdf\""},
        {u"notes"_s, u"README"_s, "attachment; filename=\"notes\""},
        {u"Offer."_s, u"o.pdf"_s, "attachment; filename=\"Offer..pdf\""},
        {u"Say \"hi\" \\o/"_s, u"a.txt"_s, "attachment; filename=\"Say \\\"hi\\\" \\\\o/.txt\""},
        {u"a\r\nb"_s, u"a.txt"_s, "attachment; filename=\"a  b.txt\""},
        {u"100%*'=?"_s, u"a.txt"_s, "attachment; filename*=UTF-8''100%25%2A%27%3D%3F.txt"},
    };
    for (const auto& c : cases)
        EXPECT_EQ(dispositionOf(c.displayName, c.fileName), c.expected) << c.displayName.toStdString();
}

TEST_F(MimeAttachmentTest, PartsAreDelimitedByABoundaryNoPartHoldsAndEmptyPathsAreSkipped)
{
    MailMessage message;
    message.body = u"x"_s.repeated(200);
    message.attachments = {{fileWith(u"a.pdf"_s, QByteArray(300, '\xff')), {}}, {{}, u"nothing"_s}};
    const QByteArray content = mimeContent(message);
    const QByteArray type = fieldValue(content, "Content-Type");
    ASSERT_TRUE(type.startsWith("multipart/mixed; boundary=\"=_")) << type.constData();
    const QByteArray boundary = type.mid(type.indexOf('"') + 1).chopped(1);
    EXPECT_EQ(content.count(boundary), 4) << "the header, the text, one file and the end";
    EXPECT_TRUE(content.endsWith("\r\n--" + boundary + "--\r\n"));
    for (const QByteArray& line : linesOf(content))
        EXPECT_LE(line.size(), 78) << line.constData();
    EXPECT_TRUE(content.contains("\r\nContent-Type: application/pdf; name=\"a.pdf\"\r\n"));
    EXPECT_NE(mimeContent(message), content) << "each content has a boundary of its own";

    // Only skipped attachments: the content of a message without any.
    MailMessage without;
    without.body = message.body;
    message.attachments = {{{}, u"nothing"_s}};
    EXPECT_EQ(mimeContent(message), mimeContent(without));
}

TEST_F(MimeAttachmentTest, AnUnreadableAttachmentFailsNamingTheFile)
{
    MailMessage message;
    const QString missing = path(u"missing.pdf"_s);
    message.attachments = {{fileWith(u"fine.txt"_s, "ok"), {}}, {missing, u"Offer"_s}};
    EXPECT_EQ(failureOf([&] { mimeContent(message); }),
              u"לא ניתן לקרוא את הקובץ המצורף \"%1\": No such file or directory"_s.arg(missing));
    message.attachments = {{folder(), {}}};
    EXPECT_TRUE(
        failureOf([&] { mimeContent(message); }).startsWith(u"לא ניתן לקרוא את הקובץ המצורף \"%1\": "_s.arg(folder())));
}

// Parses a written message with Python's standard e-mail package, a reader independent of this
// writer, and returns what it decoded: header names, subject, addresses, body, attachments and
// every defect it noticed.
QJsonObject parsedByPython(const QByteArray& message, const QString& folder)
{
    static const char* const script = R"(
import base64, json, sys
from email import policy
from email.parser import BytesParser
with open(sys.argv[1], 'rb') as f:
    msg = BytesParser(policy=policy.default).parse(f)
# An attachment's "name" holds encoded words in a quoted string on purpose, for the older readers
# that look only there; the standard form is in "filename".
excused = ('encoded word inside quoted string', 'missing trailing whitespace after encoded-word')
defects = [str(d) for part in msg.walk() for d in part.defects]
for part in msg.walk():
    for name, value in part.items():
        defects += [name + ': ' + str(d) for d in getattr(value, 'defects', ())
                    if not (name == 'Content-Type' and str(d) in excused)]
people = lambda field: [[a.display_name, a.addr_spec] for a in msg[field].addresses] if msg[field] else []
print(json.dumps({
    'headers': list(msg.keys()),
    'subject': str(msg['subject']),
    'from': people('from'),
    'to': people('to'),
    'bodyType': msg.get_body(('html', 'plain')).get_content_type(),
    'body': base64.b64encode(msg.get_body(('html', 'plain')).get_payload(decode=True)).decode(),
    'attachments': [[p.get_filename(), p.get_content_type(), str(p['content-type'].params.get('name')),
                     base64.b64encode(p.get_payload(decode=True)).decode()] for p in msg.iter_attachments()],
    'defects': defects,
}))
)";
    const QString file = folder + u"/message.eml"_s;
    QFile out(file);
    if (!out.open(QIODevice::WriteOnly) || out.write(message) != message.size())
        return {};
    out.close();
    QProcess python;
    python.start(u"/usr/bin/python3"_s, {u"-c"_s, QString::fromUtf8(script), file});
    if (!python.waitForFinished(60000) || python.exitCode() != 0) {
        ADD_FAILURE() << python.readAllStandardError().constData();
        return {};
    }
    return QJsonDocument::fromJson(python.readAllStandardOutput()).object();
}

// An array as JSON text, readable when a comparison fails.
QByteArray jsonOf(const QJsonValue& array)
{
    return QJsonDocument(array.toArray()).toJson(QJsonDocument::Compact);
}

QJsonArray pair(const QString& first, const QString& second)
{
    return {first, second};
}

QString base64Of(const QByteArray& bytes)
{
    return QString::fromLatin1(bytes.toBase64());
}

class MimeDecodedTest : public MimeAttachmentTest {
protected:
    void SetUp() override
    {
        MimeAttachmentTest::SetUp();
        if (!QFile::exists(u"/usr/bin/python3"_s))
            GTEST_SKIP() << "Python is not installed";
    }
};

TEST_F(MimeDecodedTest, AnOutsideReaderDecodesEveryValueOfAMessageWithAttachments)
{
    QByteArray binary;
    for (int i = 0; i < 256; ++i)
        binary += static_cast<char>(i);
    const QString longName = u"קובץ מצורף עם שם ארוך מאוד "_s.repeated(12).trimmed();
    MailMessage message;
    // A name of one encoded word: Python 3.11 puts a blank between adjacent encoded words of an
    // address (python/cpython#128110), so longer names are checked word by word above.
    message.from = {u"sender@example.com"_s, u"חברת \"הדוגמה\", <מרכז>"_s};
    message.toList = {{u"a@example.com"_s, u"Eve\r\nBcc: victim@evil.com"_s},
                      {u"b@example.org"_s, u"Levi, \"Dana\" <x@evil.com>"_s},
                      {u"c@example.net"_s, {}}};
    message.bccList = {{u"hidden@example.com"_s, u"Hidden"_s}};
    message.subject = u"מבצע חורף: הנחה של 20% לכל הלקוחות\r\nBcc: victim@evil.com — עד סוף החודש בלבד, אל תחמיצו"_s;
    message.attachments = {{fileWith(u"nover.doc"_s, binary), u"פרטי המבצע"_s},
                           {fileWith(u"long.pdf"_s, "%PDF-1.4\n"), longName},
                           {fileWith(u"empty.txt"_s, {}), u"Price list, \"2026\""_s}};
    const QByteArray written = mimeHeaders(message, kDate, newMessageId(message.from.address)) + mimeContent(message);
    const QJsonObject parsed = parsedByPython(written, folder());
    ASSERT_FALSE(parsed.isEmpty());

    EXPECT_EQ(jsonOf(parsed[u"defects"_s]), "[]");
    EXPECT_EQ(jsonOf(parsed[u"headers"_s]),
              jsonOf(QJsonArray({u"From"_s, u"To"_s, u"Subject"_s, u"Date"_s, u"Message-ID"_s, u"Importance"_s,
                                 u"X-Priority"_s, u"MIME-Version"_s, u"Content-Type"_s})));
    EXPECT_EQ(parsed[u"subject"_s].toString(),
              u"מבצע חורף: הנחה של 20% לכל הלקוחות  Bcc: victim@evil.com — עד סוף החודש בלבד, אל תחמיצו"_s);
    EXPECT_EQ(jsonOf(parsed[u"from"_s]),
              jsonOf(QJsonArray({pair(u"חברת \"הדוגמה\", <מרכז>"_s, u"sender@example.com"_s)})));
    EXPECT_EQ(jsonOf(parsed[u"to"_s]),
              jsonOf(QJsonArray({pair(u"Eve  Bcc: victim@evil.com"_s, u"a@example.com"_s),
                                 pair(u"Levi, \"Dana\" <x@evil.com>"_s, u"b@example.org"_s),
                                 pair(u""_s, u"c@example.net"_s)})));
    EXPECT_EQ(parsed[u"bodyType"_s].toString(), u"text/plain"_s);
    EXPECT_EQ(parsed[u"body"_s].toString(), u""_s);
    const QJsonArray attachments{
        QJsonArray({u"פרטי המבצע.doc"_s, u"application/msword"_s, u"פרטי המבצע.doc"_s, base64Of(binary)}),
        QJsonArray({longName + u".pdf"_s, u"application/pdf"_s, longName + u".pdf"_s, base64Of("%PDF-1.4\n")}),
        QJsonArray({u"Price list, \"2026\".txt"_s, u"text/plain"_s, u"Price list, \"2026\".txt"_s, u""_s}),
    };
    EXPECT_EQ(jsonOf(parsed[u"attachments"_s]), jsonOf(attachments));
    EXPECT_FALSE(written.contains("hidden@example.com"));
}

TEST_F(MimeDecodedTest, AnOutsideReaderDecodesASinglePartHtmlMessage)
{
    MailMessage message = messageFrom(u"דנה לוי"_s, u"שלום"_s);
    message.toList = {{u"a@example.com"_s, u"רונית"_s}};
    message.body = u"ignored"_s;
    message.htmlBody = u"<p>שלום רב,</p>\n<p>"_s + u"טקסט ארוך "_s.repeated(40) + u"</p>\n"_s;
    const QJsonObject parsed = parsedByPython(mimeHeaders(message, kDate, kId) + mimeContent(message), folder());
    ASSERT_FALSE(parsed.isEmpty());
    EXPECT_EQ(jsonOf(parsed[u"defects"_s]), "[]");
    EXPECT_EQ(parsed[u"subject"_s].toString(), u"שלום"_s);
    EXPECT_EQ(jsonOf(parsed[u"from"_s]), jsonOf(QJsonArray({pair(u"דנה לוי"_s, u"sender@example.com"_s)})));
    EXPECT_EQ(jsonOf(parsed[u"to"_s]), jsonOf(QJsonArray({pair(u"רונית"_s, u"a@example.com"_s)})));
    EXPECT_EQ(parsed[u"bodyType"_s].toString(), u"text/html"_s);
    EXPECT_EQ(parsed[u"body"_s].toString(), base64Of(message.htmlBody.replace(u"\n"_s, u"\r\n"_s).toUtf8()));
    EXPECT_EQ(jsonOf(parsed[u"attachments"_s]), "[]");
}

}  // namespace
}  // namespace pelmar::test
