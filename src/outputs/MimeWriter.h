#pragma once

#include "outputs/MailMessage.h"

#include <QByteArray>
#include <QDateTime>
#include <QString>

namespace pelmar {

// The Internet message format of a campaign's messages (RFC 5322, MIME RFC 2045-2047, RFC 2231),
// in two halves: the content (MIME headers, body and attachments), the same for every message of
// a run and so built once, and the headers that name the sender, the receivers and the message.
// Every line ends in CR LF and is at most 78 characters long, except a header whose single word
// cannot be folded. No value a caller passes can add a header or a line: line breaks in names
// and subjects are written as blanks, and names and subjects that are not plain ASCII are
// encoded words. A message is mimeHeaders(...) followed by mimeContent(...).

// True for an address that can stand in an envelope and a header: local-part "@" domain, at most
// 254 characters. Strict on purpose, refusing forms the RFCs allow but a mail server or a header
// may not survive: the local part is a dot-atom of RFC 5322 atext of at most 64 characters (no
// quoted local part); the domain is a host name of labels of letters, digits and hyphens (a
// hyphen neither first nor last, at most 63 each; no address literal). No empty part, no dot
// first, last or doubled, one "@" only, ASCII only: blanks, line breaks, quotes and angle
// brackets are refused.
bool isMailbox(const QString& address);

// The content: "MIME-Version", "Content-Type" (text/plain or text/html, UTF-8, base64; with
// attachments a multipart/mixed of the text and each file as base64 with its display name) and
// the body, starting with the MIME headers and ending in CR LF. The text goes in its canonical
// form, every line break CR LF. Attachments with an empty path are left out (none left: a single
// text part). A file is shown under its display name, or its own name when that is empty, and a
// display name without a suffix takes the file's, since receivers open attachments by suffix.
// A name that is not plain ASCII is written per RFC 2231 in "filename", and as encoded words in
// "name" for the older readers that look only there. Throws Failure naming the file when an
// attachment cannot be read.
QByteArray mimeContent(const MailMessage& message);

// The headers of one message, each line ended by CR LF, without the blank line that separates
// them from the content: From, To (absent when toList is empty), Subject, Date (RFC 5322 in
// English with the date's own offset from UTC; the current time when the date is invalid),
// Message-ID, "Importance: high" and "X-Priority: 1". The blind-copy recipients are never
// written. Throws Failure naming the address when the sender's or a To address is not a mailbox
// (isMailbox): such an address could add a recipient to the header.
QByteArray mimeHeaders(const MailMessage& message, const QDateTime& date, const QByteArray& messageId);

// A new message identifier, unique across processes and machines: "<unique@domain>", the domain
// that of the sender's address, "localhost" when the address is not a mailbox.
QByteArray newMessageId(const QString& senderAddress);

// A header value in RFC 2047 encoded words ("=?UTF-8?B?...?=", separated by blanks) when it holds
// anything but printable ASCII, else as it stands; each encoded word at most 75 characters, never
// splitting a character. Line breaks become blanks first. Printable ASCII is encoded too when it
// holds "=?", which a receiver would take for an encoded word, or a run of more than 900
// characters without a blank, which no fold could bring under the line limit of 998.
QByteArray encodedText(const QString& text);

// "Name <address>" for a header: the name as an atom phrase, a quoted string, or encoded words,
// whichever it needs; the address alone when the name is empty or blank. Throws Failure when the
// address is not a mailbox (isMailbox).
QByteArray mailboxHeaderValue(const MailRecipient& recipient);

}  // namespace pelmar
