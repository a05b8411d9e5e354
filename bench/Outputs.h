#pragma once

#include <QString>
#include <QStringList>

namespace pelmar {
class DatabaseClient;
}

namespace pelmar::bench {

// One output measured by the runner: the statements it reads (the floor reads them to the end)
// and the run itself, which writes its file to path.
struct BenchOutput {
    QString name;
    QStringList (*statements)();
    void (*run)(const DatabaseClient& client, const QString& connString, const QString& path);
};

const QList<BenchOutput>& benchOutputs();
const BenchOutput* benchOutput(const QString& name);

}  // namespace pelmar::bench
