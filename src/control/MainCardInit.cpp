#include "common/Failure.h"
#include "common/SessionState.h"
#include "control/MainCard.h"
#include "control/SetGetCtrl.h"
#include "db/Connection.h"
#include "log/RunLog.h"
#include "outputs/LabelStyles.h"
#include "selection/SalesEmployees.h"

#include <QComboBox>
#include <QTabWidget>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

constexpr int kCriteriaPage = 3;

// Runs one start-up step; a step that fails is passed over and the next one runs.
template <typename Step>
void ignoringFailure(Step step)
{
    try {
        step();
    } catch (const Failure&) {
    } catch (const std::exception&) {
    }
}

}  // namespace

void MainCard::UserControl_Initialize()
{
    ignoringFailure([&] { LoadConnSettings(services_.settings, state_); });
    ignoringFailure([&] { InitLog(); });
    ignoringFailure([&] {
        if (state_.ConnDataBase != QString::fromUtf16(kUnconfiguredDatabase)
            && TestConnection(services_.database, state_, state_.ConnDataBase))
            FillCmbAgent();
    });
    ignoringFailure([&] { SetGetRegParams(kLoad); });
    ignoringFailure([&] { SetGetLabelDefs(kLoad, services_.settings, state_.LabelDefs); });
    ignoringFailure([&] { state_.CardListSQL.clear(); });
    ignoringFailure([&] { state_.clearCardGroups(); });
    ignoringFailure([&] { showDeptCaption(); });
    ignoringFailure([&] { c_.SSTab1->setCurrentIndex(kCriteriaPage); });
}

void MainCard::FillCmbAgent()
{
    try {
        const auto employees = readSalesEmployees(services_.database, companyConnString(state_));
        if (!employees)
            return;
        c_.CmbAgent->clear();
        for (const SalesEmployee& employee : *employees)
            c_.CmbAgent->addItem(employee.name, employee.code);
    } catch (const Failure&) {
        // The list keeps what it has; the sales employee criterion then reports the missing choice.
    }
}

void MainCard::Label56_DblClick()
{
    ShowLog(services_.browser, services_.messages);
}

}  // namespace pelmar
