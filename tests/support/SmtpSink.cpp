#include "support/SmtpSink.h"

#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <stdexcept>

namespace pelmar::test {

namespace {

// Debian's interpreter, which sees the python3-aiosmtpd package; -I keeps a PYTHONPATH or a
// user's site-packages from changing what it imports.
constexpr const char* kPython = "/usr/bin/python3";

QString script()
{
    return QDir::cleanPath(QStringLiteral(PELMAR_TEST_DATA "/../support/smtp_sink.py"));
}

QByteArray readFile(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

}  // namespace

QByteArray ReceivedMail::header(const QByteArray& name) const
{
    QByteArray value;
    bool found = false;
    for (qsizetype start = 0; start < data.size();) {
        qsizetype end = data.indexOf('\n', start);
        if (end < 0)
            end = data.size();
        QByteArray line = data.mid(start, end - start);
        start = end + 1;
        if (line.endsWith('\r'))
            line.chop(1);
        if (line.isEmpty())
            break;  // the blank line that ends the header section
        if (line.front() == ' ' || line.front() == '\t') {
            if (found)
                value += line;
            continue;
        }
        if (found)
            break;
        const qsizetype colon = line.indexOf(':');
        if (colon > 0 && line.left(colon).trimmed().compare(name, Qt::CaseInsensitive) == 0) {
            found = true;
            value = line.mid(colon + 1);
        }
    }
    return value.trimmed();
}

SmtpSink::SmtpSink() : SmtpSink(Options{})
{}

SmtpSink::SmtpSink(const Options& options) : dir_(QDir::tempPath() + QStringLiteral("/pelmar-smtp-XXXXXX"))
{
    if (!dir_.isValid())
        throw std::runtime_error("cannot create the SMTP sink's folder");
    if (options.startTls || options.implicitTls)
        makeCertificate();
    process_.setStandardOutputFile(dir_.filePath(QStringLiteral("stdout")));
    process_.setStandardErrorFile(dir_.filePath(QStringLiteral("stderr")));
    process_.start(QString::fromLatin1(kPython), arguments(options));
    waitUntilReady();
}

SmtpSink::~SmtpSink()
{
    if (process_.state() == QProcess::NotRunning)
        return;
    process_.terminate();
    if (!process_.waitForFinished(5000)) {
        process_.kill();
        process_.waitForFinished();
    }
}

void SmtpSink::makeCertificate()
{
    QProcess openssl;
    openssl.setWorkingDirectory(dir_.path());
    openssl.setProcessChannelMode(QProcess::MergedChannels);
    openssl.start(QStringLiteral("openssl"),
                  {QStringLiteral("req"), QStringLiteral("-x509"), QStringLiteral("-newkey"),
                   QStringLiteral("rsa:2048"), QStringLiteral("-nodes"), QStringLiteral("-days"), QStringLiteral("2"),
                   QStringLiteral("-subj"), QStringLiteral("/CN=localhost"), QStringLiteral("-addext"),
                   QStringLiteral("subjectAltName=IP:127.0.0.1,DNS:localhost"), QStringLiteral("-keyout"),
                   QStringLiteral("key.pem"), QStringLiteral("-out"), QStringLiteral("cert.pem")});
    if (!openssl.waitForFinished(60000) || openssl.exitStatus() != QProcess::NormalExit || openssl.exitCode() != 0)
        throw std::runtime_error("cannot make the SMTP sink's certificate with openssl:\n"
                                 + openssl.readAll().toStdString());
    certificate_ = dir_.filePath(QStringLiteral("cert.pem"));
}

QStringList SmtpSink::arguments(const Options& options) const
{
    QStringList arguments{QStringLiteral("-I"), script(), QStringLiteral("--folder"),
                          dir_.filePath(QStringLiteral("mail"))};
    for (const QString& address : options.refused)
        arguments << QStringLiteral("--refuse") << address;
    for (const QString& address : options.deferred)
        arguments << QStringLiteral("--defer") << address;
    if (options.startTls || options.implicitTls)
        arguments << QStringLiteral("--tls-cert") << certificate_ << QStringLiteral("--tls-key")
                  << dir_.filePath(QStringLiteral("key.pem"));
    if (options.implicitTls)
        arguments << QStringLiteral("--implicit-tls");
    if (options.user.contains(u':'))
        throw std::invalid_argument("the SMTP sink's user may not contain a colon");
    if (!options.user.isEmpty())
        arguments << QStringLiteral("--auth") << options.user + u':' + options.password;
    if (options.port > 0)
        arguments << QStringLiteral("--port") << QString::number(options.port);
    if (options.acceptLimit >= 0)
        arguments << QStringLiteral("--accept-limit") << QString::number(options.acceptLimit);
    return arguments;
}

void SmtpSink::waitUntilReady()
{
    QElapsedTimer timer;
    timer.start();
    while (timer.elapsed() < 10000) {
        const QByteArray out = readFile(dir_.filePath(QStringLiteral("stdout")));
        if (out.startsWith("ready ") && out.endsWith('\n')) {
            port_ = out.mid(6).trimmed().toInt();
            return;
        }
        // Waiting for the end doubles as the pause between two looks at the output.
        if (process_.waitForFinished(25) || process_.state() == QProcess::NotRunning)
            break;
    }
    QByteArray errors = readFile(dir_.filePath(QStringLiteral("stderr")));
    if (errors.isEmpty())
        errors = "it printed no \"ready\" within 10 s";
    if (process_.error() == QProcess::FailedToStart)
        errors.prepend(process_.errorString().toUtf8() + '\n');
    process_.kill();
    process_.waitForFinished();
    throw std::runtime_error("the SMTP sink did not start: " + errors.toStdString());
}

QList<ReceivedMail> SmtpSink::messages() const
{
    const QDir mail(dir_.filePath(QStringLiteral("mail")));
    QList<ReceivedMail> messages;
    for (const QString& name : mail.entryList({QStringLiteral("*.json")}, QDir::Files, QDir::Name)) {
        const QJsonObject envelope = QJsonDocument::fromJson(readFile(mail.filePath(name))).object();
        ReceivedMail message;
        message.mailFrom = envelope.value(QLatin1String("mail_from")).toString();
        for (const QJsonValue& recipient : envelope.value(QLatin1String("rcpt_tos")).toArray())
            message.recipients << recipient.toString();
        message.data = readFile(mail.filePath(name.chopped(5) + QStringLiteral(".eml")));
        messages << message;
    }
    return messages;
}

int SmtpSink::connections() const
{
    return readFile(dir_.filePath(QStringLiteral("mail/connections"))).trimmed().toInt();
}

}  // namespace pelmar::test
