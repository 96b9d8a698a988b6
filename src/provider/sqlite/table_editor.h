#pragma once

#include "provider/provider.h"
#include "provider/sqlite/database_file.h"

#include <memory>

namespace mirel::sqlite {

// Null, and why, when the table is not there or cannot be written.
std::unique_ptr<RecordEditor> OpenEditor(std::shared_ptr<DatabaseFile> file, const QString& table,
                                         Outcome& outcome);

} // namespace mirel::sqlite
