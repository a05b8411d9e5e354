#include "common/BrowserWindow.h"
#include "common/Messages.h"
#include "common/SessionState.h"
#include "common/TempFolder.h"
#include "control/MainCard.h"
#include "db/Connection.h"
#include "selection/SelectBuilder.h"
#include "selection/ui/GroupPickers.h"
#include "selection/ui/SelectByFileDialog.h"
#include "selection/ui/SelectCardDialog.h"

#include <QCheckBox>
#include <QComboBox>

using namespace Qt::StringLiterals;

namespace pelmar {

void MainCard::cmdSelectAccount_Click()
{
    c_.ChkSelectAccount->setChecked(true);
    c_.ChkItems->setChecked(false);
    const bool rebuild = state_.CardListSQL.isEmpty()
                         || services_.messages.question(u"שימו לב"_s, u"לסרוק מחדש את רשימת הכרטיסים?"_s);
    if (rebuild) {
        bool built = false;
        guarded([&] {
            state_.CardListSQL = recipientStatement(kCardList, false, true);
            built = true;
        });
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

void MainCard::openCardPage(const QString& code)
{
    guarded([&] {
        const QString path = tempFile(u"pelmar3.htm"_s);
        if (CreateCardFile(path, code))
            services_.browser.open(path);
    });
}

void MainCard::CmdSelectGroup_Click()
{
    state_.GroupCardType = static_cast<short>(c_.cmbCS->currentIndex());
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
