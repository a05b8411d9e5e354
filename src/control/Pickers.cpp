#include "common/Messages.h"
#include "common/SessionState.h"
#include "control/MainCard.h"
#include "db/Connection.h"
#include "selection/SelectBuilder.h"
#include "selection/ui/GroupPickers.h"
#include "selection/ui/SelectByFileDialog.h"
#include "selection/ui/SelectCardDialog.h"

#include <QCheckBox>

using namespace Qt::StringLiterals;

namespace pelmar {

void MainCard::cmdSelectAccount_Click()
{
    c_.ChkSelectAccount->setChecked(true);
    c_.ChkItems->setChecked(false);
    const bool rebuild
        = state_.CardListSQL.isEmpty() || services_.messages.question(u"שימו לב"_s, u"לסרוק מחדש את רשימת הכרטיסים?"_s);
    if (rebuild) {
        const bool built
            = guarded([&] { state_.CardListSQL = recipientStatement(options_, state_, kCardList, false, true); });
        if (!built)
            return;
        cardPicker_.reset();
    }
    if (!cardPicker_) {
        cardPicker_ = std::make_unique<SelectCardDialog>(services_, state_,
                                                         [this](const QString& code) { openCardPage(code); });
        cardPicker_->FillCardList(companyConnString(state_), state_.CardListSQL);
    }
    cardPicker_->exec();
}

void MainCard::CmdSelectGroup_Click()
{
    state_.GroupCardType = static_cast<short>(options_.cardType);
    if (state_.GroupCardType < 0)
        return;
    c_.ChkCatCode->setChecked(true);
    CardGroupDialog dialog(services_, state_, companyConnString(state_), this);
    dialog.exec();
}

void MainCard::cmdQryGroup_Click()
{
    c_.chkQryGroup->setChecked(true);
    QryGroupDialog dialog(services_, state_, companyConnString(state_), this);
    dialog.exec();
}

void MainCard::cmdSelByFile_Click()
{
    c_.ChkSelectAccount->setChecked(true);
    if (!fileDialog_)
        fileDialog_ = std::make_unique<SelectByFileDialog>(services_, state_);
    if (fileDialog_->exec() == QDialog::Accepted)
        fileDialog_.reset();
}

}  // namespace pelmar
