#include "support/CompanyRows.h"

#include "demo/CompanySchema.h"

#include <QDate>

namespace pelmar::test {

QString insertRow(const QString& table, const QVariantMap& values)
{
    QStringList literals;
    for (const QString& column : tableNamed(table).columns) {
        const QVariant value = values.value(column);
        if (value.isNull())
            literals << QStringLiteral("NULL");
        else if (value.typeId() == QMetaType::Int)
            literals << QString::number(value.toInt());
        else if (value.typeId() == QMetaType::QDate)
            literals << QStringLiteral("'%1'").arg(value.toDate().toString(Qt::ISODate));
        else
            literals << QStringLiteral("'") + value.toString().replace(QStringLiteral("'"), QStringLiteral("''"))
                    + QStringLiteral("'");
    }
    return QStringLiteral("INSERT INTO %1 (%2) VALUES (%3)")
        .arg(table, tableNamed(table).columns.join(QStringLiteral(", ")), literals.join(QStringLiteral(", ")));
}

QStringList handMadeCompany(int version, const QStringList& rows)
{
    return createStatements(companyTables())
        + QStringList{insertRow(
            QStringLiteral("CINF"),
            {{QStringLiteral("CompnyName"), QStringLiteral("Test")}, {QStringLiteral("Version"), version}})}
    + rows;
}

}  // namespace pelmar::test
