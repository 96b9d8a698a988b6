#pragma once

#include <QString>

namespace mirel::cli {

class Run;

// Runs one statement on the open database and prints its records in the format that --format names. False: it
// failed, which was told, or nobody takes the records any more.
bool RunStatement(Run& run, const QString& statement);

} // namespace mirel::cli
