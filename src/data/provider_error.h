#pragma once

#include "data/db_recordset.h"
#include "platform/user_prompt.h"

namespace mirel {

// The words of a failed provider call: "Error: (80040E07) the field "Qty"", a line end, the message for that
// result. `context`, what only the caller or the provider knows, follows the code after a blank. `recordset` (may
// be null) tells a read-only join from a faulty command.
QString ProviderErrorText(const DbRecordset* recordset, Hr hr, const QString& context);

// The single place where a failure of the provider becomes a message to the user. Does nothing when `hr` is a
// success, or when the user stopped the work.
void ReportProviderError(UserPrompt& prompt, const DbRecordset* recordset, Hr hr);

} // namespace mirel
