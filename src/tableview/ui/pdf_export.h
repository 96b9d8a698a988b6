#pragma once

#include "tableview/csv_export.h"

namespace mirel {

// Writes all records of an open result as a document of A4 pages: the field names on top of each, columns as wide
// as the first records need, pages on their side where that does not fit, smaller letters where not even that
// does. Texts wrap, up to half a page. Memory does not grow with the number of records.
CsvExportResult ExportPdf(DbRecordset& source, const CsvExportOptions& options, QIODevice& device,
                          Progress* progress);

} // namespace mirel
