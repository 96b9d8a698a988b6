#pragma once

#include "csvimport/csv_detect.h"

#include <QString>

namespace mirel::cli {

// What was found in a file, as the options that say the same, with what no option says in parentheses. One line.
QString FoundText(const CsvFound& found);

} // namespace mirel::cli
