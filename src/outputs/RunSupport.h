#pragma once

#include <QString>

#include <functional>

namespace pelmar {

struct RunContext;

// The connection string of the saved settings, after the company's schema level has been read
// into the session. Throws Failure (the level then stands at -1) when it cannot be read.
QString openCompany(RunContext& context);

// The selection filter of the run: null when it is off (the switch is off or no card was picked),
// else true for the codes the selected-card list holds.
std::function<bool(const QString&)> selectedCardsFilter(const RunContext& context);

// The file a run writes: the requested one, else the output's own name in the temporary folder.
QString runFile(const RunContext& context, const QString& ownName);

}  // namespace pelmar
