#pragma once

#include "data/db_recordset.h"
#include "forms/control_binding.h"
#include "platform/user_prompt.h"

#include <span>

namespace mirel {

// Walks the whole result once and gives SUM, AVG, MIN and MAX in the bindings' trees their values: what stands
// around them is for the trees' next evaluation. NULL takes no part; an empty result gives NULL. The recordset
// stays on its record. False, with all of them NULL, when the walk failed (LastResult says why) or the user
// stopped it.
[[nodiscard]] bool ComputeAggregates(DbRecordset& records, FormContext& context, UserPrompt& prompt,
                                     std::span<ControlBinding> bindings);

} // namespace mirel
