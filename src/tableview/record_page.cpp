#include "tableview/record_page.h"

#include <algorithm>

namespace mirel {

int RecordPage::ColumnOfField(int field) const
{
    const auto at = std::ranges::find(columns, field, &PageColumn::field);
    return field < 0 || at == columns.end() ? -1 : int(at - columns.begin());
}

} // namespace mirel
