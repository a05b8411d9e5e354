// Every file an output writes, over the combinations of options in tests/data/output-digests.txt,
// compared with the bytes it wrote when they were recorded (SHA-256 digests). A change that alters
// an output in any of them fails here and names the command line.
//
// To record the digests again (only when an output is meant to change):
//   PELMAR_RECORD_DIGESTS=1 build/tests/test_cli --gtest_filter='OutputBytes*'

#include "cli/Program.h"
#include "settings/SettingsStore.h"
#include "support/LabelCompany.h"

#include <QCryptographicHash>
#include <QDate>
#include <QFile>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

const QString kDigests = QStringLiteral(PELMAR_TEST_DATA "/output-digests.txt");

CompanyOptions generated(int level)
{
    CompanyOptions options;
    options.seed = 7;
    options.cards = 150;
    options.schemaLevel = level;
    return options;
}

// The generated companies of both schema levels and the hand-made ones, with label styles of
// their own for three lines, so that the style rules are part of the bytes.
class OutputBytes : public Isolated {
protected:
    void SetUp() override
    {
        Isolated::SetUp();
        engine->createCompany(u"gen1"_s, generated(1));
        engine->createCompany(u"gen0"_s, generated(0));
        engine->createDatabase(u"labels"_s, handMadeCompany(900000, labelCards()));
        engine->createDatabase(u"older"_s, handMadeCompany(61000, labelCards() + oddCards()));
        const std::tuple<const char16_t*, const char16_t*, QString> settings[]
            = {{u"Params", u"ConnServer", engine->server()},
               {u"Params", u"ConnUID", engine->user()},
               {u"LabelDef1", u"Font", u"1"_s},
               {u"LabelDef1", u"FontWeight", u"2"_s},
               {u"LabelDef3", u"FontItalic", u"1"_s},
               {u"LabelDef11", u"FixedText", u"<לקוח> & \"חבר\""_s},
               {u"LabelDef12", u"FontUL", u"1"_s},
               {u"LabelDef12", u"FixedText", u"מבצע"_s}};
        for (const auto& [section, key, value] : settings)
            SettingsStore(configFolder())
                .setValue(u"Pelmar"_s, QString::fromUtf16(section), QString::fromUtf16(key), value);
    }

    // Runs one command line on the database and returns the digest of what it wrote, with the
    // list's date made neutral; or a description of the failure.
    QString digestOf(const QString& database, QStringList arguments)
    {
        SettingsStore(configFolder()).setValue(u"Pelmar"_s, u"Params"_s, u"ConnDataBase"_s, database);
        const QString output = path(u"output"_s);
        QFile::remove(output);
        const bool statement = arguments.first() == u"sql"_s;
        if (!statement)
            arguments << u"-o"_s << output;
        const ProgramResult result = runProgram(folder(), arguments);
        if (result.exit != 0)
            return u"failed: "_s + result.err;
        QByteArray bytes = statement ? result.out.toUtf8() : readFile(output);
        bytes.replace(QDate::currentDate().toString(u"dd/MM/yyyy"_s).toLatin1(), "DD/MM/YYYY");
        return QString::fromLatin1(QCryptographicHash::hash(bytes, QCryptographicHash::Sha256).toHex());
    }

    std::unique_ptr<Engine> engine = makeSqliteEngine();
};

TEST_F(OutputBytes, EveryOutputWritesTheBytesItWroteWhenRecorded)
{
    const bool recording = !qEnvironmentVariableIsEmpty("PELMAR_RECORD_DIGESTS");
    QStringList lines = QString::fromUtf8(readFile(kDigests)).split(u'\n', Qt::SkipEmptyParts);
    int combinations = 0;
    for (QString& line : lines) {
        if (line.startsWith(u'#'))
            continue;
        const QString recorded = line.section(u' ', 0, 0);
        const QString database = line.section(u' ', 1, 1);
        const QString command = line.section(u' ', 2);
        const QString digest = digestOf(database, QProcess::splitCommand(command));
        ASSERT_FALSE(digest.startsWith(u"failed"_s)) << command.toStdString() << ": " << digest.toStdString();
        EXPECT_TRUE(recording || digest == recorded) << database.toStdString() << ": " << command.toStdString();
        line = digest + u' ' + database + u' ' + command;
        ++combinations;
    }
    EXPECT_GT(combinations, 90);
    if (recording)
        writeFile(kDigests, (lines.join(u'\n') + u'\n').toUtf8());
}

}  // namespace
}  // namespace pelmar::test
