#pragma once

#include "outputs/MailTransport.h"

#include <QString>

#include <memory>

namespace pelmar {

// How to reach the outgoing mail server.
struct SmtpServer {
    enum class Security { StartTlsWhenOffered = 0, StartTlsRequired = 1, Tls = 2 };

    QString host;
    int port = 25;
    Security security = Security::StartTlsWhenOffered;
    QString user;  // empty: no authentication
    QString password;
    // A file of certificates to trust besides the system's (a company's own authority); empty
    // for the system's alone.
    QString caFile;
};

// The mail transport over SMTP (libcurl). One connection serves the whole run: it is opened
// with the first message and kept; libcurl sees when the server has closed it between two
// messages and opens a new one for the next. A server's certificate is always verified.
class SmtpTransport : public MailTransport {
public:
    explicit SmtpTransport(const SmtpServer& server);
    ~SmtpTransport() override;
    SmtpTransport(const SmtpTransport&) = delete;
    SmtpTransport& operator=(const SmtpTransport&) = delete;

    QString send(const QString& sender, const QStringList& recipients, const QByteArray& headers,
                 const QByteArray& content) override;

private:
    struct Session;
    std::unique_ptr<Session> session_;
};

}  // namespace pelmar
