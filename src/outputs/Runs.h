#pragma once

#include <QString>

namespace pelmar {

struct RunContext;

// The operations behind the outputs of the table. Each reads the schema level of the company of
// the saved connection settings first and stores it in the session: the statements depend on it,
// and when it cannot be read nothing is written. Each throws Failure with the description the
// user is shown; a file being written when a failure struck keeps what was written.

// The label sheet: CreateLabFile writes it to a path (a layout box without a valid number fails
// before the file is touched); RunLabels writes "pelmar1.htm" in the temporary folder, or the
// requested file, and shows it.
void CreateLabFile(const QString& pFileName, RunContext& context);
void RunLabels(RunContext& context);

// The recipient list of an output kind (2..6). The labels list counts pages with the label
// layout, which must therefore be readable.
void CreateHTML(const QString& pFileName, short pOutType, RunContext& context);

// The SMS list: SaveSMSList asks for the file (a cancelled dialog is a failure and writes
// nothing), writes the mobile numbers and says that the list is ready.
void CreateSMSFile(const QString& pFileName, RunContext& context);
void SaveSMSList(RunContext& context);

// The page of one card.
void CreateCardFile(const QString& pFileName, const QString& pCardCode, RunContext& context);

}  // namespace pelmar
