#include "selection/SelectedCards.h"

#include "common/SessionState.h"

namespace pelmar {

bool IsSelectedCard(const SessionState& state, const QString& pCardCode)
{
    return state.WantedCrd.contains(pCardCode, Qt::CaseSensitive);
}

void replaceSelectedCards(SessionState& state, const QStringList& codes)
{
    state.WantedCrd = codes;
}

bool selectionFilterOn(const SessionState& state, bool selectAccountChecked)
{
    return selectAccountChecked && state.WantedCrdCount() != 0;
}

}  // namespace pelmar
