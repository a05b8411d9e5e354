#include "common/Failure.h"
#include "common/Messages.h"
#include "common/SessionState.h"
#include "control/MainCard.h"
#include "outputs/Output.h"

#include <QCoreApplication>

using namespace Qt::StringLiterals;

namespace pelmar {

void MainCard::CmdLabPrev_Click()
{
    state_.StopRequested = false;
    const Output& output = outputChosenAt(options_.outType);
    if (!services_.messages.question(u"שאלה חשובה"_s, output.question()))
        return;
    const std::optional<QString> finish = runOutput(output, {});
    if (finish && !finish->isEmpty())
        services_.messages.information(u"הודעה"_s, *finish);
}

void MainCard::CmdPreview_Click()
{
    runOutput(*outputNamed(u"list"_s), {});
}

void MainCard::openCardPage(const QString& code)
{
    runOutput(*outputNamed(u"card"_s), RunRequest{{}, {}, code});
}

std::optional<QString> MainCard::runOutput(const Output& output, const RunRequest& request)
{
    const MailingOptions snapshot = options_;
    StopToken stop(state_.StopRequested, [] { QCoreApplication::processEvents(); });
    RunContext context{snapshot, state_, services_, *this, stop, request};
    if (!guarded([&] { output.run(context); }))
        return std::nullopt;
    return finishText(output, context);
}

bool MainCard::guarded(const std::function<void()>& handler)
{
    try {
        handler();
        return true;
    } catch (const Failure& failure) {
        services_.messages.critical(u"תקלה"_s, failure.description());
    } catch (const std::exception& error) {
        services_.messages.critical(u"תקלה"_s, QString::fromLocal8Bit(error.what()));
    }
    return false;
}

}  // namespace pelmar
