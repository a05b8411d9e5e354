#pragma once

#include "outputs/RecipientList.h"

namespace pelmar {

// Writes the mobile numbers of the recipients of query (kind 5, ordered) to path, one per line
// with CR LF, exactly as stored: the contact's mobile when it is neither Null nor empty, else the
// card's; recipients without a number are left out. No rows leave an empty file. The file is
// replaced. Throws Failure on a database or file failure.
void writeSmsList(const QString& path, const ListQuery& query);

}  // namespace pelmar
