#pragma once

#include "app/settings.h"
#include "tableview/table_view_settings.h"

namespace mirel {

// The table view's section of the configuration, as the table view takes it.
TableViewSettings ReadTableViewSettings(const Settings& settings);
void WriteTableViewSettings(Settings& settings, const TableViewSettings& options);

} // namespace mirel
