#pragma once

#include <QString>
#include <QStringList>

namespace pelmar {

struct SessionState;

// True when the code stands in the selected-card list, compared exactly (case-sensitive).
bool IsSelectedCard(const SessionState& state, const QString& pCardCode);

// Replaces the selected-card list by the codes, in their order; duplicates are kept.
void replaceSelectedCards(SessionState& state, const QStringList& codes);

// The outputs' selection filter: the switch is on and the list is not empty.
bool selectionFilterOn(const SessionState& state, bool selectAccountChecked);

}  // namespace pelmar
