// Reads any text as what a clipboard holds. What was read must survive being copied again; and any text as the
// profile's widths of columns.
#include "tableview/block_text.h"
#include "tableview/column_widths.h"

#include <cstdint>

using namespace mirel;

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QString text = QString::fromUtf8(reinterpret_cast<const char*>(data), qsizetype(size));
    const TextRows rows = RowsOfText(text);
    const ColumnWidths widths = ReadColumnWidths(text);
    if (RowsOfText(TextOfRows(rows)) != rows || HtmlOfRows(rows).isEmpty() ||
        ReadColumnWidths(ColumnWidthsText(widths)) != widths)
        __builtin_trap();
    return 0;
}
