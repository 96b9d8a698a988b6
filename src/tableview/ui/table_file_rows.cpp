#include "resources/string_table.h"
#include "tableview/ui/table_view_commands.h"

#include <array>

// What the File menu of the table view shows.

namespace mirel {

std::span<const TableRow> CTableView::Commands::FileRows()
{
    using B = RecordBrowser;
    using R = ResultCommands;
    using V = CTableView;
    static constexpr std::array kRows = {
        TableRow{{.id = Id(TableCommand::InsertDateTime),
                  .text = Str::ActionInsertDateTime,
                  .tip = Str::ActionInsertDateTimeTip,
                  .keys = {{{Qt::CTRL | Qt::Key_Semicolon}}},
                  .menus = TableFileMenu,
                  .group = 0},
                 InsertDateTime,
                 If<&B::CanEdit>},
        TableRow{{.id = Id(TableCommand::NewQuery),
                  .text = Str::ActionNewQuery,
                  .tip = Str::ActionNewQueryTip,
                  .menus = TableFileMenu,
                  .group = 1},
                 Result<&R::NewQuery>,
                 IfResult<&R::CanWriteQuery>},
        TableRow{{.id = Id(TableCommand::OpenQuery),
                  .text = Str::ActionOpenQuery,
                  .tip = Str::ActionOpenQueryTip,
                  .menus = TableFileMenu,
                  .group = 1},
                 Result<&R::OpenQuery>,
                 IfResult<&R::CanOpenQuery>},
        TableRow{{.id = Id(TableCommand::SaveQuery),
                  .text = Str::ActionSaveQuery,
                  .tip = Str::ActionSaveQueryTip,
                  .menus = TableFileMenu,
                  .group = 1},
                 Result<&R::SaveQuery>,
                 IfResult<&R::CanSaveQuery>},
        TableRow{{.id = Id(TableCommand::ExportCsv),
                  .text = Str::ActionExportCsv,
                  .tip = Str::ActionExportCsvTip,
                  .menus = TableFileMenu,
                  .group = 1},
                 Result<&R::Export>,
                 HasRecord},
        TableRow{{.id = Id(TableCommand::RunAgain),
                  .text = Str::ActionRunAgain,
                  .tip = Str::ActionRunAgainTip,
                  .icon = u"view-refresh",
                  .keys = {{{Qt::Key_F5}}},
                  .menus = TableFileMenu,
                  .group = 2},
                 Rerun<&B::RunAgain>},
        TableRow{{.id = Id(TableCommand::Statement),
                  .text = Str::ActionStatement,
                  .tip = Str::ActionStatementTip,
                  .menus = TableFileMenu,
                  .group = 2},
                 View<&V::ShowStatement>,
                 If<&B::IsOpen>},
        TableRow{{.id = Id(TableCommand::FitAllColumns),
                  .text = Str::ActionFitAll,
                  .tip = Str::ActionFitAllTip,
                  .menus = TableFileMenu,
                  .group = 2},
                 FitAllColumns,
                 HasRecord},
        TableRow{{.id = Id(TableCommand::Options),
                  .text = Str::ActionOptions,
                  .tip = Str::ActionOptionsTip,
                  .icon = u"configure",
                  .menus = TableFileMenu,
                  .group = 2},
                 View<&V::ChooseOptions>},
        TableRow{{.id = Id(TableCommand::Layout),
                  .text = Str::ActionLayout,
                  .tip = Str::ActionLayoutTip,
                  .menus = TableFileMenu,
                  .group = 2,
                  .opens = TableLayoutMenu},
                 OpenMenu},
    };
    return kRows;
}

} // namespace mirel
