#include "common/Failure.h"
#include "common/Messages.h"
#include "common/SessionState.h"
#include "control/MainCard.h"

#include <QComboBox>

using namespace Qt::StringLiterals;

namespace pelmar {

// One entry of cmbOutType: its confirmation question, the message shown when its run returns
// (empty for none) and the run itself (empty while the output is not available).
struct MainCard::OutputType {
    QString caption;
    QString question;
    QString finish;
    std::function<void(MainCard&)> run;
};

const MainCard::OutputType& MainCard::outputTypeAt(int listIndex)
{
    static const OutputType types[] = {
        {u"מדבקות למעטפות"_s, u"להתחיל בהכנת המדבקות?"_s, {}, &MainCard::RunLabels},
        {u"מכתבים בפקס"_s, u"להתחיל במשלוח הפקסים?"_s, u"משלוח הפקסים הסתיים"_s, {}},
        {u"דואר אלקטרוני"_s, u"להתחיל במשלוח דואר אלקטרוני?"_s, u"הדיוור האלקטרוני הסתיים"_s, {}},
        {u"לטלפונים סלולריים"_s, u"להתחיל בהכנת קובץ למשלוח הודעות לסלולריים?"_s, {}, &MainCard::SaveSMSList},
        {u"הדפסת מכתבים"_s, u"להתחיל בהדפסת המכתבים?"_s, u"הדפסת המכתבים הסתיימה"_s, {}},
    };
    return types[listIndex >= 0 && listIndex < 5 ? listIndex : 0];
}

void MainCard::CmdLabPrev_Click()
{
    state_.StopRequested = false;
    const OutputType& output = outputTypeAt(c_.cmbOutType->currentIndex());
    if (!services_.messages.question(u"שאלה חשובה"_s, output.question))
        return;
    runOutput(output);
}

void MainCard::runOutput(const OutputType& output)
{
    if (!output.run) {
        services_.messages.information(
            u"הודעה"_s, u"הפלט \"%1\" עדיין אינו זמין בגרסה זו. לא בוצע דבר."_s.arg(output.caption));
        return;
    }
    bool completed = false;
    guarded([&] {
        output.run(*this);
        completed = true;
    });
    if (completed && !output.finish.isEmpty())
        services_.messages.information(u"הודעה"_s, output.finish);
}

}  // namespace pelmar
