#pragma once

#include <QString>
#include <QStringList>

namespace pelmar {
class DatabaseClient;
struct SessionState;
}  // namespace pelmar

namespace pelmar::bench {

// One output measured by the runner: the statements it reads (the floor reads them to the end)
// and the run itself, through the operation the output's run button starts, writing its file to
// path. The session holds the connection settings of the company measured.
struct BenchOutput {
    QString name;
    QStringList (*statements)(const SessionState& state);
    void (*run)(const DatabaseClient& client, SessionState& state, const QString& path);
};

const QList<BenchOutput>& benchOutputs();
const BenchOutput* benchOutput(const QString& name);

}  // namespace pelmar::bench
