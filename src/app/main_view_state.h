#pragma once

#include "platform/tap.h"

#include <QString>

#include <array>
#include <optional>
#include <vector>

namespace mirel {

// The four lists of the main view. The numbers are the positions of the tabs and stand in the profile.
enum class MainTab : int { Favorites = 0, Table = 1, Form = 2, Query = 3 };
constexpr int kMainTabs = 4;

enum class EntryKind { Table, Form, Query };

// A table, form or saved query of the open database, as a list of the main view shows it.
struct MainEntry {
    EntryKind kind = EntryKind::Table;
    QString name;
    QString table;        // what a form or query was made for; empty for a table
    bool missing = false; // a favorite whose table, form or query is gone

    friend bool operator==(const MainEntry&, const MainEntry&) = default;
};

// What a database holds that the main view lists, each in the order in which it is shown.
struct DatabaseContents {
    QString path; // empty: no database is open; the lists are then empty as well
    std::vector<MainEntry> tables;
    std::vector<MainEntry> forms;
    std::vector<MainEntry> queries;
    std::vector<MainEntry> favorites; // `table` and `missing` are filled in by MainViewState

    friend bool operator==(const DatabaseContents&, const DatabaseContents&) = default;
};

// What the main view shows: four lists, the tab in front, what is selected on each, what is searched for. No
// window and no database in sight; the view paints this and hands it the user's actions.
//
// Rows count from 0 in the list as shown, that is with the search applied; -1 is none. A selection is kept by
// name, so that it outlives a refill, a search and the program.
class MainViewState {
public:
    // Lists above this length get a line to search in.
    static constexpr int kEntriesWithoutSearch = 12;

    void Show(DatabaseContents contents);          // another database ends the search
    bool ShowIfChanged(DatabaseContents contents); // true: they are others than before
    bool HasDatabase() const { return !contents_.path.isEmpty(); }
    QString DatabasePath() const { return contents_.path; }
    QString DatabaseName() const; // the file's name; empty without a database

    MainTab Tab() const { return tab_; }
    void SetTab(MainTab tab);                    // ends the search
    void SetSection(MainTab tab) { tab_ = tab; } // the same where one search goes through all of them

    const std::vector<MainEntry>& Entries(MainTab tab) const;
    std::vector<MainEntry> ShownEntries() const;
    // The entries of any tab whose names contain `text`; all of them for an empty one.
    std::vector<MainEntry> EntriesWith(MainTab tab, const QString& text) const;
    bool OffersSearch() const;
    QString Search() const { return search_; }
    void SetSearch(QString text) { search_ = std::move(text); }

    void Select(const MainEntry& entry); // in the tab in front
    void SelectNothing() { Remember(tab_, {}); }
    int SelectedRow() const;
    // The entry in force on the tab in front; empty when what was selected is not (or no longer) in the list.
    std::optional<MainEntry> Selected() const;
    // The table that a new form or query is made for: the one selected under Table. Empty: none.
    QString CurrentTable() const;

    // What is remembered of a tab: a name; for the favorites an entry of the favorites file ("table:Birds").
    QString Remembered(MainTab tab) const { return remembered_[size_t(tab)]; }
    void Remember(MainTab tab, QString text) { remembered_[size_t(tab)] = std::move(text); }

    bool OpensByDoubleTap() const { return opensByDoubleTap_; }
    void SetOpensByDoubleTap(bool doubleTap) { opensByDoubleTap_ = doubleTap; }
    // Whether that tap on an entry opens it: exactly one of the two does.
    bool OpensOn(Tap tap) const { return (tap == Tap::Double) == opensByDoubleTap_; }

    bool IsFavorite(const MainEntry& entry) const;

private:
    std::optional<MainEntry> Find(MainTab tab, const QString& remembered) const;

    DatabaseContents contents_;
    MainTab tab_ = MainTab::Table;
    QString search_;
    std::array<QString, kMainTabs> remembered_;
    bool opensByDoubleTap_ = true;
};

// A favorite as the favorites file names it: "table:Birds", "form:Orders", "query:Open orders".
QString FavoriteText(const MainEntry& entry);
std::optional<MainEntry> FavoriteOfText(QStringView text);

} // namespace mirel
