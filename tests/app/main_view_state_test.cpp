#include "app/main_view_state.h"
#include "app/shell_commands.h"

#include "resources/string_table.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const MainEntry kBirds{EntryKind::Table, u"Birds"_s, {}, false};
const MainEntry kOrders{EntryKind::Table, u"Orders"_s, {}, false};
const MainEntry kOrderForm{EntryKind::Form, u"Order form"_s, u"Orders"_s, false};

DatabaseContents Shop()
{
    return {
        .path = u"/home/ann/shop.cdb"_s,
        .tables = {kBirds, kOrders},
        .forms = {kOrderForm},
        .queries = {},
        .favorites = {{EntryKind::Form, u"Order form"_s, {}, false}, {EntryKind::Query, u"Gone"_s, {}, false}}};
}

MainViewState StateOn(MainTab tab, DatabaseContents contents = Shop())
{
    MainViewState state;
    state.Show(std::move(contents));
    state.SetTab(tab);
    return state;
}

QStringList NamesOf(const std::vector<MainEntry>& entries)
{
    QStringList names;
    for (const MainEntry& entry : entries)
        names += entry.name;
    return names;
}

TEST(MainViewState, KeepsASelectionByNameThroughRefillAndSearch)
{
    MainViewState state = StateOn(MainTab::Table);
    state.Select(kOrders);
    EXPECT_EQ(state.SelectedRow(), 1);

    DatabaseContents grown = Shop();
    grown.tables.insert(grown.tables.begin(), {EntryKind::Table, u"Airports"_s, {}, false});
    state.Show(grown);
    EXPECT_EQ(state.SelectedRow(), 2);

    state.SetSearch(u"ORD"_s);
    EXPECT_EQ(NamesOf(state.ShownEntries()), QStringList{u"Orders"_s});
    EXPECT_EQ(state.SelectedRow(), 0);
    state.SetSearch(u"air"_s);
    EXPECT_EQ(state.SelectedRow(), -1);
    EXPECT_FALSE(state.Selected());
    EXPECT_EQ(state.CurrentTable(), u"Orders"_s) << "a search hides the table, it does not unselect it";
    state.SetSearch({});
    EXPECT_EQ(state.SelectedRow(), 2);
}

TEST(MainViewState, EachTabHasItsOwnSelection)
{
    MainViewState state = StateOn(MainTab::Table);
    state.Select(kBirds);
    state.SetTab(MainTab::Form);
    EXPECT_FALSE(state.Selected());
    state.Select(kOrderForm);
    state.SetTab(MainTab::Favorites);
    state.Select(state.ShownEntries()[0]);
    EXPECT_EQ(state.Remembered(MainTab::Favorites), u"form:Order form"_s);
    EXPECT_EQ(state.Remembered(MainTab::Table), u"Birds"_s);
    EXPECT_EQ(state.Remembered(MainTab::Form), u"Order form"_s);
}

TEST(MainViewState, AVanishedTableIsNoLongerCurrent)
{
    MainViewState state = StateOn(MainTab::Table);
    state.Select(kOrders);
    DatabaseContents shrunk = Shop();
    shrunk.tables = {kBirds};
    state.Show(shrunk);
    EXPECT_EQ(state.CurrentTable(), QString());
    EXPECT_FALSE(state.Selected());
}

TEST(MainViewState, FavoritesKnowTheirTargets)
{
    const MainViewState state = StateOn(MainTab::Favorites);
    ASSERT_EQ(state.ShownEntries().size(), 2U);
    EXPECT_EQ(state.ShownEntries()[0].table, u"Orders"_s);
    EXPECT_FALSE(state.ShownEntries()[0].missing);
    EXPECT_TRUE(state.ShownEntries()[1].missing);
    EXPECT_TRUE(state.IsFavorite(kOrderForm));
    EXPECT_FALSE(state.IsFavorite({EntryKind::Table, u"Order form"_s, {}, false})) << "same name, another kind";
}

TEST(MainViewState, OffersASearchAboveTwelveEntries)
{
    for (const auto& [count, offers] : {std::pair(12, false), std::pair(13, true)}) {
        DatabaseContents many = Shop();
        many.tables.assign(size_t(count), kBirds);
        EXPECT_EQ(StateOn(MainTab::Table, many).OffersSearch(), offers) << count;
    }
}

TEST(MainViewState, OneTapOpensAndTheOtherDoesNot)
{
    MainViewState state;
    for (const bool byDouble : {true, false}) {
        state.SetOpensByDoubleTap(byDouble);
        EXPECT_EQ(state.OpensOn(Tap::Double), byDouble);
        EXPECT_EQ(state.OpensOn(Tap::Single), !byDouble);
    }
}

TEST(Favorite, TextAndEntry)
{
    const MainEntry awkward{EntryKind::Query, u"a:b\tc"_s, {}, false};
    EXPECT_EQ(FavoriteOfText(FavoriteText(awkward)), awkward);
    for (const QStringView refused : {u"", u":", u"table:", u"table", u"view:Birds", u"Table:Birds"})
        EXPECT_FALSE(FavoriteOfText(refused)) << refused.toUtf8().toStdString();
}

TEST(OutcomeOfNew, AsksForWhatIsMissing)
{
    struct Row {
        const char* what;
        MainTab tab;
        bool database;
        bool table;
        std::optional<Str> message;
        std::optional<EntryKind> make;
    };
    const Row rows[] = {
        {"table, nothing open", MainTab::Table, false, false, Str::OpenDatabaseFirst, {}},
        {"table", MainTab::Table, true, false, {}, EntryKind::Table},
        {"form, nothing open", MainTab::Form, false, false, Str::ChooseDatabaseAndTableFirst, {}},
        {"form, no table", MainTab::Form, true, false, Str::ChooseTableFirst, {}},
        {"form", MainTab::Form, true, true, {}, EntryKind::Form},
        {"query, nothing open", MainTab::Query, false, false, Str::ChooseDatabaseAndTableFirst, {}},
        {"query, no table", MainTab::Query, true, false, Str::ChooseTableFirst, {}},
        {"query", MainTab::Query, true, true, {}, EntryKind::Query},
        {"favorites", MainTab::Favorites, true, true, {}, {}},
    };
    for (const Row& row : rows) {
        MainViewState state = StateOn(MainTab::Table, row.database ? Shop() : DatabaseContents());
        if (row.table)
            state.Select(kBirds);
        state.SetTab(row.tab);
        EXPECT_EQ(OutcomeOfNew(state).message, row.message) << row.what;
        EXPECT_EQ(OutcomeOfNew(state).make, row.make) << row.what;
    }
}

TEST(Availability, FollowsTheSelection)
{
    MainViewState state = StateOn(MainTab::Table);
    const auto enabled = [&state](ShellCommand id) { return AvailabilityOf(id, state).enabled; };

    EXPECT_FALSE(enabled(ShellCommand::Open));
    EXPECT_EQ(AvailabilityOf(ShellCommand::Delete, state).tip, Str::TipSelectFirst);
    EXPECT_TRUE(enabled(ShellCommand::OpenDatabase));
    EXPECT_FALSE(enabled(ShellCommand::ExportCsv));

    state.Select(kBirds);
    EXPECT_TRUE(enabled(ShellCommand::Open));
    EXPECT_TRUE(enabled(ShellCommand::ExportCsv));
    EXPECT_TRUE(enabled(ShellCommand::Delete));
    EXPECT_TRUE(enabled(ShellCommand::AddFavorites));
    EXPECT_FALSE(enabled(ShellCommand::RemoveFavorites));

    state.SetTab(MainTab::Favorites);
    state.Select({EntryKind::Query, u"Gone"_s, {}, false});
    EXPECT_FALSE(enabled(ShellCommand::Open)) << "its query is gone";
    EXPECT_FALSE(enabled(ShellCommand::ExportCsv));
    EXPECT_FALSE(enabled(ShellCommand::AddFavorites));
    EXPECT_TRUE(enabled(ShellCommand::RemoveFavorites));
    EXPECT_FALSE(enabled(ShellCommand::Delete)) << "one way off the list";
}

} // namespace
} // namespace mirel
