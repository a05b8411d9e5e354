#pragma once

#include "outputs/SmtpTransport.h"

#include <QString>

namespace pelmar {

class MailTransport;
class Messages;
struct MailingOptions;
struct RunContext;

// The e-mail run: checks the e-mail options (a missing one is a critical box titled "שגיאה" and
// nothing is sent), walks the recipients of the e-mail query and sends the message to each
// recipient, or to groups of them in blind copy, through the transport. A message that names a
// recipient who is not a valid address, or whom the server refuses, is dropped with the
// exclamation "Cannot resolve address '...'" and the run goes on. A failure of the database or
// the server ends the run with a critical box titled "תקלה" and sets the stop flag; it does not
// reach the caller. Every accepted message is written to the campaign's journal in
// journalFolder first, and a run of a campaign whose journal is unfinished asks whether to go on
// where it stopped. The run's count of messages sent and recipients dropped is left in the
// context's outcome.
void SendEmailCampaign(RunContext& context, MailTransport& transport, const QString& journalFolder);

// The outgoing mail server of the options. The caller checks the options first: a port that
// is not a number gives 0 here.
SmtpServer smtpServerOf(const MailingOptions& options);

// The text of a file a user brings as a message body (UTF-8 when it carries a byte-order mark
// or is valid UTF-8, else windows-1255). On a read failure it shows "Error N reading file", a
// line break and the cause in a box, and returns what it read (so far) with ok false.
QString ReadTextFile(const QString& path, Messages& messages, bool& ok);

}  // namespace pelmar
