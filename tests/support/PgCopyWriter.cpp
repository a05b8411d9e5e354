#include "support/PgCopyWriter.h"

#include "demo/CompanySchema.h"

#include <QDate>
#include <QDir>

namespace pelmar::test {

namespace {

QByteArray copyField(const QVariant& value)
{
    if (value.isNull())
        return "\\N";
    QString text = value.typeId() == QMetaType::QDate ? value.toDate().toString(Qt::ISODate) : value.toString();
    text.replace(QStringLiteral("\\"), QStringLiteral("\\\\"))
        .replace(QStringLiteral("\t"), QStringLiteral("\\t"))
        .replace(QStringLiteral("\n"), QStringLiteral("\\n"))
        .replace(QStringLiteral("\r"), QStringLiteral("\\r"));
    return text.toUtf8();
}

}  // namespace

PgCopyWriter::PgCopyWriter(QString folder) : folder_(std::move(folder))
{
    QDir().mkpath(folder_);
}

void PgCopyWriter::add(const TableSchema& table, const QVariantList& values)
{
    auto& file = files_[table.name];
    if (!file) {
        file = std::make_shared<QFile>(QDir(folder_).filePath(table.name + QStringLiteral(".copy")));
        file->open(QIODevice::WriteOnly | QIODevice::Truncate);
        columns_[table.name] = table.columns.join(QStringLiteral(", "));
    }
    QByteArray line;
    for (int i = 0; i < values.size(); ++i) {
        if (i)
            line += '\t';
        line += copyField(values.at(i));
    }
    line += '\n';
    file->write(line);
}

QStringList PgCopyWriter::finish()
{
    QStringList commands;
    for (auto it = files_.begin(); it != files_.end(); ++it) {
        it.value()->close();
        commands
            << QStringLiteral("\\copy %1 (%2) from '%3'").arg(it.key(), columns_[it.key()], it.value()->fileName());
    }
    return commands;
}

}  // namespace pelmar::test
