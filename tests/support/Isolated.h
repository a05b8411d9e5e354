#pragma once

#include "support/QtPrinting.h"

#include <QString>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace pelmar::test {

// A test with a folder of its own: the settings store ($XDG_CONFIG_HOME), the data folder
// ($XDG_DATA_HOME) and the temporary folder (Temp) point into it while the test runs.
class Isolated : public ::testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    QString folder() const { return dir_.path(); }
    QString path(const QString& name) const { return dir_.filePath(name); }
    QString configFolder() const { return path(QStringLiteral("config/Pelmar")); }
    QString tempPath(const QString& name) const { return path(QStringLiteral("temp/") + name); }
    // Writes a file of the test's own folder and returns its path.
    QString fileWith(const QString& name, const QByteArray& bytes) const;

private:
    QTemporaryDir dir_;
    QByteArray savedConfig_;
    QByteArray savedTemp_;
    QByteArray savedData_;
};

// Reads a whole file; empty when it cannot be read.
QByteArray readFile(const QString& path);
void writeFile(const QString& path, const QByteArray& bytes);

}  // namespace pelmar::test
