#include "app/shell_commands.h"

#include "resources/string_table.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using enum ShellCommand;

constexpr bool kLater = false;
constexpr bool kSeparated = true;

constexpr std::array kCommands = {
    ShellCommandDef{AddFavorites, ShellMenu::File, Str::CommandAddFavorites, Str::TipAddFavorites, u"bookmark-new",
                    u"Ctrl+B"},
    ShellCommandDef{RemoveFavorites, ShellMenu::File, Str::CommandRemoveFavorites, Str::TipRemoveFavorites,
                    u"list-remove", u""},
    ShellCommandDef{OpenByDoubleClicking, ShellMenu::File, Str::CommandOpenByDoubleClicking,
                    Str::TipOpenByDoubleClicking, u"", u""},
    ShellCommandDef{ImportCsv, ShellMenu::File, Str::CommandImportCsv, Str::TipImportCsv, u"document-import", u"",
                    kLater, kSeparated},
    ShellCommandDef{ExportCsv, ShellMenu::File, Str::CommandExportCsv, Str::TipExportCsv, u"document-export", u""},
    ShellCommandDef{Exit, ShellMenu::File, Str::CommandExit, Str::TipExit, u"application-exit", u"Ctrl+Q", true,
                    kSeparated},
    ShellCommandDef{Font, ShellMenu::Layout, Str::CommandFont, Str::TipFont, u"preferences-desktop-font", u""},
    ShellCommandDef{BackgroundColor, ShellMenu::Layout, Str::CommandBackgroundColor, Str::TipColor, u"", u""},
    ShellCommandDef{ListBackgroundColor, ShellMenu::Layout, Str::CommandListBackgroundColor, Str::TipColor, u"",
                    u""},
    ShellCommandDef{ButtonBackgroundColor, ShellMenu::Layout, Str::CommandButtonBackgroundColor, Str::TipColor,
                    u"", u""},
    ShellCommandDef{DatabaseTextColor, ShellMenu::Layout, Str::CommandDatabaseTextColor, Str::TipColor, u"", u""},
    ShellCommandDef{ListTextColor, ShellMenu::Layout, Str::CommandListTextColor, Str::TipColor, u"", u""},
    ShellCommandDef{ButtonTextColor, ShellMenu::Layout, Str::CommandButtonTextColor, Str::TipColor, u"", u""},
    ShellCommandDef{ResetLayout, ShellMenu::Layout, Str::LayoutReset, Str::LayoutResetTip, u"", u"", true,
                    kSeparated},
    ShellCommandDef{OpenDatabase, ShellMenu::Database, Str::CommandOpenDatabase, Str::TipOpenDatabase,
                    u"document-open", u"Ctrl+O"},
    ShellCommandDef{NewDatabase, ShellMenu::Database, Str::CommandNewDatabase, Str::TipNewDatabase,
                    u"document-new", u"Ctrl+Shift+N"},
    ShellCommandDef{DeleteDatabase, ShellMenu::Database, Str::CommandDeleteDatabase, Str::TipDeleteDatabase,
                    u"edit-delete", u""},
    ShellCommandDef{OpenSample, ShellMenu::Database, Str::CommandOpenSample, Str::TipOpenSample, u"mirel-sample",
                    u"", true, kSeparated},
    ShellCommandDef{Help, ShellMenu::Help, Str::CommandHelp, Str::TipHelp, u"help-contents", u"F1", kLater},
    ShellCommandDef{Keys, ShellMenu::Help, Str::CommandKeys, Str::TipKeys, u"", u"Ctrl+/"},
    ShellCommandDef{About, ShellMenu::Help, Str::CommandAbout, Str::TipAbout, u"help-about", u"", true,
                    kSeparated},
    ShellCommandDef{Open, ShellMenu::Entry, Str::CommandOpen, Str::TipOpen, u"mirel-open", u""},
    ShellCommandDef{New, ShellMenu::Entry, Str::CommandNew, Str::TipNew, u"list-add", u"Ctrl+N"},
    ShellCommandDef{Edit, ShellMenu::Entry, Str::CommandEdit, Str::TipEdit, u"document-edit", u"F2"},
    ShellCommandDef{Rename, ShellMenu::Entry, Str::CommandRename, Str::TipRename, u"", u"Shift+F2"},
    ShellCommandDef{Delete, ShellMenu::Entry, Str::CommandDelete, Str::TipDelete, u"edit-delete", u"Del"},
};

constexpr bool EachOnce()
{
    for (size_t i = 0; i < kCommands.size(); ++i) {
        for (size_t j = i + 1; j < kCommands.size(); ++j) {
            if (kCommands[i].id == kCommands[j].id)
                return false;
        }
    }
    return true;
}
static_assert(EachOnce());
static_assert(kCommands.size() == size_t(Delete) + 1, "every command has its row");

// What there is of a kind, beside tables of data: the tool that opens it and the one that changes it.
struct KindTools {
    EntryKind kind;
    Str newTip;
    Str editTip;
    bool opens;
    Str openTip;
};
constexpr std::array kKindTools = {
    KindTools{EntryKind::Table, Str::TipNewTable, Str::TipEditTable, true, Str::TipOpen},
    KindTools{EntryKind::Form, Str::TipNewForm, Str::TipEditForm, true, Str::TipRunForm},
    KindTools{EntryKind::Query, Str::TipNewQuery, Str::TipEditQuery, true, Str::TipOpen},
};

const KindTools& ToolsOf(EntryKind kind)
{
    return *std::ranges::find(kKindTools, kind, &KindTools::kind);
}

Availability AvailabilityOfNew(const MainViewState& state)
{
    const NewOutcome outcome = OutcomeOfNew(state);
    if (outcome.message)
        return {true, Str::TipNew};
    if (outcome.make == EntryKind::Form || outcome.make == EntryKind::Table)
        return {true, ToolsOf(*outcome.make).newTip};
    return {false, outcome.make ? ToolsOf(*outcome.make).newTip : Str::TipNewFavorite};
}

// Of a command that acts on the selected entry.
Availability AvailabilityOnEntry(ShellCommand id, const MainEntry& entry, const MainViewState& state)
{
    switch (id) {
    case AddFavorites:
        return {!state.IsFavorite(entry), Str::TipAddFavorites};
    case RemoveFavorites:
        return {state.IsFavorite(entry), Str::TipRemoveFavorites};
    case Open:
        return {ToolsOf(entry.kind).opens && !entry.missing, ToolsOf(entry.kind).openTip};
    case ExportCsv:
        return {entry.kind != EntryKind::Form && !entry.missing, Str::TipExportCsv};
    case Edit:
        return {entry.kind == EntryKind::Table && !entry.missing, ToolsOf(entry.kind).editTip};
    case Rename:
        return {!entry.missing, Str::TipRename};
    default:
        break;
    }
    return {true, state.Tab() == MainTab::Favorites ? Str::TipRemoveFavorites : Str::TipDelete};
}

bool ActsOnEntry(ShellCommand id)
{
    return id == AddFavorites || id == RemoveFavorites || id == ExportCsv || id == Open || id == Edit ||
           id == Rename || id == Delete;
}

} // namespace

std::span<const ShellCommandDef> ShellCommands()
{
    return kCommands;
}

const ShellCommandDef& DefinitionOf(ShellCommand id)
{
    return *std::ranges::find(kCommands, id, &ShellCommandDef::id);
}

Availability AvailabilityOf(ShellCommand id, const MainViewState& state)
{
    const ShellCommandDef& definition = DefinitionOf(id);
    if (!definition.built)
        return {false, definition.tip};
    if (id == New)
        return AvailabilityOfNew(state);
    if (!ActsOnEntry(id))
        return {true, definition.tip};
    const std::optional<MainEntry> entry = state.Selected();
    return entry ? AvailabilityOnEntry(id, *entry, state) : Availability{false, Str::TipSelectFirst};
}

NewOutcome OutcomeOfNew(const MainViewState& state)
{
    switch (state.Tab()) {
    case MainTab::Favorites:
        return {};
    case MainTab::Table:
        if (!state.HasDatabase())
            return {Str::OpenDatabaseFirst, {}};
        return {{}, EntryKind::Table};
    case MainTab::Form:
    case MainTab::Query:
        break;
    }
    if (!state.HasDatabase())
        return {Str::ChooseDatabaseAndTableFirst, {}};
    if (state.CurrentTable().isEmpty())
        return {Str::ChooseTableFirst, {}};
    return {{}, state.Tab() == MainTab::Form ? EntryKind::Form : EntryKind::Query};
}

Str EmptyListText(MainTab tab)
{
    constexpr std::array kTexts = {Str::EmptyFavorites, Str::EmptyTables, Str::EmptyForms, Str::EmptyQueries};
    return kTexts[size_t(tab)];
}

Str TabText(MainTab tab)
{
    constexpr std::array kTexts = {Str::TabFavorites, Str::TabTable, Str::TabForm, Str::TabQuery};
    return kTexts[size_t(tab)];
}

} // namespace mirel
