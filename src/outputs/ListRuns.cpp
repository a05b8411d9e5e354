#include "cardpage/CardPage.h"
#include "common/Failure.h"
#include "common/FileDialogs.h"
#include "common/Messages.h"
#include "common/SessionState.h"
#include "log/RunLog.h"
#include "options/MailingOptions.h"
#include "outputs/LabelSheet.h"
#include "outputs/Output.h"
#include "outputs/RecipientList.h"
#include "outputs/RunParameters.h"
#include "outputs/RunSupport.h"
#include "outputs/Runs.h"
#include "outputs/SmsList.h"
#include "selection/SelectBuilder.h"

#include <QDate>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

ListQuery listQuery(const QString& connString, short kind, const RunContext& context)
{
    return {context.services.database, connString, recipientStatement(context.options, context.state, kind, true, true),
            selectedCardsFilter(context)};
}

}  // namespace

void CreateHTML(const QString& pFileName, short pOutType, RunContext& context)
{
    const QString connString = openCompany(context);
    std::optional<ListPageLayout> pages;
    if (pOutType == kLabels) {
        const auto [rows, cols] = readLabelPage(context.options);
        pages = ListPageLayout{rows, cols, wholeNumberIn(context.options.copies, u"עותקים"_s, 0, 255)};
    }
    const ListQuery query = listQuery(connString, pOutType, context);
    WriteLog(query.statement, u"רשימת מעקב"_s);
    writeRecipientList(pFileName, pOutType, query, pages, QDate::currentDate());
}

void CreateSMSFile(const QString& pFileName, RunContext& context)
{
    const QString connString = openCompany(context);
    writeSmsList(pFileName, listQuery(connString, kMobiles, context));
}

void SaveSMSList(RunContext& context)
{
    const QString path
        = context.services.files.saveFile(u"Text Files (*.txt)|*.txt|All Files (*.*)|*.*"_s, 1, u"smslist"_s);
    if (path.isEmpty())
        throw Failure(u"בחירת הקובץ בוטלה; רשימת הטלפונים לא נכתבה."_s, 32755);
    CreateSMSFile(path, context);
    context.services.messages.information(u"הודעה"_s, u"קובץ רשימת הטלפונים הניידים מוכן"_s);
}

void CreateCardFile(const QString& pFileName, const QString& pCardCode, RunContext& context)
{
    const QString connString = openCompany(context);
    writeCardPage(pFileName, pCardCode, context.services.database, connString, context.state.SboVersionLevel);
}

}  // namespace pelmar
