#include "selection/PickerData.h"

#include "common/Failure.h"
#include "common/Fields.h"
#include "common/UserText.h"
#include "db/DatabaseClient.h"
#include "selection/DocTypes.h"

#include <QFile>
#include <QRegularExpression>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

constexpr int kBatch = 5000;

QString nameOrDash(const QVariant& value)
{
    const QString name = TrimField(value);
    return name.isEmpty() ? u"-"_s : name;
}

// The field of a line: the start moves past one tab per column after the first, falling back to
// the line's start when the tabs run out; the field ends at the next tab or at the line's end.
QString fieldOf(const QString& line, int column)
{
    qsizetype start = 0;
    for (int k = 2; k <= column; ++k) {
        const qsizetype tab = line.indexOf(u'\t', start);
        start = tab < 0 ? 0 : tab + 1;
    }
    const qsizetype end = line.indexOf(u'\t', start);
    return end < 0 ? line.mid(start) : line.mid(start, end - start);
}

}  // namespace

void readCardGroups(const DatabaseClient& client, const QString& connString, short cardType,
                    QVector<CheckListModel::Row>& rows)
{
    QString statement = u"SELECT * FROM OCRG"_s;
    if (cardType >= 0)
        statement += u" WHERE GroupType='"_s + CardTypeCode(cardType, true) + u"'"_s;
    statement += u" ORDER BY GroupType, GroupCode"_s;
    for (auto groups = client.open(statement, connString); !groups->eof(); groups->moveNext())
        rows.append(
            {QString::number(groups->value(u"GroupCode"_s).toInt()), {nameOrDash(groups->value(u"GroupName"_s))}});
}

QVector<CheckListModel::Row> unnamedProperties()
{
    QVector<CheckListModel::Row> rows;
    for (int n = 1; n <= 64; ++n)
        rows.append({QString::number(n), {u"-"_s}});
    return rows;
}

void nameProperties(const DatabaseClient& client, const QString& connString, QVector<CheckListModel::Row>& properties)
{
    for (auto names = client.open(u"SELECT * FROM OCQG Order By GroupCode"_s, connString); !names->eof();
         names->moveNext()) {
        const int n = names->value(u"GroupCode"_s).toInt();
        if (n >= 1 && n <= 64)
            properties[n - 1].texts = {nameOrDash(names->value(u"GroupName"_s))};
    }
}

void readCardList(const DatabaseClient& client, const QString& connString, const QString& statement,
                  const std::function<void(const QVector<CheckListModel::Row>&)>& batch)
{
    QVector<CheckListModel::Row> rows;
    rows.reserve(kBatch);
    auto cards = client.open(statement, connString);
    const int code = cards->requiredColumn(u"CardCode"_s);
    const int name = cards->requiredColumn(u"CardName"_s);
    for (; !cards->eof(); cards->moveNext()) {
        const QString key = TrimField(cards->valueAt(code));
        if (key.isEmpty())
            continue;
        rows.append({key, {key, nameOrDash(cards->valueAt(name))}});
        if (rows.size() == kBatch) {
            batch(rows);
            rows.clear();
        }
    }
    batch(rows);
}

int cardFileColumn(const QString& text)
{
    bool ok = false;
    const int column = text.trimmed().toInt(&ok);
    if (!ok || column < 1 || column > 32767)
        throw Failure(u"מספר העמודה \"%1\" אינו תקין: יש לכתוב מספר שלם מ-1 ומעלה."_s.arg(text), 13);
    return column;
}

QStringList readCardFile(const QString& path, int column, bool skipFirstLine)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        throw Failure(u"לא ניתן לקרוא את הקובץ %1: %2"_s.arg(path, file.errorString()), 53);
    static const QRegularExpression lineEnd(u"\r\n|\r|\n"_s);
    QStringList lines = decodeUserText(file.readAll()).split(lineEnd);
    if (!lines.isEmpty() && lines.last().isEmpty())
        lines.removeLast();
    if (skipFirstLine && !lines.isEmpty())
        lines.removeFirst();
    QStringList codes;
    for (const QString& line : lines)
        codes << fieldOf(line, column);
    return codes;
}

}  // namespace pelmar
