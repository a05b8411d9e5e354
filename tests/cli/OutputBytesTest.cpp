// Every file an output writes, over a set of option combinations, compared with the bytes it wrote
// when the set was recorded (as SHA-256 digests in tests/data/output-digests.txt). A change that
// alters any output in any of these combinations fails here and names the combination.
//
// To record the digests again (only when an output is meant to change):
//   PELMAR_RECORD_DIGESTS=$PWD/tests/data/output-digests.txt build/tests/test_cli --gtest_filter='OutputBytes*'

#include "cli/Program.h"
#include "settings/SettingsStore.h"
#include "support/LabelCompany.h"
#include "support/MemoryCompany.h"

#include <QCryptographicHash>
#include <QDate>
#include <QFile>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

struct Combination {
    QString name;
    QString database;
    QStringList arguments;  // command and options; "-o FILE" is added for every command but sql
};

CompanyOptions generated(int level)
{
    CompanyOptions options;
    options.seed = 7;
    options.cards = 150;
    options.schemaLevel = level;
    return options;
}

const MemoryCompany& company()
{
    static const MemoryCompany memory(generated(1));
    return memory;
}

// Three cards of the generated company, picked by hand in an order of their own.
QStringList handPicked()
{
    QStringList arguments;
    for (const int row : {20, 3, 11})
        arguments << u"--card"_s << company().rows(u"OCRD"_s).at(row).value(u"CardCode"_s).toString();
    return arguments;
}

QStringList sets(const QStringList& assignments)
{
    QStringList arguments;
    for (const QString& assignment : assignments)
        arguments << u"--set"_s << assignment;
    return arguments;
}

QStringList allLines()
{
    QStringList assignments;
    for (int line = 0; line <= 12; ++line)
        assignments << u"ChkTitle_%1=1"_s.arg(line);
    return sets(assignments);
}

const QStringList kDocuments = sets({u"ChkDates=1"_s, u"TxtFromDate=1/1/10"_s, u"TxtToDate=31/12/15"_s});

QList<Combination> labelCombinations()
{
    return {
        {u"labels newer"_s, u"gen1"_s, QStringList{u"labels"_s} + allLines()},
        {u"labels older"_s, u"gen0"_s, QStringList{u"labels"_s} + allLines()},
        {u"labels mailing city descending"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines() + sets({u"cmbAddressFrom=0"_s, u"CmbSortBy=2"_s, u"CmbSortDir=1"_s})},
        {u"labels card address by zip"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines() + sets({u"cmbAddressFrom=1"_s, u"CmbSortBy=3"_s})},
        {u"labels document address by name"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines() + kDocuments + sets({u"CmbSortBy=1"_s})},
        {u"labels checks by city"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines() + kDocuments + sets({u"CmbDocType=6"_s, u"CmbSortBy=2"_s})},
        {u"labels every contact with its address"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines()
             + sets({u"ChkAllContact=1"_s, u"chkUseCntctAddrss=1"_s, u"CmbSortBy=4"_s, u"cmbAddressFrom=0"_s})},
        {u"labels contact template"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines()
             + sets({u"cmbLabFormat=1"_s, u"chkDeptNewLine=1"_s, u"chkShowAttn=0"_s, u"LblDept=1"_s})},
        {u"labels layout"_s, u"gen1"_s,
         QStringList{u"labels"_s}
             + sets({u"ChkTitle_2=1"_s, u"ChkTitle_5=1"_s, u"txtRows=4"_s, u"txtCols=2"_s, u"txtStartFrom=3"_s,
                     u"txtCopies=2"_s})},
        {u"labels address by expression"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines() + sets({u"ChkAddressBySQL=1"_s, u"txtSQLAddress=OCRD.Notes"_s})},
        {u"labels supplier groups"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines() + sets({u"cmbCS=1"_s}) + QStringList{u"--groups"_s, u"105,106,108"_s}},
        {u"labels properties and city"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines() + sets({u"ChkCity=1"_s, u"TxtCity=ח"_s})
             + QStringList{u"--properties"_s, u"3,7"_s, u"--relation"_s, u"OR"_s}},
        {u"labels hand-picked"_s, u"gen1"_s, QStringList{u"labels"_s} + allLines() + handPicked()},
        {u"labels mobile descending"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines() + sets({u"CmbSortBy=5"_s, u"CmbSortDir=1"_s})},
        {u"labels items and agent"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines()
             + sets({u"ChkItems=1"_s, u"txtFromItem=I0010"_s, u"txtToItem=I0050"_s, u"ChkAgent=1"_s, u"CmbAgent=2"_s})},
        {u"labels contact mobile"_s, u"gen1"_s,
         QStringList{u"labels"_s} + allLines()
             + sets({u"ChkPhone=1"_s, u"cmbPhoneType=4"_s, u"txtPhone=05"_s, u"ChkAllContact=1"_s})},
        {u"labels hand-made"_s, u"labels"_s, QStringList{u"labels"_s} + allLines() + sets({u"cmbAddressFrom=0"_s})},
        {u"labels hand-made older"_s, u"older"_s, QStringList{u"labels"_s} + allLines()},
    };
}

QList<Combination> listCombinations()
{
    QList<Combination> combinations;
    for (int kind = 2; kind <= 6; ++kind) {
        const QStringList list = {u"list"_s, u"--kind"_s, QString::number(kind)};
        const QString name = u"list %1 "_s.arg(kind);
        combinations << Combination{name + u"newer"_s, u"gen1"_s, list}
                     << Combination{name + u"older"_s, u"gen0"_s, list}
                     << Combination{name + u"card address by city descending"_s, u"gen1"_s,
                                    list + sets({u"cmbAddressFrom=1"_s, u"CmbSortBy=2"_s, u"CmbSortDir=1"_s})}
                     << Combination{name + u"documents every contact"_s, u"gen1"_s,
                                    list + kDocuments + sets({u"ChkAllContact=1"_s, u"CmbSortBy=4"_s})}
                     << Combination{name + u"hand-picked"_s, u"gen1"_s, list + handPicked()}
                     << Combination{name + u"hand-made"_s, u"labels"_s, list};
    }
    combinations << Combination{u"list 2 layout"_s, u"gen1"_s,
                                QStringList{u"list"_s, u"--kind"_s, u"2"_s}
                                    + sets({u"txtRows=5"_s, u"txtCols=4"_s, u"txtCopies=3"_s})};
    return combinations;
}

QList<Combination> smsCombinations()
{
    return {
        {u"sms newer"_s, u"gen1"_s, {u"sms"_s}},
        {u"sms older"_s, u"gen0"_s, {u"sms"_s}},
        {u"sms every contact by mobile descending"_s, u"gen1"_s,
         QStringList{u"sms"_s} + sets({u"ChkAllContact=1"_s, u"CmbSortBy=5"_s, u"CmbSortDir=1"_s})},
        {u"sms hand-picked"_s, u"gen1"_s, QStringList{u"sms"_s} + handPicked()},
        {u"sms hand-made"_s, u"labels"_s, {u"sms"_s}},
    };
}

QList<Combination> cardCombinations()
{
    QList<Combination> combinations;
    const auto& cards = company().rows(u"OCRD"_s);
    for (qsizetype i = 0; i < cards.size(); i += 15) {
        const QString code = cards[i].value(u"CardCode"_s).toString();
        for (const QString& database : {u"gen1"_s, u"gen0"_s})
            combinations << Combination{u"card %1 %2"_s.arg(code, database), database, {u"card"_s, code}};
    }
    for (const QString& code : {u"C1"_s, u"C2"_s, u"C5"_s, u"X'1"_s, u"M1"_s})
        combinations << Combination{u"card %1 older"_s.arg(code), u"older"_s, {u"card"_s, code}};
    combinations << Combination{u"card C1 hand-made"_s, u"labels"_s, {u"card"_s, u"C1"_s}};
    return combinations;
}

QList<Combination> sqlCombinations()
{
    QList<Combination> combinations;
    for (int kind = 1; kind <= 6; ++kind) {
        const QStringList sql = {u"sql"_s, u"--kind"_s, QString::number(kind), u"--all-details"_s};
        combinations << Combination{u"sql %1 plain"_s.arg(kind), u"gen1"_s, sql}
                     << Combination{u"sql %1 documents by name"_s.arg(kind), u"gen1"_s,
                                    sql + kDocuments + sets({u"CmbDocType=6"_s, u"CmbSortBy=1"_s})}
                     << Combination{u"sql %1 every criterion"_s.arg(kind), u"gen0"_s,
                                    sql
                                        + sets({u"ChkCatCode=1"_s, u"ChkAccKey=1"_s, u"TxtFromCrd=A'"_s,
                                                u"TxtToCrd=Z"_s, u"ChkCity=1"_s, u"TxtCity=x"_s, u"ChkPhone=1"_s,
                                                u"cmbPhoneType=2"_s, u"ChkUseSQLW=1"_s, u"txtSQLWhere=1=1"_s,
                                                u"chkFaxField_4=1"_s, u"txtFaxExpr_4=OCRD.Phone2"_s, u"CmbSortBy=4"_s,
                                                u"CmbSortDir=1"_s, u"ChkAllContact=1"_s, u"cmbAddressFrom=1"_s})
                                        + kDocuments
                                        + QStringList{u"--properties"_s, u"1,64"_s, u"--groups"_s, u"100"_s}};
    }
    return combinations;
}

QList<Combination> allCombinations()
{
    return labelCombinations() + listCombinations() + smsCombinations() + cardCombinations() + sqlCombinations();
}

class OutputBytes : public Isolated {
protected:
    void SetUp() override
    {
        Isolated::SetUp();
        engine->createCompany(u"gen1"_s, generated(1));
        engine->createCompany(u"gen0"_s, generated(0));
        engine->createDatabase(u"labels"_s, handMadeCompany(900000, labelCards()));
        engine->createDatabase(u"older"_s, handMadeCompany(61000, labelCards() + oddCards()));
        SettingsStore store(configFolder());
        store.setValue(u"Pelmar"_s, u"Params"_s, u"ConnServer"_s, engine->server());
        store.setValue(u"Pelmar"_s, u"Params"_s, u"ConnUID"_s, engine->user());
        // Styles of their own for three lines, so that the style rules are part of the bytes.
        store.setValue(u"Pelmar"_s, u"LabelDef1"_s, u"Font"_s, u"1"_s);
        store.setValue(u"Pelmar"_s, u"LabelDef1"_s, u"FontWeight"_s, u"2"_s);
        store.setValue(u"Pelmar"_s, u"LabelDef3"_s, u"FontItalic"_s, u"1"_s);
        store.setValue(u"Pelmar"_s, u"LabelDef11"_s, u"FixedText"_s, u"<לקוח> & \"חבר\""_s);
        store.setValue(u"Pelmar"_s, u"LabelDef12"_s, u"FontUL"_s, u"1"_s);
        store.setValue(u"Pelmar"_s, u"LabelDef12"_s, u"FixedText"_s, u"מבצע"_s);
    }

    // Runs one combination and returns the digest of what it wrote, with the list's date made
    // neutral; or a description of the failure.
    QString digestOf(const Combination& combination)
    {
        SettingsStore(configFolder()).setValue(u"Pelmar"_s, u"Params"_s, u"ConnDataBase"_s, combination.database);
        const QString output = path(u"output"_s);
        QFile::remove(output);
        QStringList arguments = combination.arguments;
        if (arguments.first() != u"sql"_s)
            arguments << u"-o"_s << output;
        const ProgramResult result = runProgram(folder(), arguments);
        if (result.exit != 0)
            return u"failed: "_s + result.err;
        QByteArray bytes = arguments.first() == u"sql"_s ? result.out.toUtf8() : readFile(output);
        bytes.replace(QDate::currentDate().toString(u"dd/MM/yyyy"_s).toLatin1(), "DD/MM/YYYY");
        return QString::fromLatin1(QCryptographicHash::hash(bytes, QCryptographicHash::Sha256).toHex());
    }

    std::unique_ptr<Engine> engine = makeSqliteEngine();
};

QMap<QString, QString> recordedDigests()
{
    QMap<QString, QString> digests;
    const QString text = QString::fromUtf8(readFile(QStringLiteral(PELMAR_TEST_DATA "/output-digests.txt")));
    for (const QString& line : text.split(u'\n', Qt::SkipEmptyParts)) {
        const qsizetype blank = line.indexOf(u' ');
        digests.insert(line.mid(blank + 1), line.left(blank));
    }
    return digests;
}

TEST_F(OutputBytes, EveryOutputWritesTheBytesItWroteWhenRecorded)
{
    const QString recordTo = qEnvironmentVariable("PELMAR_RECORD_DIGESTS");
    const QMap<QString, QString> recorded = recordedDigests();
    QString record;
    for (const Combination& combination : allCombinations()) {
        const QString digest = digestOf(combination);
        ASSERT_FALSE(digest.startsWith(u"failed"_s)) << combination.name.toStdString() << ": " << digest.toStdString();
        if (!recordTo.isEmpty())
            record += digest + u' ' + combination.name + u'\n';
        else
            EXPECT_EQ(digest, recorded.value(combination.name, u"<not recorded>"_s)) << combination.name.toStdString();
    }
    if (!recordTo.isEmpty())
        writeFile(recordTo, record.toUtf8());
}

}  // namespace
}  // namespace pelmar::test
