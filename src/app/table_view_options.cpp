#include "app/table_view_options.h"

namespace mirel {

TableViewSettings ReadTableViewSettings(const Settings& settings)
{
    return {.maxColumnChars = settings.Int(Setting::TableViewMaxColumnChars),
            .confirmDelete = settings.Flag(Setting::TableViewConfirmDelete),
            .sortByHeader = settings.Flag(Setting::TableViewSortColumn),
            .holdTimeMs = settings.Int(Setting::TableViewHoldingTime),
            .autoSizing = settings.Flag(Setting::TableViewAutoSizing),
            .leadingNumber = settings.Flag(Setting::TableViewLeadingNumber),
            .words = settings.Words()};
}

void WriteTableViewSettings(Settings& settings, const TableViewSettings& options)
{
    settings.SetInt(Setting::TableViewMaxColumnChars, options.maxColumnChars);
    settings.SetInt(Setting::TableViewConfirmDelete, options.confirmDelete ? 1 : 0);
    settings.SetInt(Setting::TableViewSortColumn, options.sortByHeader ? 1 : 0);
    settings.SetInt(Setting::TableViewHoldingTime, options.holdTimeMs);
    settings.SetInt(Setting::TableViewAutoSizing, options.autoSizing ? 1 : 0);
    settings.SetText(Setting::TableViewYesNo, options.words.Setting());
}

} // namespace mirel
