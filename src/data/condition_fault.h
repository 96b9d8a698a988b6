#pragma once

#include <QStringView>

#include <optional>

namespace mirel {

// Where a condition that a user typed cannot be read, from 0; its length: it breaks off. Empty: it reads, be its
// columns known or not.
std::optional<qsizetype> FaultInCondition(QStringView condition);

} // namespace mirel
