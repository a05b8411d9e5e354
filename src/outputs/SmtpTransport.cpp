#include "outputs/SmtpTransport.h"

#include "common/Failure.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <curl/curl.h>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

void initialiseCurlOnce()
{
    static const CURLcode initialised = curl_global_init(CURL_GLOBAL_DEFAULT);
    if (initialised != CURLE_OK)
        throw Failure(
            u"לא ניתן להפעיל את רכיב הדואר (libcurl): %1"_s.arg(QString::fromUtf8(curl_easy_strerror(initialised))));
}

QByteArray serverUrl(const SmtpServer& server)
{
    const QString host = server.host.contains(u':') ? u'[' + server.host + u']' : server.host;
    const QString scheme = server.security == SmtpServer::Security::Tls ? u"smtps"_s : u"smtp"_s;
    return (scheme + u"://"_s + host + u':' + QString::number(server.port)).toUtf8();
}

QByteArray envelopeAddress(const QString& address)
{
    return '<' + address.toUtf8() + '>';
}

}  // namespace

struct SmtpTransport::Session {
    CURL* curl = nullptr;
    QString serverName;
    std::array<char, CURL_ERROR_SIZE> error{};

    // The message being uploaded: its two parts and how far each has gone out.
    std::array<const QByteArray*, 2> parts{};
    std::size_t part = 0;
    qsizetype offset = 0;

    // What the exchange with the server has come to, read from libcurl's trace: the recipient
    // last named to the server, and whether the message itself has started to go out.
    QString lastRecipient;
    bool dataStarted = false;

    static size_t read(char* buffer, size_t size, size_t count, void* self);
    static int trace(CURL*, curl_infotype type, char* data, size_t size, void* self);

    CURLcode perform(const QString& sender, const QStringList& recipients);
    long lastResponse() const;
};

size_t SmtpTransport::Session::read(char* buffer, size_t size, size_t count, void* self)
{
    auto& session = *static_cast<Session*>(self);
    size_t written = 0;
    const size_t room = size * count;
    while (written < room && session.part < session.parts.size()) {
        const QByteArray& bytes = *session.parts[session.part];
        const auto take = std::min<qsizetype>(bytes.size() - session.offset, static_cast<qsizetype>(room - written));
        std::memcpy(buffer + written, bytes.constData() + session.offset, static_cast<size_t>(take));
        written += static_cast<size_t>(take);
        session.offset += take;
        if (session.offset == bytes.size()) {
            ++session.part;
            session.offset = 0;
        }
    }
    return written;
}

int SmtpTransport::Session::trace(CURL*, curl_infotype type, char* data, size_t size, void* self)
{
    if (type != CURLINFO_HEADER_OUT)
        return 0;
    auto& session = *static_cast<Session*>(self);
    const QByteArray command(data, static_cast<qsizetype>(size));
    if (command.startsWith("MAIL FROM:")) {
        session.lastRecipient.clear();
        session.dataStarted = false;
    } else if (command.startsWith("RCPT TO:<")) {
        const qsizetype end = command.indexOf('>');
        session.lastRecipient = QString::fromUtf8(command.mid(9, end - 9));
    } else if (command.startsWith("DATA")) {
        session.dataStarted = true;
    }
    return 0;
}

CURLcode SmtpTransport::Session::perform(const QString& sender, const QStringList& recipients)
{
    curl_slist* envelope = nullptr;
    for (const QString& recipient : recipients)
        envelope = curl_slist_append(envelope, envelopeAddress(recipient).constData());
    curl_easy_setopt(curl, CURLOPT_MAIL_FROM, envelopeAddress(sender).constData());
    curl_easy_setopt(curl, CURLOPT_MAIL_RCPT, envelope);
    curl_easy_setopt(curl, CURLOPT_INFILESIZE_LARGE, static_cast<curl_off_t>(parts[0]->size() + parts[1]->size()));
    part = 0;
    offset = 0;
    lastRecipient.clear();
    dataStarted = false;
    error[0] = '\0';
    const CURLcode code = curl_easy_perform(curl);
    curl_easy_setopt(curl, CURLOPT_MAIL_RCPT, nullptr);
    curl_slist_free_all(envelope);
    return code;
}

long SmtpTransport::Session::lastResponse() const
{
    long response = 0;
    curl_easy_getinfo(curl, CURLINFO_RESPONSE_CODE, &response);
    return response;
}

SmtpTransport::SmtpTransport(const SmtpServer& server) : session_(std::make_unique<Session>())
{
    initialiseCurlOnce();
    CURL* curl = curl_easy_init();
    if (!curl)
        throw Failure(u"לא ניתן להפעיל את רכיב הדואר (libcurl)."_s);
    session_->curl = curl;
    session_->serverName = server.host + u':' + QString::number(server.port);
    curl_easy_setopt(curl, CURLOPT_URL, serverUrl(server).constData());
    curl_easy_setopt(curl, CURLOPT_USE_SSL,
                     server.security == SmtpServer::Security::StartTlsWhenOffered ? CURLUSESSL_TRY : CURLUSESSL_ALL);
    if (!server.caFile.isEmpty())
        curl_easy_setopt(curl, CURLOPT_CAINFO, server.caFile.toLocal8Bit().constData());
    if (!server.user.isEmpty()) {
        curl_easy_setopt(curl, CURLOPT_USERNAME, server.user.toUtf8().constData());
        curl_easy_setopt(curl, CURLOPT_PASSWORD, server.password.toUtf8().constData());
    }
    curl_easy_setopt(curl, CURLOPT_UPLOAD, 1L);
    curl_easy_setopt(curl, CURLOPT_READFUNCTION, &Session::read);
    curl_easy_setopt(curl, CURLOPT_READDATA, session_.get());
    curl_easy_setopt(curl, CURLOPT_VERBOSE, 1L);
    curl_easy_setopt(curl, CURLOPT_DEBUGFUNCTION, &Session::trace);
    curl_easy_setopt(curl, CURLOPT_DEBUGDATA, session_.get());
    curl_easy_setopt(curl, CURLOPT_ERRORBUFFER, session_->error.data());
    curl_easy_setopt(curl, CURLOPT_NOSIGNAL, 1L);
    curl_easy_setopt(curl, CURLOPT_CONNECTTIMEOUT, 15L);
    // A server that stops answering ends the run after a minute instead of hanging it.
    curl_easy_setopt(curl, CURLOPT_LOW_SPEED_LIMIT, 1L);
    curl_easy_setopt(curl, CURLOPT_LOW_SPEED_TIME, 60L);
}

SmtpTransport::~SmtpTransport()
{
    curl_easy_cleanup(session_->curl);
}

QString SmtpTransport::send(const QString& sender, const QStringList& recipients, const QByteArray& headers,
                            const QByteArray& content)
{
    Session& session = *session_;
    session.parts = {&headers, &content};
    const CURLcode code = session.perform(sender, recipients);
    if (code == CURLE_OK)
        return {};
    const long response = session.lastResponse();
    const bool recipientRefused
        = !session.lastRecipient.isEmpty() && !session.dataStarted && response >= 400 && response != 421;
    if (recipientRefused)
        return session.lastRecipient;
    const QString detail
        = session.error[0] ? QString::fromUtf8(session.error.data()) : QString::fromUtf8(curl_easy_strerror(code));
    throw Failure(u"שרת הדואר היוצא %1 לא קיבל את ההודעה: %2. יש לבדוק את הגדרות השרת בדף הדואר האלקטרוני."_s.arg(
        session.serverName, detail));
}

}  // namespace pelmar
