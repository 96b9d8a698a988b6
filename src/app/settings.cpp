#include "app/settings.h"

#include <algorithm>
#include <array>
#include <utility>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;
using enum SettingKind;

constexpr std::u16string_view kDefaultFont = u"(0,0,0,0,9,\"Tahoma\")";

constexpr std::array kSettings = {
    SettingRow{Setting::ActiveDb, u"Config", u"ActiveDB", Text, u"", u"database open at the end of the last run"},
    SettingRow{Setting::ActiveTable, u"Config", u"ActiveTable", Text, u"", u"table selected last"},
    SettingRow{Setting::ActiveForm, u"Config", u"ActiveForm", Text, u"", u"form selected last"},
    SettingRow{Setting::ActiveQuery, u"Config", u"ActiveQuery", Text, u"", u"query selected last"},
    SettingRow{Setting::ActiveFavorites, u"Config", u"ActiveFavorites", Text, u"", u"favourite selected last"},
    SettingRow{Setting::ActiveView, u"Config", u"ActiveView", Text, u"", u"view shown last"},
    SettingRow{Setting::OpenByDoubleClick, u"Config", u"openByDoubleClick", Integer, u"1",
               u"1: an entry opens on a double tap; 0: on a single one"},
    SettingRow{Setting::RecentDatabases, u"Config", u"recentDatabases", Text, u"",
               u"recent databases, a line each, the latest first"},
    SettingRow{Setting::MainViewBkColor, u"MainView", u"BkColor", Colors, u"", u"background colours"},
    SettingRow{Setting::MainViewTextColor, u"MainView", u"TextColor", Colors, u"", u"text colours"},
    SettingRow{Setting::MainViewFont, u"MainView", u"Font", Font, kDefaultFont, u"font"},
    SettingRow{Setting::MainViewPalette, u"MainView", u"palette", Text, u"own",
               u"own, light or dark: the program's own look; desktop: the desktop's"},
    SettingRow{Setting::MainViewLanguage, u"MainView", u"language", Text, u"",
               u"language of the window, such as de; empty: the system's"},
    SettingRow{Setting::MainViewTourSeen, u"MainView", u"tourSeen", Integer, u"0",
               u"1: the tour of the first start has been shown"},
    SettingRow{Setting::TableViewMaxColumnChars, u"TableView", u"maxColumnChars", Integer, u"50",
               u"widest column of the record grid, in characters"},
    SettingRow{Setting::TableViewConfirmDelete, u"TableView", u"confirmDelete", Integer, u"1",
               u"ask before deleting a record"},
    SettingRow{Setting::TableViewSortColumn, u"TableView", u"sortColumn", Integer, u"0",
               u"sort by tapping a column header"},
    SettingRow{Setting::TableViewHoldingTime, u"TableView", u"tabnholdingTime", Integer, u"400",
               u"tap-and-hold time in milliseconds"},
    SettingRow{Setting::TableViewAutoSizing, u"TableView", u"autoSizing", Integer, u"1",
               u"size columns to their contents"},
    SettingRow{Setting::TableViewLeadingNumber, u"TableView", u"leadingNumber", Integer, u"0",
               u"a typed number is what its text begins with, not the whole of it"},
    SettingRow{Setting::TableViewYesNo, u"TableView", u"yesnoString", YesNo, u"Yes/No",
               u"words for true and false; one pair with the form view's"},
    SettingRow{Setting::TableViewBkColor, u"TableView", u"BkColor", Colors, u"", u"background colours"},
    SettingRow{Setting::TableViewTextColor, u"TableView", u"TextColor", Colors, u"", u"text colours"},
    SettingRow{Setting::TableViewFont, u"TableView", u"Font", Font, kDefaultFont, u"font"},
    SettingRow{Setting::FormViewScroll, u"FormView", u"nScroll", Integer, u"10", u"scroll amount"},
    SettingRow{Setting::FormViewConfirmDelete, u"FormView", u"confirmDelete", Integer, u"1",
               u"ask before deleting a record"},
    SettingRow{Setting::FormViewMaxColumnChars, u"FormView", u"maxColumnChars", Integer, u"50",
               u"widest list column, in characters"},
    SettingRow{Setting::FormViewHoldingTime, u"FormView", u"tabnholdingTime", Integer, u"400",
               u"tap-and-hold time in milliseconds"},
    SettingRow{Setting::FormViewSortColumn, u"FormView", u"sortColumn", Integer, u"0",
               u"sort by tapping a column header"},
    SettingRow{Setting::FormViewConfirmSave, u"FormView", u"confirmSave", Integer, u"1",
               u"ask before saving changes"},
    SettingRow{Setting::FormViewSaveAnswer, u"FormView", u"saveAsThirdAnswer", Integer, u"0",
               u"that question can be answered by saving, too"},
    SettingRow{Setting::FormViewUpdateAggregate, u"FormView", u"updateAggregate", Integer, u"0",
               u"bring aggregate fields up to date"},
    SettingRow{Setting::FormViewYesNo, u"FormView", u"yesnoString", YesNo, u"Yes/No",
               u"words for true and false; one pair with the table view's"},
    SettingRow{Setting::FormViewFitToWindow, u"FormView", u"fitToWindow", Integer, u"1",
               u"scale forms to their window"},
};

constexpr bool RowsStandInTheOrderOfTheirIds()
{
    for (size_t i = 0; i < kSettings.size(); ++i) {
        if (size_t(kSettings[i].id) != i)
            return false;
    }
    return true;
}
static_assert(RowsStandInTheOrderOfTheirIds());

constexpr qsizetype kMaxRecentDatabases = 12;

QString Copy(std::u16string_view text)
{
    return QStringView(text).toString();
}

} // namespace

Settings::Settings(Profile profile)
    : profile_(std::move(profile))
{
}

std::span<const SettingRow> Settings::Rows()
{
    return kSettings;
}

const SettingRow& Settings::Row(Setting setting)
{
    return kSettings[size_t(setting)];
}

const SettingRow* Settings::Find(QStringView section, QStringView key)
{
    const auto row = std::ranges::find_if(kSettings, [=](const SettingRow& each) {
        return section.compare(QStringView(each.section), Qt::CaseInsensitive) == 0 &&
               key.compare(QStringView(each.key), Qt::CaseInsensitive) == 0;
    });
    return row == kSettings.end() ? nullptr : &*row;
}

bool Settings::Accepts(const SettingRow& row, const QString& text)
{
    bool isNumber = false;
    switch (row.kind) {
    case SettingKind::Text:
        return true;
    case SettingKind::Integer:
        (void)text.toInt(&isNumber);
        return isNumber;
    case SettingKind::Colors:
        return text.isEmpty() || ReadColorRecord(text).has_value();
    case SettingKind::Font:
        return ReadFontRecord(text).has_value();
    case SettingKind::YesNo:
        return text.contains(u'/');
    }
    return false;
}

QString Settings::Text(Setting setting) const
{
    const SettingRow& row = Row(setting == Setting::FormViewYesNo ? Setting::TableViewYesNo : setting);
    const QString fallback = Copy(row.fallback);
    const QString text = profile_.ReadText(Copy(row.section), Copy(row.key), fallback);
    return Accepts(row, text) ? text : fallback;
}

int Settings::Int(Setting setting) const
{
    return Text(setting).toInt();
}

std::optional<ColorRecord> Settings::Colors(Setting setting) const
{
    return ReadColorRecord(Text(setting));
}

FontDesc Settings::Font(Setting setting) const
{
    return ReadFontRecord(Text(setting)).value_or(FontDesc());
}

YesNoWords Settings::Words() const
{
    return YesNoWords::FromSetting(Text(Setting::TableViewYesNo), {});
}

bool Settings::SetText(Setting setting, const QString& text)
{
    const SettingRow& row = Row(setting);
    if (!Accepts(row, text))
        return false;
    if (row.kind != SettingKind::YesNo)
        return profile_.WriteText(Copy(row.section), Copy(row.key), text);
    return std::ranges::all_of(kSettings, [&](const SettingRow& each) {
        return each.kind != SettingKind::YesNo || profile_.WriteText(Copy(each.section), Copy(each.key), text);
    });
}

bool Settings::SetColors(Setting setting, const ColorRecord& record)
{
    return SetText(setting, ColorRecordText(record));
}

bool Settings::SetFont(Setting setting, const FontDesc& font)
{
    return SetText(setting, FontRecordText(font));
}

QStringList Settings::RecentDatabases() const
{
    return Text(Setting::RecentDatabases).split(u'\n', Qt::SkipEmptyParts);
}

bool Settings::AddRecentDatabase(const QString& path)
{
    QStringList paths = RecentDatabases();
    if (paths.value(0) == path)
        return true;
    paths.removeAll(path);
    paths.prepend(path);
    return WriteRecent(paths);
}

bool Settings::ForgetDatabase(const QString& path)
{
    QStringList paths = RecentDatabases();
    return paths.removeAll(path) == 0 || WriteRecent(paths);
}

bool Settings::WriteRecent(const QStringList& paths)
{
    return SetText(Setting::RecentDatabases, paths.first(std::min(paths.size(), kMaxRecentDatabases)).join(u'\n'));
}

} // namespace mirel
