#include "app/shell_commands.h"

#include "resources/string_table.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using enum ShellCommand;

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
    if (outcome.make)
        return {true, ToolsOf(*outcome.make).newTip};
    return {false, Str::TipNewFavorite};
}

// Of a command that acts on the selected entry.
Availability AvailabilityOnEntry(ShellCommand id, const MainEntry& entry, const MainViewState& state)
{
    switch (id) {
    // One way each: off the list of favorites on the favorites alone, and deleted everywhere else.
    case AddFavorites:
        return {!state.IsFavorite(entry), Str::TipAddFavorites};
    case RemoveFavorites:
        if (state.Tab() == MainTab::Favorites)
            return {true, Str::TipRemoveFavorites};
        return {false, Str::TipOnlyOnFavorites};
    case Open:
        return {ToolsOf(entry.kind).opens && !entry.missing, ToolsOf(entry.kind).openTip};
    case ExportCsv:
        return {entry.kind != EntryKind::Form && !entry.missing, Str::TipExportCsv};
    case Edit:
        return {!entry.missing, ToolsOf(entry.kind).editTip};
    case Rename:
        return {!entry.missing, Str::TipRename};
    default:
        break;
    }
    if (state.Tab() == MainTab::Favorites)
        return {false, Str::TipFavoriteNoDelete};
    return {true, Str::TipDelete};
}

bool ActsOnEntry(ShellCommand id)
{
    return id == AddFavorites || id == RemoveFavorites || id == ExportCsv || id == Open || id == Edit ||
           id == Rename || id == Delete;
}

} // namespace

Availability AvailabilityOf(ShellCommand id, const MainViewState& state)
{
    if (id == New)
        return AvailabilityOfNew(state);
    if (!ActsOnEntry(id))
        return {true, std::nullopt};
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

Str SectionText(MainTab tab)
{
    constexpr std::array kTexts = {Str::SectionFavorites, Str::SectionTables, Str::SectionForms,
                                   Str::SectionQueries};
    return kTexts[size_t(tab)];
}

Str TabText(MainTab tab)
{
    constexpr std::array kTexts = {Str::TabFavorites, Str::TabTable, Str::TabForm, Str::TabQuery};
    return kTexts[size_t(tab)];
}

} // namespace mirel
