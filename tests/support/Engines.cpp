#include "support/Engines.h"

#include "db/ConnString.h"
#include "demo/CompanySchema.h"
#include "demo/SqliteCompanyWriter.h"
#include "support/PgCluster.h"
#include "support/PgCopyWriter.h"

#include <QDir>
#include <QFile>
#include <QSqlDatabase>
#include <QSqlError>
#include <QSqlQuery>

#include <gtest/gtest.h>

#include <stdexcept>

namespace pelmar::test {

QString Engine::connString(const QString& database) const
{
    return BuildConnString(server(), user(), password(), database);
}

namespace {

class SqliteEngine : public Engine {
public:
    SqliteEngine() : Engine(QStringLiteral("unused")) {}
    const char* name() const override { return "Embedded"; }

    void createDatabase(const QString& database, const QStringList& statements) override
    {
        const QString file = QDir(dir_.path()).filePath(database + QStringLiteral(".sqlite"));
        QFile::remove(file);
        const QString connection = QStringLiteral("test-writer");
        {
            QSqlDatabase db = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), connection);
            db.setDatabaseName(file);
            if (!db.open())
                throw std::runtime_error(db.lastError().text().toStdString());
            db.transaction();
            QSqlQuery query(db);
            for (const QString& statement : statements) {
                if (!query.exec(statement))
                    throw std::runtime_error(
                        (statement + QStringLiteral(": ") + query.lastError().text()).toStdString());
            }
            db.commit();
        }
        QSqlDatabase::removeDatabase(connection);
    }

    void createCompany(const QString& database, const CompanyOptions& options) override
    {
        writeSqliteCompany(QDir(dir_.path()).filePath(database + QStringLiteral(".sqlite")), options);
    }

    void createCommon(const QList<QPair<QString, QString>>& companies) override
    {
        writeSqliteCommon(QDir(dir_.path()).filePath(QStringLiteral("sbo-common.sqlite")), companies);
    }

    QString server() const override { return QStringLiteral("sqlite:") + dir_.path(); }
    QString user() const override { return QStringLiteral("pelmar"); }
    QString password() const override { return {}; }

private:
    QTemporaryDir dir_;
};

class PostgresEngine : public Engine {
public:
    PostgresEngine() : Engine(QLatin1String(PgCluster::kDriver)), cluster_(PgCluster::shared()) {}
    const char* name() const override { return "PostgreSQL"; }

    void createDatabase(const QString& database, const QStringList& statements) override
    {
        cluster_.createDatabase(database, statements);
    }

    void createCompany(const QString& database, const CompanyOptions& options) override
    {
        load(database, companyTables(), [&](RowSink& sink) { generateCompany(options, sink); });
    }

    void createCommon(const QList<QPair<QString, QString>>& companies) override
    {
        load(QStringLiteral("sbo-common"), {companyRegistryTable()}, [&](RowSink& sink) {
            for (const auto& [database, company] : companies)
                sink.add(companyRegistryTable(), {database, company, QStringLiteral("9.0")});
        });
    }

    QString server() const override { return cluster_.server(); }
    QString user() const override { return QLatin1String(PgCluster::kUser); }
    QString password() const override { return QString::fromUtf8(PgCluster::kPassword); }

private:
    template <typename Fill>
    void load(const QString& database, const QList<TableSchema>& tables, Fill fill)
    {
        QTemporaryDir files;
        PgCopyWriter writer(files.path());
        fill(writer);
        cluster_.createDatabase(database,
                                createStatements(tables) + writer.finish() + indexStatements(tables)
                                    + QStringList{QStringLiteral("ANALYZE")});
    }

    PgCluster& cluster_;
};

}  // namespace

std::unique_ptr<Engine> makeSqliteEngine()
{
    return std::make_unique<SqliteEngine>();
}

std::unique_ptr<Engine> makePostgresEngine()
{
    return std::make_unique<PostgresEngine>();
}

std::string engineName(const ::testing::TestParamInfo<EngineFactory>& info)
{
    return info.param == &makeSqliteEngine ? "Embedded" : "PostgreSQL";
}

}  // namespace pelmar::test
