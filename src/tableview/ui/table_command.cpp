#include "tableview/ui/table_command.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

enum Places : unsigned { InGrid = 1, InEditor = 2, InWindow = 4 };

struct KeyRow {
    QKeyCombination keys;
    unsigned places;
    TableCommand command;
};

// The keys of the table view. Those of the window stand beside their menu entries; an editor keeps what moves
// within its text.
constexpr std::array kKeys = {
    KeyRow{Qt::Key_Up, InGrid | InEditor, TableCommand::RowUp},
    KeyRow{Qt::Key_Down, InGrid | InEditor, TableCommand::RowDown},
    KeyRow{Qt::Key_PageUp, InGrid | InEditor, TableCommand::PageUp},
    KeyRow{Qt::Key_PageDown, InGrid | InEditor, TableCommand::PageDown},
    KeyRow{Qt::Key_Left, InGrid, TableCommand::ColumnLeft},
    KeyRow{Qt::Key_Right, InGrid, TableCommand::ColumnRight},
    KeyRow{Qt::Key_Home, InGrid, TableCommand::FirstColumn},
    KeyRow{Qt::Key_End, InGrid, TableCommand::LastColumn},
    KeyRow{Qt::CTRL | Qt::Key_Home, InGrid, TableCommand::First},
    KeyRow{Qt::CTRL | Qt::Key_End, InGrid, TableCommand::Last},
    KeyRow{Qt::CTRL | Qt::Key_PageUp, InGrid | InEditor, TableCommand::Previous},
    KeyRow{Qt::CTRL | Qt::Key_PageDown, InGrid | InEditor, TableCommand::Next},
    KeyRow{Qt::Key_Tab, InGrid | InEditor, TableCommand::NextCell},
    KeyRow{Qt::Key_Backtab, InGrid | InEditor, TableCommand::PreviousCell},
    KeyRow{Qt::SHIFT | Qt::Key_Backtab, InGrid | InEditor, TableCommand::PreviousCell},
    KeyRow{Qt::Key_Return, InGrid, TableCommand::EditCell},
    KeyRow{Qt::Key_Enter, InGrid, TableCommand::EditCell},
    KeyRow{Qt::Key_F2, InGrid, TableCommand::EditCell},
    KeyRow{Qt::Key_Return, InEditor, TableCommand::RowDown},
    KeyRow{Qt::Key_Enter, InEditor, TableCommand::RowDown},
    KeyRow{Qt::Key_Escape, InGrid | InEditor, TableCommand::RevertEdit},
    KeyRow{Qt::Key_Delete, InGrid, TableCommand::ClearCell},
    KeyRow{Qt::Key_Insert, InGrid, TableCommand::NewRecord},
    KeyRow{Qt::CTRL | Qt::Key_N, InWindow, TableCommand::NewRecord},
    KeyRow{Qt::CTRL | Qt::Key_Delete, InWindow, TableCommand::DeleteRecord},
    KeyRow{Qt::CTRL | Qt::Key_Apostrophe, InWindow, TableCommand::RepeatAbove},
    KeyRow{Qt::CTRL | Qt::Key_Semicolon, InWindow, TableCommand::InsertDateTime},
    KeyRow{Qt::SHIFT | Qt::Key_F2, InWindow, TableCommand::Zoom},
    KeyRow{Qt::CTRL | Qt::Key_G, InWindow, TableCommand::GoToRecord},
    KeyRow{Qt::CTRL | Qt::Key_D, InWindow, TableCommand::ToggleDetail},
    KeyRow{Qt::Key_F5, InWindow, TableCommand::RunAgain},
    KeyRow{Qt::Key_F6, InWindow, TableCommand::NextPane},
    KeyRow{Qt::CTRL | Qt::Key_C, InWindow, TableCommand::Copy},
    KeyRow{Qt::CTRL | Qt::Key_V, InWindow, TableCommand::Paste},
    KeyRow{Qt::CTRL | Qt::Key_W, InWindow, TableCommand::Close},
};

} // namespace

std::optional<TableCommand> CommandOfKey(KeyPlace place, QKeyCombination keys)
{
    const unsigned bit = place == KeyPlace::Grid ? InGrid : InEditor;
    keys = QKeyCombination(keys.keyboardModifiers() & ~Qt::KeypadModifier, keys.key());
    const auto row = std::ranges::find_if(
        kKeys, [&](const KeyRow& candidate) { return candidate.keys == keys && (candidate.places & bit) != 0; });
    return row == kKeys.end() ? std::nullopt : std::optional(row->command);
}

QKeyCombination ShortcutOf(TableCommand command)
{
    const auto row = std::ranges::find_if(kKeys, [command](const KeyRow& candidate) {
        return candidate.command == command && (candidate.places & InWindow) != 0;
    });
    return row == kKeys.end() ? QKeyCombination::fromCombined(0) : row->keys;
}

} // namespace mirel
