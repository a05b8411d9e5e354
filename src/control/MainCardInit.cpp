#include "common/Failure.h"
#include "common/Messages.h"
#include "control/MainCard.h"
#include "log/RunLog.h"
#include "outputs/Initialisation.h"

#include <QTabWidget>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

constexpr int kCriteriaPage = 3;

}  // namespace

void MainCard::UserControl_Initialize()
{
    initialiseSession(services_.settings, services_.database, state_, options_);
    showOptions();
    showDeptCaption();
    c_.SSTab1->setCurrentIndex(kCriteriaPage);
}

void MainCard::Label56_DblClick()
{
    guarded([this] {
        if (!ShowLog(services_.browser))
            services_.messages.critical(u"הודעה"_s, QString::fromUtf16(kNoRunLog));
    });
}

}  // namespace pelmar
