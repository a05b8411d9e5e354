#include "common/Failure.h"
#include "selection/CheckListModel.h"
#include "selection/PickerData.h"
#include "support/Engines.h"
#include "support/Isolated.h"
#include "support/FailureOf.h"

#include <QSet>

#include <algorithm>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

QStringList texts(const CheckListModel& model, int textIndex = 0)
{
    QStringList found;
    for (const auto& row : model.rows())
        found << row.texts.value(textIndex);
    return found;
}

class CardFileTest : public Isolated {
protected:
    QString file(const QByteArray& bytes)
    {
        const QString name = path(u"cards.txt"_s);
        writeFile(name, bytes);
        return name;
    }
};

TEST_F(CardFileTest, FieldsAreCutAtTabsWithTheFallbacksOfShortLines)
{
    const QString tabs = file("header\tcode\r\nA\tC001\tx\r\nB\tC002\r\nC001\r\n\tC003\t\r\nD\tC001\r\n");
    EXPECT_EQ(readCardFile(tabs, 2, true), (QStringList{u"C001"_s, u"C002"_s, u"C001"_s, u"C003"_s, u"C001"_s}))
        << "the last field of a line, a line without tabs, duplicates";
    EXPECT_EQ(readCardFile(tabs, 1, false), (QStringList{u"header"_s, u"A"_s, u"B"_s, u"C001"_s, u""_s, u"D"_s}));
    EXPECT_EQ(readCardFile(file("A\tB\r\nX\tY\tZ\r\n"), 3, false), (QStringList{u"A"_s, u"Z"_s}))
        << "column 3 on a line with a single tab falls back to the first field";
    EXPECT_EQ(readCardFile(file("\xEF\xBB\xBF"
                                "קוד\r\nא1\r\n"),
                           1, true),
              QStringList{u"א1"_s});
    EXPECT_EQ(readCardFile(file("h\rC1\rC2"), 1, true), (QStringList{u"C1"_s, u"C2"_s})) << "carriage returns alone";
    EXPECT_EQ(readCardFile(file("\xf7\xe5\xe3\r\n\xe0"
                                "1\r\n"),
                           1, true),
              QStringList{u"א1"_s})
        << "windows-1255";
    EXPECT_EQ(cardFileColumn(u" 1 "_s), 1);
    EXPECT_EQ(cardFileColumn(u"32767"_s), 32767);
    for (const QString& column : {u"two"_s, u"0"_s, u"32768"_s, u"-1"_s})
        EXPECT_EQ(failureOf([&] { cardFileColumn(column); }),
                  u"מספר העמודה \"%1\" אינו תקין: יש לכתוב מספר שלם מ-1 ומעלה."_s.arg(column));
}

TEST(CardList, CardsComeInBatchesOfFiveThousandEachCodeOnce)
{
    const auto engine = makeSqliteEngine();
    CompanyOptions options;
    options.cards = 5001;
    engine->createCompany(u"many"_s, options);
    QList<qsizetype> batches;
    QStringList codes;
    readCardList(engine->client(), engine->connString(u"many"_s),
                 u"SELECT OCRD.CardCode, OCRD.CardName FROM OCRD ORDER BY OCRD.CardCode"_s,
                 [&](const QVector<CheckListModel::Row>& rows) {
                     batches << rows.size();
                     for (const auto& row : rows)
                         codes << row.key;
                 });
    EXPECT_EQ(batches, (QList<qsizetype>{5000, 1}));
    EXPECT_EQ(QSet<QString>(codes.begin(), codes.end()).size(), 5001);
    EXPECT_TRUE(std::is_sorted(codes.begin(), codes.end())) << "in the statement's order";
}

TEST(CheckListModel, TextsSortWithNumbersByValueFirst)
{
    CheckListModel numbers({u"n"_s}, {0});
    numbers.setRows({{u"a"_s, {u"100"_s}}, {u"b"_s, {u"x"_s}}, {u"c"_s, {u"20"_s}}, {u"d"_s, {u"3.5"_s}}});
    numbers.sortByText(0);
    EXPECT_EQ(texts(numbers), (QStringList{u"3.5"_s, u"20"_s, u"100"_s, u"x"_s})) << "numbers by value";
}

}  // namespace
}  // namespace pelmar::test
