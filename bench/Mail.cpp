#include "bench/Mail.h"

#include "bench/MailSink.h"
#include "common/Failure.h"
#include "common/SessionState.h"
#include "db/DatabaseClient.h"
#include "demo/SqliteCompanyWriter.h"
#include "options/MailingOptions.h"
#include "outputs/EmailCampaign.h"
#include "outputs/MimeWriter.h"
#include "outputs/Output.h"
#include "settings/SettingsStore.h"
#include "support/Fakes.h"

#include <QDateTime>
#include <QElapsedTimer>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>
#include <QTextStream>

using namespace Qt::StringLiterals;

namespace pelmar::bench {

namespace {

// One connection, one sendmail a message: how a script would send a campaign.
constexpr const char* kSmtplibLoop = R"(
import smtplib, sys
port, message_file, count = int(sys.argv[1]), sys.argv[2], int(sys.argv[3])
message = open(message_file, 'rb').read()
with smtplib.SMTP('127.0.0.1', port) as server:
    for n in range(count):
        server.sendmail('shivuk@pelmar.test', ['r%d@example.test' % n], message)
)";

struct Result {
    long messages = 0;
    double seconds = 0;
};

MailingOptions campaign(int port, int groupSize)
{
    MailingOptions options;
    options.emailHtmlBody.clear();
    options.emailAttachFile.clear();
    options.emailFrom = u"shivuk@pelmar.test"_s;
    options.emailToMain = u"lakohot@pelmar.test"_s;
    options.emailMethod = groupSize > 1 ? 2 : 1;
    options.emailGroupSize = QString::number(groupSize);
    options.smtpServer = u"127.0.0.1"_s;
    options.smtpPort = QString::number(port);
    return options;
}

Result sendCampaign(SessionState& state, int groupSize, const QString& folder)
{
    MailSink sink;
    const MailingOptions options = campaign(sink.port(), groupSize);
    SettingsStore store(folder);
    const DatabaseClient client(u"PostgreSQL Unicode"_s);
    test::FakeMessages messages;
    test::FakeBrowser browser;
    test::FakeFileDialogs files;
    test::FakeProgress progress;
    StopToken stop(state.StopRequested);
    RunContext context{options, state, {messages, browser, files, store, client}, progress, stop, {}};
    SmtpTransport transport(smtpServerOf(options));
    QElapsedTimer timer;
    timer.start();
    SendEmailCampaign(context, transport, folder + u"/journal"_s);
    const double seconds = static_cast<double>(timer.nsecsElapsed()) / 1e9;
    if (!messages.boxes.isEmpty())
        throw Failure(u"the campaign did not go through: "_s + messages.boxes.front().text);
    return {sink.accepted(), seconds};
}

// A message as the campaign writes it, to one recipient.
QByteArray sampleMessage(QByteArray* headers = nullptr)
{
    MailMessage message;
    message.from = {u"shivuk@pelmar.test"_s, u"טרבל - מחלקת שיווק"_s};
    message.toList = {{u"r1@example.test"_s, u"לקוח"_s}};
    message.subject = MailingOptions().emailSubject;
    message.body = MailingOptions().emailContent;
    const QByteArray head = mimeHeaders(message, QDateTime::currentDateTime(), newMessageId(message.from.address));
    if (headers)
        *headers = head;
    return head + mimeContent(message);
}

// The transport alone sending the same message again and again: what the campaign adds to it.
Result transportAlone(long count)
{
    MailSink sink;
    SmtpTransport transport({u"127.0.0.1"_s, sink.port(), SmtpServer::Security::StartTlsWhenOffered, {}, {}, {}});
    QByteArray headers;
    const QByteArray content = sampleMessage(&headers).mid(headers.size());
    QElapsedTimer timer;
    timer.start();
    for (long n = 0; n < count; ++n)
        transport.send(u"shivuk@pelmar.test"_s, {u"r1@example.test"_s}, headers, content);
    return {sink.accepted(), static_cast<double>(timer.nsecsElapsed()) / 1e9};
}

Result sendWithSmtplib(long count, const QString& folder)
{
    MailSink sink;
    QFile file(folder + u"/message.eml"_s);
    if (!file.open(QIODevice::WriteOnly))
        throw Failure(u"cannot write "_s + file.fileName());
    file.write(sampleMessage());
    file.close();
    QElapsedTimer timer;
    timer.start();
    QProcess python;
    python.setProcessChannelMode(QProcess::ForwardedChannels);
    python.start(u"/usr/bin/python3"_s,
                 {u"-c"_s, QString::fromLatin1(kSmtplibLoop), QString::number(sink.port()), file.fileName(),
                  QString::number(count)});
    if (!python.waitForFinished(-1) || python.exitCode() != 0)
        throw Failure(u"the smtplib loop failed"_s);
    return {sink.accepted(), static_cast<double>(timer.nsecsElapsed()) / 1e9};
}

void print(QTextStream& out, const QString& sender, const Result& result)
{
    out << QString(u"%1 %2 %3 %4"_s)
               .arg(sender, -24)
               .arg(result.messages, 9)
               .arg(result.seconds, 9, 'f', 3)
               .arg(static_cast<double>(result.messages) / result.seconds, 11, 'f', 0)
        << Qt::endl;
}

}  // namespace

int measureMail(int cards)
{
    QTemporaryDir dir;
    CompanyOptions company;
    company.cards = cards;
    company.seed = 42;
    writeSqliteCompany(dir.filePath(u"mail.sqlite"_s), company);
    SessionState state;
    state.ConnServer = u"sqlite:"_s + dir.path();
    state.ConnDataBase = u"mail"_s;

    QTextStream out(stdout);
    out << u"sender                    messages   seconds  messages/s"_s << Qt::endl;
    const Result each = sendCampaign(state, 1, dir.path());
    print(out, u"pelmar, one a recipient"_s, each);
    print(out, u"pelmar, groups of 20"_s, sendCampaign(state, 20, dir.path()));
    print(out, u"libcurl transport alone"_s, transportAlone(each.messages));
    print(out, u"smtplib loop"_s, sendWithSmtplib(each.messages, dir.path()));
    return 0;
}

}  // namespace pelmar::bench
