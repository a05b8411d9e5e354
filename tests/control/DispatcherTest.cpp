#include "support/ui/WindowFixture.h"

#include <QComboBox>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

struct OutputCase {
    int listIndex;
    const char16_t* question;
};

class Dispatcher : public MainCardTest, public ::testing::WithParamInterface<OutputCase> {};

TEST_P(Dispatcher, AsksTheOutputsOwnQuestionAndNoStartsNothingButClearsTheStopFlag)
{
    control<QComboBox>(u"cmbOutType"_s)->setCurrentIndex(GetParam().listIndex);
    state.StopRequested = true;
    messages.answers = {false};
    card->CmdLabPrev_Click();
    ASSERT_EQ(messages.boxes.size(), 1);
    EXPECT_EQ(messages.boxes[0],
              (FakeMessages::Box{u"question"_s, u"שאלה חשובה"_s, QString::fromUtf16(GetParam().question)}));
    EXPECT_FALSE(state.StopRequested);
    EXPECT_TRUE(browser.opened.isEmpty());
}

INSTANTIATE_TEST_SUITE_P(EveryOutputType, Dispatcher,
                         ::testing::Values(OutputCase{-1, u"להתחיל בהכנת המדבקות?"},
                                           OutputCase{0, u"להתחיל בהכנת המדבקות?"},
                                           OutputCase{1, u"להתחיל במשלוח הפקסים?"},
                                           OutputCase{2, u"להתחיל במשלוח דואר אלקטרוני?"},
                                           OutputCase{3, u"להתחיל בהכנת קובץ למשלוח הודעות לסלולריים?"},
                                           OutputCase{4, u"להתחיל בהדפסת המכתבים?"}));

TEST_F(MainCardTest, AnOutputThatIsNotAvailableSaysSoAndShowsNoFinishMessage)
{
    for (const int index : {1, 4}) {
        messages.boxes.clear();
        control<QComboBox>(u"cmbOutType"_s)->setCurrentIndex(index);
        card->CmdLabPrev_Click();
        ASSERT_EQ(messages.boxes.size(), 2) << index;
        EXPECT_EQ(messages.boxes[1].kind, u"information"_s);
        EXPECT_TRUE(messages.boxes[1].text.contains(u"אינו זמין"_s)) << messages.boxes[1];
    }
}

TEST_F(MainCardTest, AFailingRunIsReportedAndShowsNoFinishMessage)
{
    control<QComboBox>(u"cmbOutType"_s)->setCurrentIndex(3);
    card->CmdLabPrev_Click();
    ASSERT_EQ(messages.boxes.size(), 2) << "the save dialog was cancelled";
    EXPECT_EQ(messages.boxes[1].kind, u"critical"_s);
    EXPECT_EQ(messages.boxes[1].title, u"תקלה"_s);
}

TEST_F(MainCardTest, TheStopButtonSetsTheStopFlag)
{
    card->cmdStop_Click();
    EXPECT_TRUE(state.StopRequested);
}

}  // namespace
}  // namespace pelmar::test
