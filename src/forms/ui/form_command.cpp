#include "forms/ui/form_command.h"

#include "resources/string_table.h"

#include <array>

namespace mirel {
namespace {

using enum FormCommand;

constexpr bool kCheckable = true;
constexpr bool kLater = false;

// The tips of the tool bar are the commands' names. An editor keeps the keys that move within its text.
constexpr std::array kCommands = {
    FormCommandDef{First, Str::FormFirst, Str::FormFirstTip, u"go-first", u"Ctrl+Home"},
    FormCommandDef{Previous, Str::FormPrevious, Str::FormPreviousTip, u"go-previous", u"Ctrl+PgUp"},
    FormCommandDef{Next, Str::FormNext, Str::FormNextTip, u"go-next", u"Ctrl+PgDown"},
    FormCommandDef{Last, Str::FormLast, Str::FormLastTip, u"go-last", u"Ctrl+End"},
    FormCommandDef{AddRecord, Str::FormAdd, Str::FormAddTip, u"list-add", u"Ctrl+N"},
    FormCommandDef{DeleteRecord, Str::FormDelete, Str::FormDeleteTip, u"list-remove", u"Ctrl+Del"},
    FormCommandDef{ScrollUp, Str::FormScrollUp, Str::FormScrollUpTip, u"go-up", u"Alt+PgUp"},
    FormCommandDef{ScrollDown, Str::FormScrollDown, Str::FormScrollDownTip, u"go-down", u"Alt+PgDown"},
    FormCommandDef{ScrollBar, Str::FormScrollBar, Str::FormScrollBarTip, u"mirel-scrollbar", u"", kCheckable},
    FormCommandDef{FitToWindow, Str::FormFit, Str::FormFitTip, u"", u"", kCheckable},
    FormCommandDef{Detail, Str::FormDetail, Str::FormDetailTip, u"view-list-details", u"Ctrl+D", kCheckable},
    FormCommandDef{List, Str::FormList, Str::FormListTip, u"view-list-text", u"Ctrl+L", kCheckable},
    FormCommandDef{Save, Str::FormSave, Str::FormSaveTip, u"document-save", u"Ctrl+S"},
    FormCommandDef{Recalculate, Str::FormRecalculate, Str::FormRecalculateTip, u"view-refresh", u"F5"},
    FormCommandDef{Zoom, Str::FormZoom, Str::ZoomTip, u"zoom-in", u"Shift+F2"},
    FormCommandDef{Copy, Str::ActionCopy, Str::FormCopyTip, u"edit-copy", u""},
    FormCommandDef{Paste, Str::ActionPaste, Str::FormPasteTip, u"edit-paste", u""},
    FormCommandDef{FilterBy, Str::FormFilterBy, Str::FormFilterByTip, u"view-filter", u""},
    FormCommandDef{FilterExcluding, Str::FormFilterExcluding, Str::FormFilterExcludingTip, u"", u""},
    FormCommandDef{RemoveFilter, Str::ActionRemoveFilter, Str::ActionRemoveFilterTip, u"edit-clear", u""},
    FormCommandDef{SortAscending, Str::FormSortAscending, Str::FormSortAscendingTip, u"view-sort-ascending", u""},
    FormCommandDef{SortDescending, Str::FormSortDescending, Str::FormSortDescendingTip, u"view-sort-descending",
                   u""},
    FormCommandDef{Options, Str::ActionOptions, Str::FormOptionsTip, u"configure", u""},
    FormCommandDef{EditForm, Str::FormEdit, Str::FormEditTip, u"document-edit", u"", !kCheckable, kLater},
    FormCommandDef{Keys, Str::CommandKeys, Str::TipKeys, u"", u"Ctrl+/"},
    FormCommandDef{Help, Str::CommandHelp, Str::TipHelp, u"help-contents", u"F1", !kCheckable, kLater},
    FormCommandDef{Close, Str::ActionClose, Str::FormCloseTip, u"", u"Ctrl+W"},
};
static_assert([] {
    for (size_t i = 0; i < kCommands.size(); ++i) {
        if (kCommands[i].id != FormCommand(i))
            return false;
    }
    return kCommands.size() == size_t(Close) + 1;
}());

constexpr FormMenuEntry kLine = std::nullopt;

constexpr std::array<FormMenuEntry, 11> kToolBar = {
    First, Previous, Next, Last, kLine, AddRecord, DeleteRecord, kLine, ScrollUp, ScrollDown, ScrollBar};
constexpr std::array<FormMenuEntry, 10> kFileMenu = {Save,     Recalculate, Zoom, kLine, Options,
                                                     EditForm, Keys,        Help, kLine, Close};
constexpr std::array<FormMenuEntry, 14> kRecordMenu = {
    First,    Previous,        Next,         Last,  kLine,         AddRecord,     DeleteRecord, kLine,
    FilterBy, FilterExcluding, RemoveFilter, kLine, SortAscending, SortDescending};
constexpr std::array<FormMenuEntry, 7> kViewMenu = {ScrollBar,   ScrollUp, ScrollDown, kLine,
                                                    FitToWindow, Detail,   List};
constexpr std::array<FormMenuEntry, 10> kPopupMenu = {
    FilterBy, FilterExcluding, RemoveFilter, kLine, SortAscending, SortDescending, kLine, Copy, Paste, Zoom};

} // namespace

std::span<const FormCommandDef> FormCommands()
{
    return kCommands;
}

std::span<const FormMenuEntry> FormToolBar()
{
    return kToolBar;
}

std::span<const FormMenuEntry> FormFileMenu()
{
    return kFileMenu;
}

std::span<const FormMenuEntry> FormRecordMenu()
{
    return kRecordMenu;
}

std::span<const FormMenuEntry> FormViewMenu()
{
    return kViewMenu;
}

std::span<const FormMenuEntry> FormPopupMenu()
{
    return kPopupMenu;
}

} // namespace mirel
