#include "common/Failure.h"
#include "options/MailingOptions.h"
#include "selection/CheckListModel.h"
#include "selection/PickerData.h"
#include "selection/SalesEmployees.h"
#include "support/Engines.h"
#include "support/FailureOf.h"
#include "support/Isolated.h"

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
    QString file(const QByteArray& bytes) const { return fileWith(u"cards.txt"_s, bytes); }
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

// A picker's list: key, a code and a name, the check box in the first column.
class PickerList : public CheckListModel {
public:
    PickerList() : CheckListModel({u"v"_s, u"code"_s, u"name"_s}, {CheckListModel::kCheckColumn, 0, 1})
    {
        setRows({{u"a"_s, {u"100"_s, u"beta"_s}},
                 {u"b"_s, {u"x"_s, u"Alpha"_s}},
                 {u"c"_s, {u"20"_s, u"alpine"_s}},
                 {u"d"_s, {u"3.5"_s, u"Gamma"_s}}});
    }
};

TEST(Properties, OnlyTheSixtyFourPropertiesTakeANameFromTheTable)
{
    const auto engine = makeSqliteEngine();
    engine->createDatabase(u"props"_s,
                           {u"CREATE TABLE OCQG (GroupCode INTEGER, GroupName VARCHAR(30))"_s,
                            u"INSERT INTO OCQG VALUES (0, 'zero'), (1, 'first'), (64, 'last'), (65, 'past')"_s});
    QVector<CheckListModel::Row> properties = unnamedProperties();
    nameProperties(engine->client(), engine->connString(u"props"_s), properties);
    ASSERT_EQ(properties.size(), 64);
    EXPECT_EQ(properties.front().texts, QStringList{u"first"_s});
    EXPECT_EQ(properties.back().texts, QStringList{u"last"_s});
    EXPECT_EQ(properties[1].texts, QStringList{u"-"_s}) << "a property the table does not name";
}

TEST(SalesEmployees, TheListIsRefilledFromTheTableAndKeptWhenTheTableIsEmpty)
{
    const auto engine = makeSqliteEngine();
    const auto company = [&](const QString& name, const QStringList& rows) {
        engine->createDatabase(name, QStringList{u"CREATE TABLE OSLP (SlpCode INTEGER, SlpName VARCHAR(30))"_s} + rows);
        return engine->connString(name);
    };
    MailingOptions options;
    options.agents = {{u"old"_s, 9}};
    FillCmbAgent(engine->client(),
                 company(u"sales"_s,
                         {u"INSERT INTO OSLP VALUES (4, ' דנה ')"_s, u"INSERT INTO OSLP VALUES (2, '')"_s,
                          u"INSERT INTO OSLP VALUES (3, NULL)"_s, u"INSERT INTO OSLP VALUES (1, 'Yossi')"_s}),
                 options);
    const QList<SalesEmployee> employees = {{u"דנה"_s, 4}, {u"Yossi"_s, 1}};
    EXPECT_EQ(options.agents, employees) << "in the table's order, trimmed, the nameless left out";
    EXPECT_EQ(options.agentIndex, -1) << "a refilled list has nothing chosen";
    options.agentIndex = 1;
    FillCmbAgent(engine->client(), company(u"none"_s, {}), options);
    EXPECT_EQ(options.agents, employees) << "an empty table keeps the list";
    EXPECT_EQ(options.agentIndex, 1);
    FillCmbAgent(engine->client(), engine->connString(u"missing"_s), options);
    EXPECT_EQ(options.agents, employees) << "so does a database that cannot be read";
    FillCmbAgent(engine->client(), company(u"nameless"_s, {u"INSERT INTO OSLP VALUES (5, '  ')"_s}), options);
    EXPECT_TRUE(options.agents.isEmpty());
    EXPECT_EQ(options.agentIndex, -1);
}

TEST(CheckListModel, TextsSortWithNumbersByValueFirstThenWithoutRegardToCase)
{
    PickerList model;
    model.sortByText(0);
    EXPECT_EQ(texts(model), (QStringList{u"3.5"_s, u"20"_s, u"100"_s, u"x"_s}));
    model.sortByText(1);
    EXPECT_EQ(texts(model, 1), (QStringList{u"Alpha"_s, u"alpine"_s, u"beta"_s, u"Gamma"_s}));
    model.setChecked(2, true);
    model.setChecked(3, true);
    model.sortByCheckThenText(0);
    EXPECT_EQ(model.checkedKeys(), (QStringList{u"d"_s, u"a"_s})) << "checked first, then by the text";
    EXPECT_EQ(texts(model), (QStringList{u"3.5"_s, u"100"_s, u"20"_s, u"x"_s}));
}

TEST(CheckListModel, ChecksAreSetInvertedAndSearchedAsTheGridShowsThem)
{
    PickerList model;
    QList<std::pair<QModelIndex, QModelIndex>> changed;
    QObject::connect(&model, &CheckListModel::dataChanged, [&](const QModelIndex& from, const QModelIndex& to) {
        changed.append({from, to});
    });
    EXPECT_TRUE(model.setData(model.index(1, 0), Qt::Checked, Qt::CheckStateRole));
    EXPECT_FALSE(model.setData(model.index(1, 1), Qt::Checked, Qt::CheckStateRole)) << "a text is not a check box";
    EXPECT_EQ(model.data(model.index(1, 0), Qt::CheckStateRole), QVariant(Qt::Checked));
    EXPECT_TRUE(model.flags(model.index(1, 0)) & Qt::ItemIsUserCheckable);
    EXPECT_FALSE(model.flags(model.index(1, 2)) & Qt::ItemIsUserCheckable);
    model.invertChecks();
    EXPECT_EQ(model.checkedKeys(), (QStringList{u"a"_s, u"c"_s, u"d"_s}));
    model.setAllChecked(false);
    EXPECT_TRUE(model.checkedKeys().isEmpty());
    ASSERT_EQ(changed.size(), 3);
    EXPECT_EQ(changed[0], std::make_pair(model.index(1, 0), model.index(1, 0)));
    EXPECT_EQ(changed[2], std::make_pair(model.index(0, 0), model.index(3, 2))) << "every row and column is shown anew";

    model.setRows({{u"1"_s, {u"O'Brien & Sons <Ltd>"_s, u"+972-4-8123456"_s}}});
    EXPECT_EQ(model.data(model.index(0, 1), Qt::DisplayRole).toString(), u"\u2068O'Brien & Sons <Ltd>\u2069"_s)
        << "a value shows in its own direction, isolated from the grid's";
    EXPECT_EQ(model.row(0).texts.front(), u"O'Brien & Sons <Ltd>"_s) << "and is kept as stored";
}

TEST(CheckListModel, APrefixIsFoundFromTheTopWithoutRegardToCase)
{
    PickerList model;
    EXPECT_EQ(model.findPrefix(1, u"ALP"_s), 1) << "the first from the top, without regard to case";
    EXPECT_EQ(model.findPrefix(1, u"gamma!"_s), -1);
    EXPECT_EQ(model.findPrefix(1, QString()), -1) << "an empty search finds nothing";
}

}  // namespace
}  // namespace pelmar::test
