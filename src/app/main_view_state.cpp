#include "app/main_view_state.h"

#include <QFileInfo>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct KindName {
    EntryKind kind;
    QStringView name;
};
const std::array kKindNames = {
    KindName{EntryKind::Table, u"table"},
    KindName{EntryKind::Form, u"form"},
    KindName{EntryKind::Query, u"query"},
};

QString RememberedTextOf(MainTab tab, const MainEntry& entry)
{
    return tab == MainTab::Favorites ? FavoriteText(entry) : entry.name;
}

bool SameThing(const MainEntry& one, const MainEntry& other)
{
    return one.kind == other.kind && one.name == other.name;
}

} // namespace

QString FavoriteText(const MainEntry& entry)
{
    const auto kind = std::ranges::find(kKindNames, entry.kind, &KindName::kind);
    return u"%1:%2"_s.arg(kind->name, entry.name);
}

std::optional<MainEntry> FavoriteOfText(QStringView text)
{
    const qsizetype colon = text.indexOf(u':');
    const auto kind = std::ranges::find(kKindNames, text.left(qMax<qsizetype>(colon, 0)), &KindName::name);
    if (kind == kKindNames.end() || colon + 1 == text.size())
        return std::nullopt;
    return MainEntry{kind->kind, text.mid(colon + 1).toString(), {}, false};
}

void MainViewState::Show(DatabaseContents contents)
{
    (void)ShowIfChanged(std::move(contents));
}

bool MainViewState::ShowIfChanged(DatabaseContents contents)
{
    for (MainEntry& favorite : contents.favorites) {
        const std::vector<MainEntry>& kind = favorite.kind == EntryKind::Table  ? contents.tables
                                             : favorite.kind == EntryKind::Form ? contents.forms
                                                                                : contents.queries;
        const auto target = std::ranges::find(kind, favorite.name, &MainEntry::name);
        favorite.missing = target == kind.end();
        favorite.table = favorite.missing ? QString() : target->table;
    }
    if (contents == contents_)
        return false;
    if (contents.path != contents_.path)
        search_.clear();
    contents_ = std::move(contents);
    return true;
}

QString MainViewState::DatabaseName() const
{
    return QFileInfo(contents_.path).fileName();
}

void MainViewState::SetTab(MainTab tab)
{
    tab_ = tab;
    search_.clear();
}

const std::vector<MainEntry>& MainViewState::Entries(MainTab tab) const
{
    switch (tab) {
    case MainTab::Favorites:
        return contents_.favorites;
    case MainTab::Table:
        return contents_.tables;
    case MainTab::Form:
        return contents_.forms;
    case MainTab::Query:
        break;
    }
    return contents_.queries;
}

std::vector<MainEntry> MainViewState::ShownEntries() const
{
    return EntriesWith(tab_, search_);
}

std::vector<MainEntry> MainViewState::EntriesWith(MainTab tab, const QString& text) const
{
    const std::vector<MainEntry>& all = Entries(tab);
    if (text.isEmpty())
        return all;
    std::vector<MainEntry> shown;
    std::ranges::copy_if(all, std::back_inserter(shown), [&text](const MainEntry& entry) {
        return entry.name.contains(text, Qt::CaseInsensitive);
    });
    return shown;
}

bool MainViewState::OffersSearch() const
{
    return Entries(tab_).size() > size_t(kEntriesWithoutSearch);
}

void MainViewState::Select(const MainEntry& entry)
{
    Remember(tab_, RememberedTextOf(tab_, entry));
}

int MainViewState::SelectedRow() const
{
    const std::vector<MainEntry> shown = ShownEntries();
    const auto row = std::ranges::find_if(
        shown, [this](const MainEntry& entry) { return RememberedTextOf(tab_, entry) == Remembered(tab_); });
    return row == shown.end() ? -1 : int(row - shown.begin());
}

std::optional<MainEntry> MainViewState::Selected() const
{
    const int row = SelectedRow();
    return row < 0 ? std::nullopt : std::optional(ShownEntries()[size_t(row)]);
}

QString MainViewState::CurrentTable() const
{
    const std::optional<MainEntry> table = Find(MainTab::Table, Remembered(MainTab::Table));
    return table ? table->name : QString();
}

bool MainViewState::IsFavorite(const MainEntry& entry) const
{
    return std::ranges::any_of(contents_.favorites,
                               [&](const MainEntry& favorite) { return SameThing(favorite, entry); });
}

std::optional<MainEntry> MainViewState::Find(MainTab tab, const QString& remembered) const
{
    const std::vector<MainEntry>& entries = Entries(tab);
    const auto found = std::ranges::find_if(
        entries, [&](const MainEntry& entry) { return RememberedTextOf(tab, entry) == remembered; });
    return found == entries.end() ? std::nullopt : std::optional(*found);
}

} // namespace mirel
