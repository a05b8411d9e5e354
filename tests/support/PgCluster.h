#pragma once

#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <memory>

namespace pelmar::test {

// A private PostgreSQL server on 127.0.0.1 and a free port, in a temporary folder, run as the
// "postgres" user when the tests run as root. It is stopped by its process id when the object is
// destroyed, and a watchdog stops it when the test program dies without cleaning up.
// Statements written for SQL Server reach it through psqlODBC ("PostgreSQL Unicode").
class PgCluster {
public:
    static constexpr const char* kDriver = "PostgreSQL Unicode";
    static constexpr const char* kUser = "pelmar";
    static constexpr const char* kPassword = "Pel;m}a=r'1";

    // The cluster shared by the tests of one program, started on first use.
    static PgCluster& shared();

    PgCluster();
    ~PgCluster();

    int port() const { return port_; }
    // "127.0.0.1,<port>": the server setting that reaches this cluster.
    QString server() const;

    // Creates a database owned by kUser and runs the scripts in it as kUser. An existing
    // database of that name is dropped first.
    void createDatabase(const QString& name, const QStringList& sqlScripts = {});
    // Runs a statement as the superuser; throws std::runtime_error on failure.
    void runAsSuperuser(const QString& database, const QString& sql);

private:
    void initialise();
    void start();
    void waitUntilReady();
    void stop();
    void psql(const QString& database, const QStringList& arguments);

    QTemporaryDir dir_;
    QString bin_;
    int port_ = 0;
};

// A port on 127.0.0.1 that nothing listens on right now.
int freeLoopbackPort();

// A socket on 127.0.0.1 that accepts connections and never answers: a server that hangs.
class SilentServer {
public:
    SilentServer();
    ~SilentServer();
    int port() const { return port_; }

private:
    int socket_ = -1;
    int port_ = 0;
};

}  // namespace pelmar::test
