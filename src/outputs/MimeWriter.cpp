#include "outputs/MimeWriter.h"

#include "common/Failure.h"

#include <QFile>
#include <QFileInfo>
#include <QMimeDatabase>
#include <QStringView>
#include <QUuid>

#include <algorithm>
#include <array>
#include <cstdlib>

using namespace Qt::StringLiterals;

namespace pelmar {
namespace {

// The line length RFC 5322 asks for, line break not counted.
constexpr qsizetype kLineLength = 78;
// RFC 2045's longest base64 line.
constexpr qsizetype kBase64LineLength = 76;
// The UTF-8 bytes of one encoded word: 56 base64 characters, so "=?UTF-8?B?" + 56 + "?=" is 68
// characters and "Subject: " followed by one word still fits a line of 78.
constexpr qsizetype kEncodedWordBytes = 42;
// A value with a run of characters longer than this, which no folding can break, is encoded
// instead, so that no line passes RFC 5322's hard limit of 998 characters.
constexpr qsizetype kLongestUnbrokenRun = 900;
// A parameter value percent-encoded longer than this is cut into RFC 2231 continuations, each of
// at most kContinuationLength characters.
constexpr qsizetype kLongestParameter = kLongestUnbrokenRun;
constexpr qsizetype kContinuationLength = 60;
// The size limits of RFC 5321 (4.5.3.1) and of DNS.
constexpr qsizetype kLongestMailbox = 254;
constexpr qsizetype kLongestLocalPart = 64;
constexpr qsizetype kLongestLabel = 63;

const QByteArray kCrLf("\r\n");

// A line break in a value would start a header of its own; it is written as a blank.
QString withoutLineBreaks(QString text)
{
    text.replace(u'\r', u' ').replace(u'\n', u' ');
    return text;
}

QByteArray withoutLineBreaks(QByteArray bytes)
{
    bytes.replace('\r', ' ').replace('\n', ' ');
    return bytes;
}

bool isAlphaNumeric(QChar c)
{
    const char16_t u = c.unicode();
    return (u >= u'a' && u <= u'z') || (u >= u'A' && u <= u'Z') || (u >= u'0' && u <= u'9');
}

// RFC 5322 atext: the characters of an atom.
bool isAtext(QChar c)
{
    return isAlphaNumeric(c) || QStringView(u"!#$%&'*+-/=?^_`{|}~").contains(c);
}

// RFC 2231 attribute-char: what a percent-encoded parameter value may hold as it stands.
bool isAttributeChar(char c)
{
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9')
        || QByteArrayView("!#$&+-.^_`{|}~").contains(c);
}

qsizetype longestUnbrokenRun(QByteArrayView bytes)
{
    qsizetype longest = 0;
    qsizetype run = 0;
    for (const char c : bytes) {
        run = c == ' ' ? 0 : run + 1;
        longest = std::max(longest, run);
    }
    return longest;
}

// True for text that may be written as it stands: printable ASCII, and nothing that a receiver
// would decode as an encoded word ("=?").
bool isPlainAscii(QStringView text)
{
    const bool printable
        = std::all_of(text.begin(), text.end(), [](QChar c) { return c.unicode() >= 0x20 && c.unicode() < 0x7f; });
    return printable && !text.contains(u"=?"_s);
}

// Text (plain ASCII) as a quoted string, with a backslash before '"' and '\'.
QByteArray quoted(QStringView text)
{
    QByteArray out = "\"";
    for (const QChar c : text) {
        if (c == u'"' || c == u'\\')
            out += '\\';
        out += static_cast<char>(c.unicode());
    }
    return out + '"';
}

// RFC 2047 B-encoded words separated by blanks; a word never ends inside a UTF-8 sequence, so
// each decodes to whole characters on its own.
QByteArray encodedWords(const QString& text)
{
    const QByteArray utf8 = text.toUtf8();
    QByteArray out;
    for (qsizetype start = 0; start < utf8.size();) {
        qsizetype end = std::min(start + kEncodedWordBytes, utf8.size());
        while (end < utf8.size() && (static_cast<unsigned char>(utf8[end]) & 0xC0) == 0x80)
            --end;
        if (!out.isEmpty())
            out += ' ';
        out += "=?UTF-8?B?" + utf8.mid(start, end - start).toBase64() + "?=";
        start = end;
    }
    return out;
}

// A display name as a phrase: atoms when it is only atext and blanks, else a quoted string when
// it is plain ASCII, else encoded words. The name has no line breaks.
QByteArray phrase(const QString& name)
{
    if (!isPlainAscii(name))
        return encodedWords(name);
    const bool atoms = std::all_of(name.begin(), name.end(), [](QChar c) { return c == u' ' || isAtext(c); });
    const QByteArray written = atoms ? name.toLatin1() : quoted(name);
    return longestUnbrokenRun(written) > kLongestUnbrokenRun ? encodedWords(name) : written;
}

// A dot-atom of the characters accepted: atoms of at least one character joined by single dots.
template <typename Accepted>
bool isDotSeparated(QStringView text, Accepted accepted)
{
    if (text.isEmpty())
        return false;
    for (const QStringView atom : text.split(u'.')) {
        if (atom.isEmpty() || !std::all_of(atom.begin(), atom.end(), accepted))
            return false;
    }
    return true;
}

// A host name as mail servers accept it (RFC 5321 Domain): labels of letters, digits and
// hyphens, neither starting nor ending with a hyphen, at most 63 characters each.
bool isDomain(QStringView domain)
{
    const auto ldh = [](QChar c) { return isAlphaNumeric(c) || c == u'-'; };
    if (!isDotSeparated(domain, ldh))
        return false;
    for (const QStringView label : domain.split(u'.')) {
        if (label.size() > kLongestLabel || label.startsWith(u'-') || label.endsWith(u'-'))
            return false;
    }
    return true;
}

// A header line, folded at blanks (CR LF before the blank) so that its lines are at most 78
// characters where a blank allows it; ends in CR LF. A fold never leaves a line of blanks alone,
// and never falls between the header's name and the first character of its value.
QByteArray folded(const QByteArray& line)
{
    const qsizetype valueStart = line.indexOf(": ") + 2;
    const auto canBreakAt = [&](qsizetype i) {
        return line[i] == ' ' && line[i - 1] != ' ' && i + 1 < line.size() && line[i + 1] != ' ';
    };
    QByteArray out;
    qsizetype start = 0;
    while (line.size() - start > kLineLength) {
        const qsizetype first = start == 0 ? valueStart + 1 : start + 2;
        qsizetype cut = -1;
        for (qsizetype i = first; i < line.size(); ++i) {
            if (!canBreakAt(i))
                continue;
            if (i - start > kLineLength && cut >= 0)
                break;
            cut = i;
            if (i - start >= kLineLength)
                break;
        }
        if (cut < 0)
            break;
        out += line.mid(start, cut - start) + kCrLf;
        start = cut;
    }
    return out + line.mid(start) + kCrLf;
}

QByteArray rfc5322Date(const QDateTime& given)
{
    static constexpr std::array<const char*, 7> days{"Mon", "Tue", "Wed", "Thu", "Fri", "Sat", "Sun"};
    static constexpr std::array<const char*, 12> months{"Jan", "Feb", "Mar", "Apr", "May", "Jun",
                                                        "Jul", "Aug", "Sep", "Oct", "Nov", "Dec"};
    const QDateTime date = given.isValid() ? given : QDateTime::currentDateTime();
    const QDate day = date.date();
    const QTime time = date.time();
    const int offsetMinutes = date.offsetFromUtc() / 60;
    const int offset = std::abs(offsetMinutes);
    return QString::asprintf("%s, %02d %s %04d %02d:%02d:%02d %c%02d%02d", days.at(day.dayOfWeek() - 1), day.day(),
                             months.at(day.month() - 1), day.year(), time.hour(), time.minute(), time.second(),
                             offsetMinutes < 0 ? '-' : '+', offset / 60, offset % 60)
        .toLatin1();
}

// Data as base64 lines of 76 characters joined by CR LF, without a CR LF after the last.
QByteArray base64Lines(const QByteArray& data)
{
    const QByteArray base64 = data.toBase64();
    QByteArray out;
    out.reserve(base64.size() + base64.size() / kBase64LineLength * 2 + 2);
    for (qsizetype start = 0; start < base64.size(); start += kBase64LineLength) {
        if (start > 0)
            out += kCrLf;
        out += base64.mid(start, kBase64LineLength);
    }
    return out;
}

// Text in its canonical form (RFC 2049): every line ended by CR LF, whatever the caller used.
QByteArray canonicalText(QString text)
{
    text.replace(u"\r\n"_s, u"\n"_s).replace(u'\r', u'\n').replace(u"\n"_s, u"\r\n"_s);
    return text.toUtf8();
}

// The text part's MIME headers and the blank line after them.
QByteArray textPartHeaders(const MailMessage& message)
{
    const QByteArray type = message.htmlBody.isEmpty() ? "text/plain" : "text/html";
    return "Content-Type: " + type + "; charset=UTF-8\r\nContent-Transfer-Encoding: base64\r\n\r\n";
}

// The body, HTML when there is any, as base64 lines.
QByteArray textPartBody(const MailMessage& message)
{
    return base64Lines(canonicalText(message.htmlBody.isEmpty() ? message.body : message.htmlBody));
}

// The name an attachment is shown under. A display name without a suffix takes the file's, since
// receivers open an attachment by its suffix; a suffix is what follows the last dot, not holding
// a blank ("v1.2 final" has none).
QString shownName(const MailAttachment& attachment)
{
    const QFileInfo file(attachment.path);
    QString name = withoutLineBreaks(attachment.displayName);
    if (name.trimmed().isEmpty())
        return file.fileName();
    const qsizetype dot = name.lastIndexOf(u'.');
    const bool hasSuffix = dot >= 0 && dot + 1 < name.size() && !QStringView(name).mid(dot).contains(u' ');
    if (!hasSuffix && !file.suffix().isEmpty())
        name += u'.' + file.suffix();
    return name;
}

// The UTF-8 of text percent-encoded, a character at a time: everything but attribute-chars.
QList<QByteArray> percentEncodedCharacters(const QString& text)
{
    QList<QByteArray> characters;
    for (const char c : text.toUtf8()) {
        const auto byte = static_cast<unsigned char>(c);
        if ((byte & 0xC0) != 0x80 || characters.isEmpty())
            characters.append(QByteArray());
        if (isAttributeChar(c))
            characters.last() += c;
        else
            characters.last() += '%' + QByteArray::number(byte, 16).toUpper().rightJustified(2, '0');
    }
    return characters;
}

// The filename parameter of RFC 2231 for a name that is not plain ASCII. A name too long for one
// line under RFC 5322's hard limit is cut into continuations, between characters: some readers
// decode each piece on its own.
QByteArray extendedFilename(const QString& name)
{
    const QList<QByteArray> characters = percentEncodedCharacters(name);
    const QByteArray value = characters.join();
    if (value.size() <= kLongestParameter)
        return "filename*=UTF-8''" + value;
    QList<QByteArray> pieces{QByteArray()};
    for (const QByteArray& character : characters) {
        if (pieces.last().size() + character.size() > kContinuationLength)
            pieces.append(QByteArray());
        pieces.last() += character;
    }
    QByteArray out;
    for (qsizetype i = 0; i < pieces.size(); ++i) {
        out += (i == 0 ? "filename*0*=UTF-8''" : "; filename*" + QByteArray::number(i) + "*=") + pieces[i];
    }
    return out;
}

QByteArray attachmentPart(const MailAttachment& attachment)
{
    QFile file(attachment.path);
    QByteArray content;
    if (file.open(QIODevice::ReadOnly))
        content = file.readAll();
    if (!file.isOpen() || file.error() != QFileDevice::NoError)
        throw Failure(u"לא ניתן לקרוא את הקובץ המצורף \"%1\": %2"_s.arg(attachment.path, file.errorString()), 53);

    const QString name = shownName(attachment);
    const QByteArray type = QMimeDatabase().mimeTypeForFile(attachment.path).name().toLatin1();
    const QByteArray plain = isPlainAscii(name) ? quoted(name) : QByteArray();
    const bool asItStands = !plain.isEmpty() && longestUnbrokenRun(plain) <= kLongestUnbrokenRun;
    // Older clients read only "name", and many of them understand encoded words there.
    const QByteArray nameParameter = asItStands ? plain : '"' + encodedWords(name) + '"';
    const QByteArray filenameParameter = asItStands ? "filename=" + plain : extendedFilename(name);
    return folded("Content-Type: " + type + "; name=" + nameParameter)
        + folded("Content-Disposition: attachment; " + filenameParameter) + "Content-Transfer-Encoding: base64\r\n\r\n"
        + base64Lines(content);
}

}  // namespace

bool isMailbox(const QString& address)
{
    if (address.size() > kLongestMailbox)
        return false;
    const qsizetype at = address.indexOf(u'@');
    if (at < 0)
        return false;
    const QStringView local = QStringView(address).left(at);
    const QStringView domain = QStringView(address).mid(at + 1);
    return local.size() <= kLongestLocalPart && isDotSeparated(local, isAtext) && isDomain(domain);
}

QByteArray mimeContent(const MailMessage& message)
{
    QList<QByteArray> attachments;
    for (const MailAttachment& attachment : message.attachments) {
        if (!attachment.path.isEmpty())
            attachments.append(attachmentPart(attachment));
    }
    QByteArray out = "MIME-Version: 1.0\r\n";
    if (attachments.isEmpty()) {
        const QByteArray body = textPartBody(message);
        return out + textPartHeaders(message) + body + (body.isEmpty() ? QByteArray() : kCrLf);
    }
    // Base64 has no "_" and has "=" only as padding at the end of the data, and every header line
    // of a part starts with a name: no line of any part can start with "--=_".
    const QByteArray boundary = "=_" + QUuid::createUuid().toByteArray(QUuid::Id128);
    const QByteArray delimiter = "\r\n--" + boundary;
    out += folded("Content-Type: multipart/mixed; boundary=\"" + boundary + '"');
    // The delimiter's CR LF follows the blank line that ends the headers, so an empty part still
    // has its blank line and an empty body.
    out += kCrLf + "--" + boundary + kCrLf + textPartHeaders(message) + textPartBody(message);
    for (const QByteArray& part : attachments)
        out += delimiter + kCrLf + part;
    return out + delimiter + "--" + kCrLf;
}

QByteArray mimeHeaders(const MailMessage& message, const QDateTime& date, const QByteArray& messageId)
{
    QByteArray out = folded("From: " + mailboxHeaderValue(message.from));
    if (!message.toList.isEmpty()) {
        QByteArray to;
        for (const MailRecipient& recipient : message.toList)
            to += (to.isEmpty() ? "" : ", ") + mailboxHeaderValue(recipient);
        out += folded("To: " + to);
    }
    out += folded("Subject: " + encodedText(message.subject));
    out += folded("Date: " + rfc5322Date(date));
    out += folded("Message-ID: " + withoutLineBreaks(messageId));
    return out + "Importance: high\r\nX-Priority: 1\r\n";
}

QByteArray newMessageId(const QString& senderAddress)
{
    // The domain of an address that is no mailbox is not trusted: it may hold anything.
    const QByteArray host = isMailbox(senderAddress) ? senderAddress.mid(senderAddress.indexOf(u'@') + 1).toLatin1()
                                                     : QByteArray("localhost");
    return '<' + QUuid::createUuid().toByteArray(QUuid::Id128) + '.'
        + QByteArray::number(QDateTime::currentMSecsSinceEpoch()) + '@' + host + '>';
}

QByteArray encodedText(const QString& text)
{
    const QString flat = withoutLineBreaks(text);
    if (isPlainAscii(flat) && longestUnbrokenRun(flat.toLatin1()) <= kLongestUnbrokenRun)
        return flat.toLatin1();
    return encodedWords(flat);
}

QByteArray mailboxHeaderValue(const MailRecipient& recipient)
{
    if (!isMailbox(recipient.address))
        throw Failure(u"הכתובת \"%1\" אינה כתובת דואר אלקטרוני תקינה."_s.arg(recipient.address));
    const QByteArray address = recipient.address.toLatin1();
    const QString name = withoutLineBreaks(recipient.name);
    if (name.trimmed().isEmpty())
        return address;
    return phrase(name) + " <" + address + '>';
}

}  // namespace pelmar
