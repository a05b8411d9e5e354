#pragma once

#include "db/DatabaseClient.h"
#include "demo/CompanyGenerator.h"

#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <memory>

namespace pelmar::test {

// A database server a test can create company databases on: the embedded engine in a folder of
// its own, or the shared PostgreSQL cluster reached through ODBC with SQL Server strings.
class Engine {
public:
    virtual ~Engine() = default;
    virtual const char* name() const = 0;

    // Creates (or replaces) the database and runs the statements in it, one by one.
    virtual void createDatabase(const QString& database, const QStringList& statements) = 0;
    // Creates (or replaces) a generated company database.
    virtual void createCompany(const QString& database, const CompanyOptions& options) = 0;
    // Creates (or replaces) "sbo-common" listing the companies (database name, company name).
    virtual void createCommon(const QList<QPair<QString, QString>>& companies) = 0;
    // The server, user and password settings that reach the engine.
    virtual QString server() const = 0;
    virtual QString user() const = 0;
    virtual QString password() const = 0;

    // The connection string of a database, as BuildConnString makes it.
    QString connString(const QString& database) const;
    // A client that opens this engine's connection strings.
    const DatabaseClient& client() const { return client_; }

protected:
    explicit Engine(const QString& driver) : client_(driver) {}

private:
    DatabaseClient client_;
};

std::unique_ptr<Engine> makeSqliteEngine();
std::unique_ptr<Engine> makePostgresEngine();

// The factories, for parameterised tests over both engines.
using EngineFactory = std::unique_ptr<Engine> (*)();
std::string engineName(const ::testing::TestParamInfo<EngineFactory>& info);

}  // namespace pelmar::test
