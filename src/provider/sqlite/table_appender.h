#pragma once

#include "provider/provider.h"
#include "provider/sqlite/database_file.h"

#include <memory>

namespace mirel::sqlite {

// Null, and why, when the table or a column is not there or cannot be written.
std::unique_ptr<RecordAppender> OpenAppender(std::shared_ptr<DatabaseFile> file, const QString& table,
                                             const QStringList& columns, Outcome& outcome);

} // namespace mirel::sqlite
