#include "outputs/RunSupport.h"

#include "common/SessionState.h"
#include "common/TempFolder.h"
#include "db/Connection.h"
#include "options/MailingOptions.h"
#include "outputs/Output.h"
#include "selection/SelectedCards.h"

namespace pelmar {

QString openCompany(RunContext& context)
{
    const QString connString = companyConnString(context.state);
    context.state.SboVersionLevel = -1;
    context.state.SboVersionLevel = GetSboVersionLevel(context.services.database, connString);
    return connString;
}

std::function<bool(const QString&)> selectedCardsFilter(const RunContext& context)
{
    if (!selectionFilterOn(context.state, context.options.selectAccount))
        return {};
    const SessionState& state = context.state;
    return [&state](const QString& code) { return IsSelectedCard(state, code); };
}

QString runFile(const RunContext& context, const QString& ownName)
{
    return context.request.outputPath.isEmpty() ? tempFile(ownName) : context.request.outputPath;
}

}  // namespace pelmar
