#pragma once

#include <QByteArray>
#include <QList>
#include <QProcess>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

namespace pelmar::test {

// One message an SmtpSink accepted, with its envelope.
struct ReceivedMail {
    QString mailFrom;
    QStringList recipients;  // the envelope's RCPT TO addresses, in order; refused ones are not here
    QByteArray data;  // the message as received: dot-unstuffed, CR LF kept

    // The value of the first header of that name, unfolded (continuation lines joined), raw
    // (encoded words stay encoded) and without the surrounding blanks; empty when absent.
    // Header names compare case-insensitively.
    QByteArray header(const QByteArray& name) const;
};

// An SMTP server on 127.0.0.1 (tests/support/smtp_sink.py under Debian's python3 and aiosmtpd)
// that records every message it accepts. A message is recorded before the client gets the 250
// for its DATA, so once a send has succeeded, messages() holds it. The server runs as a child
// of the test program and stops by itself when the program dies.
class SmtpSink {
public:
    struct Options {
        // RCPT TO of these addresses (compared exactly) is answered
        // "550 5.1.1 <address>: Recipient address rejected".
        QStringList refused;
        // RCPT TO of these is answered "450 4.2.1 <address>: Mailbox busy, try again later".
        QStringList deferred;
        // Offers STARTTLS (without requiring it) with a self-signed certificate for 127.0.0.1 and
        // localhost; a client must trust certificateFile().
        bool startTls = false;
        // Speaks TLS from the first byte instead (with the same certificate); no STARTTLS.
        bool implicitTls = false;
        // A non-empty user makes AUTH PLAIN or LOGIN with these credentials required before MAIL,
        // with or without TLS; other credentials get 535. The user may not contain a colon.
        QString user, password;
        // After this many accepted messages, every MAIL is answered "421 4.3.2 Service shutting
        // down" and the connection closed. Negative: no limit.
        int acceptLimit = -1;
        // The port to listen on; 0 for a free one.
        int port = 0;
    };

    // Starts the server and waits until it accepts connections; throws std::runtime_error with
    // the server's error output when it does not start within about ten seconds.
    SmtpSink();
    explicit SmtpSink(const Options& options);
    ~SmtpSink();
    SmtpSink(const SmtpSink&) = delete;
    SmtpSink& operator=(const SmtpSink&) = delete;

    int port() const { return port_; }
    // The PEM certificate a client must trust when startTls or implicitTls is set; else empty.
    QString certificateFile() const { return certificate_; }
    // Every accepted message, in the order accepted.
    QList<ReceivedMail> messages() const;
    // The connections accepted so far (a STARTTLS does not count as a new one).
    int connections() const;

private:
    void makeCertificate();
    QStringList arguments(const Options& options) const;
    void waitUntilReady();

    QTemporaryDir dir_;
    QString certificate_;
    QProcess process_;
    int port_ = 0;
};

}  // namespace pelmar::test
