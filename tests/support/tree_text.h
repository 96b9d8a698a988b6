#pragma once

#include "provider/dialect/tree.h"

namespace mirel::dialect {

// The statement in the dialect: parsed again it gives an equal tree. For trees as they were parsed, before a
// checker has completed them.
QString StatementText(const Statement& statement);

} // namespace mirel::dialect
