#pragma once

#include <QList>
#include <QString>

namespace pelmar {

// A sender or recipient of a message: an address and a display name (may be empty).
struct MailRecipient {
    QString address;
    QString name;
    bool operator==(const MailRecipient&) const = default;
};

// A file sent with a message under a name of its own (the file's name when empty).
struct MailAttachment {
    QString path;
    QString displayName;
};

// One message of a campaign. The To recipients appear in the header; the blind-copy recipients
// only in the envelope, so no receiver learns of another. The body is HTML when htmlBody is set,
// else the plain text of body.
struct MailMessage {
    MailRecipient from;
    QList<MailRecipient> toList;
    QList<MailRecipient> bccList;
    QString subject;
    QString body;
    QString htmlBody;
    QList<MailAttachment> attachments;
};

}  // namespace pelmar
