#pragma once

#include <QString>

namespace mirel::cli {

class Run;

// Runs one statement on the open database and prints its records in the format that --format names. False
// when it failed, which has been reported, or when the reader of the output is gone.
bool RunStatement(Run& run, const QString& statement);

} // namespace mirel::cli
