#include "support/Isolated.h"

#include <QDir>
#include <QFile>

namespace pelmar::test {

void Isolated::SetUp()
{
    ASSERT_TRUE(dir_.isValid());
    QDir().mkpath(path(QStringLiteral("temp")));
    savedConfig_ = qgetenv("XDG_CONFIG_HOME");
    savedTemp_ = qgetenv("Temp");
    savedData_ = qgetenv("XDG_DATA_HOME");
    qputenv("XDG_CONFIG_HOME", path(QStringLiteral("config")).toUtf8());
    qputenv("XDG_DATA_HOME", path(QStringLiteral("data")).toUtf8());
    qputenv("Temp", path(QStringLiteral("temp")).toUtf8());
}

void Isolated::TearDown()
{
    qputenv("XDG_CONFIG_HOME", savedConfig_);
    qputenv("XDG_DATA_HOME", savedData_);
    if (savedTemp_.isEmpty())
        qunsetenv("Temp");
    else
        qputenv("Temp", savedTemp_);
}

QString Isolated::fileWith(const QString& name, const QByteArray& bytes) const
{
    writeFile(path(name), bytes);
    return path(name);
}

QByteArray readFile(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

void writeFile(const QString& path, const QByteArray& bytes)
{
    QFile file(path);
    if (file.open(QIODevice::WriteOnly | QIODevice::Truncate))
        file.write(bytes);
}

}  // namespace pelmar::test
