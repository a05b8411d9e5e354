#include "cardpage/CardPage.h"
#include "common/BrowserWindow.h"
#include "common/Failure.h"
#include "common/FileDialogs.h"
#include "common/Messages.h"
#include "common/SessionState.h"
#include "common/TempFolder.h"
#include "control/MainCard.h"
#include "log/RunLog.h"
#include "outputs/RecipientList.h"
#include "outputs/RunParameters.h"
#include "outputs/SmsList.h"
#include "selection/SelectBuilder.h"

#include <QComboBox>
#include <QLineEdit>

using namespace Qt::StringLiterals;

namespace pelmar {

ListQuery MainCard::listQuery(const QString& connString, short kind) const
{
    ListQuery query{services_.database, connString, recipientStatement(kind, true, true), {}};
    if (selectionFilter())
        query.wanted = [this](const QString& code) { return IsSelectedCard(code); };
    return query;
}

// The labels list counts pages with the label layout; a layout that cannot be read is refused
// before the list is written.
bool MainCard::CreateHTML(const QString& pFileName, short pOutType)
{
    QString connString;
    if (!readSchemaLevel(connString))
        return false;
    std::optional<ListPageLayout> pages;
    if (pOutType == kLabels) {
        const int cols = wholeNumberIn(c_.txtCols->text(), u"עמודות"_s, 1, 32767);
        const int rows = wholeNumberIn(c_.txtRows->text(), u"שורות"_s, 1, 32767);
        pages = ListPageLayout{rows, cols, wholeNumberIn(c_.txtCopies->text(), u"עותקים"_s, 0, 255)};
    }
    const ListQuery query = listQuery(connString, pOutType);
    WriteLog(query.statement, u"רשימת מעקב"_s);
    writeRecipientList(pFileName, pOutType, query, pages, QDate::currentDate());
    return true;
}

void MainCard::CmdPreview_Click()
{
    guarded([this] {
        const short kind = static_cast<short>(std::max(0, c_.cmbOutType->currentIndex()) + 2);
        const QString path = tempFile(u"pelmar2.htm"_s);
        if (CreateHTML(path, kind))
            services_.browser.open(path);
    });
}

bool MainCard::CreateSMSFile(const QString& pFileName)
{
    QString connString;
    if (!readSchemaLevel(connString))
        return false;
    writeSmsList(pFileName, listQuery(connString, kMobiles));
    return true;
}

void MainCard::SaveSMSList()
{
    const QString path = services_.files.saveFile(u"Text Files (*.txt)|*.txt|All Files (*.*)|*.*"_s, 1, u"smslist"_s);
    if (path.isEmpty())
        throw Failure(u"בחירת הקובץ בוטלה; רשימת הטלפונים לא נכתבה."_s, 32755);
    if (CreateSMSFile(path))
        services_.messages.information(u"הודעה"_s, u"קובץ רשימת הטלפונים הניידים מוכן"_s);
}

bool MainCard::CreateCardFile(const QString& pFileName, const QString& pCardCode)
{
    QString connString;
    if (!readSchemaLevel(connString))
        return false;
    pelmar::CreateCardFile(pFileName, pCardCode, services_.database, connString, state_.SboVersionLevel);
    return true;
}

}  // namespace pelmar
