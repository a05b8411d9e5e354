#include "common/BrowserWindow.h"
#include "common/SessionState.h"
#include "log/RunLog.h"
#include "outputs/LabelSheet.h"
#include "outputs/Output.h"
#include "outputs/RunSupport.h"
#include "outputs/Runs.h"
#include "selection/SelectBuilder.h"

using namespace Qt::StringLiterals;

namespace pelmar {

void CreateLabFile(const QString& pFileName, RunContext& context)
{
    const QString connString = openCompany(context);
    LabelLayout::read(context.options);
    const QString counting = recipientStatement(context.options, context.state, kCardList, true, false);
    const LabelQueries queries{context.services.database, connString, counting,
                               recipientStatement(context.options, context.state, kLabels, true, true),
                               selectedCardsFilter(context)};
    WriteLog(counting, u"הפקת מדבקות"_s);
    writeLabelSheet(pFileName, context.options, context.state.LabelDefs, queries);
}

void RunLabels(RunContext& context)
{
    const QString path = runFile(context, u"pelmar1.htm"_s);
    CreateLabFile(path, context);
    context.services.browser.open(path);
}

}  // namespace pelmar
