#include "common/BrowserWindow.h"
#include "common/Messages.h"
#include "common/SessionState.h"
#include "common/TempFolder.h"
#include "control/MainCard.h"
#include "db/Connection.h"
#include "log/RunLog.h"
#include "outputs/LabelSheet.h"
#include "selection/SelectBuilder.h"
#include "selection/SelectedCards.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>

using namespace Qt::StringLiterals;

namespace pelmar {

LabelPage MainCard::labelPage() const
{
    LabelPage page;
    page.rows = c_.txtRows->text();
    page.cols = c_.txtCols->text();
    page.start = c_.txtStartFrom->text();
    page.copies = c_.txtCopies->text();
    for (size_t i = 0; i < c_.ChkTitle.size(); ++i)
        page.enabled[i] = c_.ChkTitle[i]->isChecked();
    page.contactAddressAllowed = c_.ChkAllContact->isChecked() && c_.chkUseCntctAddrss->isChecked();
    page.showAttn = c_.chkShowAttn->isChecked();
    page.deptNewLine = c_.chkDeptNewLine->isChecked();
    page.templateIndex = c_.cmbLabFormat->currentIndex();
    return page;
}

// Reads the schema level first, since the statements depend on it; -1 has been reported.
bool MainCard::readSchemaLevel(QString& connString)
{
    connString = companyConnString(state_);
    state_.SboVersionLevel = GetSboVersionLevel(services_.database, connString, services_.messages);
    return state_.SboVersionLevel != -1;
}

bool MainCard::CreateLabFile(const QString& pFileName)
{
    QString connString;
    if (!readSchemaLevel(connString))
        return false;
    const LabelPage page = labelPage();
    LabelLayout::read(page);
    const QString counting = recipientStatement(kCardList, true, false);
    LabelQueries queries{services_.database, connString, counting, recipientStatement(kLabels, true, true), {}};
    if (selectionFilter())
        queries.wanted = [this](const QString& code) { return IsSelectedCard(code); };
    WriteLog(counting, u"הפקת מדבקות"_s);
    writeLabelSheet(pFileName, page, state_.LabelDefs, queries);
    return true;
}

void MainCard::RunLabels()
{
    const QString path = tempFile(u"pelmar1.htm"_s);
    if (CreateLabFile(path))
        services_.browser.open(path);
}

}  // namespace pelmar
