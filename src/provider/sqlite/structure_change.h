#pragma once

#include "provider/sqlite/database_file.h"
#include "provider/sqlite/plan.h"

namespace mirel::sqlite {

// Carries out one change of a file's structure as one transaction: it keeps rows, row ids, indexes and types,
// and a change that fails leaves the file as it was.
Outcome ChangeStructure(DatabaseFile& file, const StructurePlan& plan);

} // namespace mirel::sqlite
