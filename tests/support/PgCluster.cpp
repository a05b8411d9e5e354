#include "support/PgCluster.h"

#include <QCoreApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QProcess>
#include <QThread>

#include <arpa/inet.h>
#include <netinet/in.h>
#include <pwd.h>
#include <signal.h>
#include <stdexcept>
#include <sys/socket.h>
#include <unistd.h>

namespace pelmar::test {

namespace {

bool runningAsRoot()
{
    return ::geteuid() == 0;
}

QString postgresBin()
{
    const QStringList versions = QDir(QStringLiteral("/usr/lib/postgresql"))
                                     .entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name | QDir::Reversed);
    if (versions.isEmpty())
        throw std::runtime_error("PostgreSQL is not installed (no /usr/lib/postgresql/<version>)");
    return QStringLiteral("/usr/lib/postgresql/%1/bin").arg(versions.first());
}

// The command line that runs program as the server's owner.
QStringList asOwner(const QString& program, const QStringList& arguments)
{
    if (!runningAsRoot())
        return QStringList{program} + arguments;
    return QStringList{QStringLiteral("runuser"), QStringLiteral("-u"), QStringLiteral("postgres"),
                       QStringLiteral("--"), program}
    + arguments;
}

void run(const QStringList& command, int timeoutMs = 120000)
{
    QProcess process;
    process.setProcessChannelMode(QProcess::MergedChannels);
    process.start(command.first(), command.mid(1));
    if (!process.waitForFinished(timeoutMs) || process.exitStatus() != QProcess::NormalExit || process.exitCode() != 0)
        throw std::runtime_error("command failed: " + command.join(QLatin1Char(' ')).toStdString() + "\n"
                                 + process.readAll().toStdString());
}

void giveToOwner(const QString& path)
{
    if (!runningAsRoot())
        return;
    const passwd* owner = ::getpwnam("postgres");
    if (!owner || ::chown(path.toLocal8Bit().constData(), owner->pw_uid, owner->pw_gid) != 0)
        throw std::runtime_error("cannot give the cluster folder to the postgres user");
}

bool processAlive(qint64 pid)
{
    return QFile::exists(QStringLiteral("/proc/%1").arg(pid));
}

}  // namespace

int freeLoopbackPort()
{
    const int s = ::socket(AF_INET, SOCK_STREAM, 0);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    ::bind(s, reinterpret_cast<sockaddr*>(&address), sizeof address);
    socklen_t length = sizeof address;
    ::getsockname(s, reinterpret_cast<sockaddr*>(&address), &length);
    ::close(s);
    return ntohs(address.sin_port);
}

SilentServer::SilentServer()
{
    socket_ = ::socket(AF_INET, SOCK_STREAM, 0);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    ::bind(socket_, reinterpret_cast<sockaddr*>(&address), sizeof address);
    ::listen(socket_, 16);
    socklen_t length = sizeof address;
    ::getsockname(socket_, reinterpret_cast<sockaddr*>(&address), &length);
    port_ = ntohs(address.sin_port);
}

SilentServer::~SilentServer()
{
    ::close(socket_);
}

PgCluster& PgCluster::shared()
{
    static PgCluster cluster;
    return cluster;
}

PgCluster::PgCluster() : dir_(QDir::tempPath() + QStringLiteral("/pelmar-pg-XXXXXX")), bin_(postgresBin())
{
    if (!dir_.isValid())
        throw std::runtime_error("cannot create the cluster folder");
    QFile::setPermissions(dir_.path(),
                          QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner
                              | QFileDevice::ReadOther | QFileDevice::ExeOther | QFileDevice::ReadGroup
                              | QFileDevice::ExeGroup);
    port_ = freeLoopbackPort();
    initialise();
    start();
    waitUntilReady();
    runAsSuperuser(QStringLiteral("postgres"),
                   QStringLiteral("CREATE ROLE %1 LOGIN CREATEDB PASSWORD '%2'")
                       .arg(QLatin1String(kUser), QString::fromUtf8(kPassword).replace(u'\'', QStringLiteral("''"))));
}

PgCluster::~PgCluster()
{
    stop();
}

QString PgCluster::server() const
{
    return QStringLiteral("127.0.0.1,%1").arg(port_);
}

void PgCluster::initialise()
{
    const QString data = dir_.filePath(QStringLiteral("data"));
    QDir().mkpath(data);
    giveToOwner(data);
    run(asOwner(bin_ + QStringLiteral("/initdb"),
                {QStringLiteral("-D"), data, QStringLiteral("-U"), QStringLiteral("postgres"), QStringLiteral("-A"),
                 QStringLiteral("trust"), QStringLiteral("--auth-host=scram-sha-256"), QStringLiteral("-E"),
                 QStringLiteral("UTF8"), QStringLiteral("--locale=C.UTF-8"), QStringLiteral("--no-sync")}));
}

// The server runs under a small shell that watches this program: when the program is gone,
// the shell stops the server, so a killed test run leaves nothing behind.
void PgCluster::start()
{
    const QString data = dir_.filePath(QStringLiteral("data"));
    const QString script
        = QStringLiteral(
              "\"%1/postgres\" -D \"%2\" -p %3 -k \"%2\" -c listen_addresses=127.0.0.1 -c fsync=off "
              "-c synchronous_commit=off -c full_page_writes=off -c max_connections=60 >\"%2/server.log\" 2>&1 &\n"
              "pg=$!\n"
              "while [ -d /proc/%4 ] && kill -0 $pg 2>/dev/null; do sleep 1; done\n"
              "kill -INT $pg 2>/dev/null\n")
              .arg(bin_, data)
              .arg(port_)
              .arg(QCoreApplication::applicationPid());
    const QStringList command = asOwner(QStringLiteral("/bin/sh"), {QStringLiteral("-c"), script});
    if (!QProcess::startDetached(command.first(), command.mid(1)))
        throw std::runtime_error("cannot start the PostgreSQL server");
}

void PgCluster::waitUntilReady()
{
    QElapsedTimer timer;
    timer.start();
    while (timer.elapsed() < 60000) {
        QProcess ready;
        ready.start(bin_ + QStringLiteral("/pg_isready"),
                    {QStringLiteral("-q"), QStringLiteral("-h"), dir_.filePath(QStringLiteral("data")),
                     QStringLiteral("-p"), QString::number(port_)});
        ready.waitForFinished();
        if (ready.exitCode() == 0)
            return;
        QThread::msleep(100);
    }
    throw std::runtime_error("the PostgreSQL server did not start; see its server.log");
}

void PgCluster::stop()
{
    QFile pidFile(dir_.filePath(QStringLiteral("data/postmaster.pid")));
    if (!pidFile.open(QIODevice::ReadOnly))
        return;
    const qint64 pid = pidFile.readLine().trimmed().toLongLong();
    if (pid <= 0)
        return;
    ::kill(static_cast<pid_t>(pid), SIGINT);
    QElapsedTimer timer;
    timer.start();
    while (processAlive(pid) && timer.elapsed() < 15000)
        QThread::msleep(50);
    if (processAlive(pid))
        ::kill(static_cast<pid_t>(pid), SIGKILL);
}

void PgCluster::psql(const QString& database, const QStringList& arguments)
{
    run(QStringList{bin_ + QStringLiteral("/psql"), QStringLiteral("-X"), QStringLiteral("-q"), QStringLiteral("-v"),
                    QStringLiteral("ON_ERROR_STOP=1"), QStringLiteral("-h"), dir_.filePath(QStringLiteral("data")),
                    QStringLiteral("-p"), QString::number(port_), QStringLiteral("-U"), QStringLiteral("postgres"),
                    QStringLiteral("-d"), database}
        + arguments);
}

void PgCluster::runAsSuperuser(const QString& database, const QString& sql)
{
    psql(database, {QStringLiteral("-c"), sql});
}

void PgCluster::createDatabase(const QString& name, const QStringList& sqlScripts)
{
    runAsSuperuser(QStringLiteral("postgres"), QStringLiteral("DROP DATABASE IF EXISTS \"%1\"").arg(name));
    runAsSuperuser(QStringLiteral("postgres"),
                   QStringLiteral("CREATE DATABASE \"%1\" OWNER %2").arg(name, QLatin1String(kUser)));
    QStringList arguments{QStringLiteral("-c"), QStringLiteral("SET ROLE %1").arg(QLatin1String(kUser))};
    for (const QString& script : sqlScripts)
        arguments << QStringLiteral("-c") << script;
    psql(name, arguments);
}

}  // namespace pelmar::test
