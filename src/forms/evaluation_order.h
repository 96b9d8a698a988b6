#pragma once

#include <vector>

namespace mirel {

// For each control, by its index, the controls whose texts its expression reads.
using ControlReferences = std::vector<std::vector<int>>;

// The order in which controls are computed: each after those that it reads, and otherwise as the form lists them.
// Of controls that read one another in a circle the first listed goes first, and reads what the others showed
// before. Indexes outside the list are ignored.
std::vector<int> EvaluationOrder(const ControlReferences& references);

} // namespace mirel
