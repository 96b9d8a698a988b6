#pragma once

#include <QString>

namespace mirel {

// What a condition says, for a chip: "Species: Rock pigeon", "Damage: not None", "Cost > 300000". A condition that
// is no comparison of one field with one value stands as it is written.
QString ConditionLabel(const QString& condition);

} // namespace mirel
