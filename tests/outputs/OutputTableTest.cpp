#include "options/Lists.h"
#include "outputs/Output.h"

#include <gtest/gtest.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

TEST(OutputTable, EachPositionOfTheOutputTypeListStartsItsOwnOutput)
{
    const QStringList questions
        = {u"להתחיל בהכנת המדבקות?"_s, u"להתחיל במשלוח הפקסים?"_s, u"להתחיל במשלוח דואר אלקטרוני?"_s,
           u"להתחיל בהכנת קובץ למשלוח הודעות לסלולריים?"_s, u"להתחיל בהדפסת המכתבים?"_s};
    ASSERT_EQ(outputTypeEntries().size(), questions.size());
    for (int index = -1; index < questions.size(); ++index) {
        const Output& output = outputChosenAt(index);
        EXPECT_EQ(output.kind(), std::max(0, index) + 2) << index;
        EXPECT_EQ(output.question(), questions[std::max(0, index)]) << index;
    }
    EXPECT_EQ(outputChosenAt(questions.size()).kind(), 2) << "a position past the list starts the first output";
    EXPECT_EQ(outputNamed(u"email"_s), &outputChosenAt(2));
    EXPECT_EQ(outputNamed(QString()), nullptr) << "the outputs without a command are not found by an empty name";
}

}  // namespace
}  // namespace pelmar::test
