#pragma once

#include "forms/form_store.h"

namespace mirel {

// The forms of the sample database: "Strikes" looks through the bird strikes with a list, a search and sums, and
// calls "Strike entry" on the record it stands on, where one strike is changed or added. "Order" shows one order with
// its lines.
void AddSampleForms(FormStore& store);

} // namespace mirel
