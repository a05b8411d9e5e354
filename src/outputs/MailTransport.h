#pragma once

#include <QByteArray>
#include <QString>
#include <QStringList>

namespace pelmar {

// Where a campaign's messages go: one message at a time, to the recipients of its envelope.
class MailTransport {
public:
    virtual ~MailTransport() = default;

    // Hands one message to the server: the sender and the recipients of the envelope (the blind
    // copies among them), and the message as headers followed by content. Returns the empty
    // string when the server accepted the message, else the address of the recipient it refused;
    // a message with a refused recipient is not sent to anyone. Throws Failure when the server
    // cannot be reached, goes away, or refuses the message itself: the message may then not have
    // been sent, and the run cannot go on.
    virtual QString send(const QString& sender, const QStringList& recipients, const QByteArray& headers,
                         const QByteArray& content)
        = 0;
};

}  // namespace pelmar
