#include "cli/CommandLine.h"
#include "support/QtPrinting.h"

#include <gtest/gtest.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

// The usage error a command line gives; empty when it is understood.
QString refusalOf(const QStringList& arguments)
{
    try {
        CommandLine::parse(arguments);
    } catch (const UsageError& usage) {
        return usage.message();
    }
    return {};
}

TEST(CommandLine, EachMistakeIsRefusedWithAMessageThatNamesIt)
{
    const std::pair<QStringList, QString> cases[] = {
        {{}, u"no command given"_s},
        {{u"launch"_s}, u"unknown command \"launch\""_s},
        {{u"fax"_s}, u"unknown command \"fax\""_s},
        {{u"labels"_s, u"--bogus"_s}, u"unknown option \"--bogus\""_s},
        {{u"labels"_s, u"-o"_s}, u"-o needs a value"_s},
        {{u"card"_s}, u"card needs the code of the card"_s},
        {{u"card"_s, u"C1"_s, u"C2"_s}, u"unexpected \"C2\""_s},
        {{u"sms"_s}, u"sms needs the file to write: -o FILE"_s},
        {{u"labels"_s, u"--kind"_s, u"3"_s}, u"--kind belongs to list and sql"_s},
        {{u"list"_s, u"--kind"_s, u"1"_s}, u"--kind takes a number from 2 to 6, not \"1\""_s},
        {{u"list"_s, u"--kind"_s, u"7"_s}, u"--kind takes a number from 1 to 6, not \"7\""_s},
        {{u"sql"_s, u"--kind"_s, u"0"_s}, u"--kind takes a number from 1 to 6, not \"0\""_s},
        {{u"labels"_s, u"--set"_s, u"=1"_s}, u"--set takes NAME=VALUE, not \"=1\""_s},
        {{u"labels"_s, u"--set"_s, u"txtRows"_s}, u"--set takes NAME=VALUE, not \"txtRows\""_s},
        {{u"labels"_s, u"--properties"_s, u"0"_s}, u"properties are numbered 1 to 64, not 0"_s},
        {{u"labels"_s, u"--properties"_s, u"64,65"_s}, u"properties are numbered 1 to 64, not 65"_s},
        {{u"labels"_s, u"--groups"_s, u"1,x"_s}, u"--groups takes whole numbers separated by commas, not \"1,x\""_s},
        {{u"labels"_s, u"--relation"_s, u"XOR"_s}, u"--relation takes AND or OR"_s},
    };
    for (const auto& [arguments, refusal] : cases)
        EXPECT_EQ(refusalOf(arguments), refusal) << arguments.join(u' ').toStdString();
}

TEST(CommandLine, WhatIsUnderstoodIsKeptAsGiven)
{
    const CommandLine line = CommandLine::parse({u"card"_s, u"C'1"_s, u"--set"_s, u"txtRows="_s, u"--set"_s,
                                                 u"TxtCity=a=b"_s, u"--properties"_s, u"1,64"_s, u"--relation"_s,
                                                 u"or"_s, u"--card"_s, u"X"_s, u"--card"_s, u"Y"_s, u"--yes"_s});
    EXPECT_EQ(line.command, u"card"_s);
    EXPECT_EQ(line.cardCode, u"C'1"_s);
    ASSERT_EQ(line.sets.size(), 2);
    EXPECT_EQ(line.sets[0], (QPair<QString, QString>{u"txtRows"_s, QString()}));
    EXPECT_EQ(line.sets[1], (QPair<QString, QString>{u"TxtCity"_s, u"a=b"_s})) << "split at the first =";
    EXPECT_EQ(line.properties, (QList<int>{1, 64}));
    EXPECT_EQ(line.relation, u"OR"_s);
    EXPECT_EQ(line.cards, (QStringList{u"X"_s, u"Y"_s}));
    EXPECT_TRUE(line.yes);
    EXPECT_EQ(refusalOf({u"list"_s, u"--kind"_s, u"6"_s}), QString());
    EXPECT_EQ(refusalOf({u"sql"_s, u"--kind"_s, u"1"_s}), QString());
    EXPECT_EQ(refusalOf({u"--help"_s}), QString()) << "help needs no command";
}

}  // namespace
}  // namespace pelmar::test
