#pragma once

#include <QString>

namespace pelmar {

class DatabaseClient;
struct MailingOptions;

// Refills the sales employee list (options.agents) from OSLP, in the order the table gives the
// rows, leaving out those without a name; nothing is chosen in the refilled list until a stored
// choice that it can show is loaded. When OSLP has no rows, or the database
// cannot be read, the list and the choice stay as they were: the sales employee criterion then
// reports a missing choice when it is used.
void FillCmbAgent(const DatabaseClient& client, const QString& connString, MailingOptions& options);

}  // namespace pelmar
