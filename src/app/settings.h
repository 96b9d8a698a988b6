#pragma once

#include "app/display_records.h"
#include "platform/profile.h"
#include "platform/yes_no_words.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <span>
#include <string_view>

namespace mirel {

// Everything that the profile keeps, each a row of the table in settings.cpp.
enum class Setting {
    ActiveDb,
    ActiveTable,
    ActiveForm,
    ActiveQuery,
    ActiveFavorites,
    ActiveView,
    OpenByDoubleClick,
    RecentDatabases,
    MainViewBkColor,
    MainViewTextColor,
    MainViewFont,
    MainViewPalette,
    MainViewLanguage,
    MainViewTourSeen,
    TableViewMaxColumnChars,
    TableViewConfirmDelete,
    TableViewSortColumn,
    TableViewHoldingTime,
    TableViewAutoSizing,
    TableViewLeadingNumber,
    TableViewYesNo,
    TableViewBkColor,
    TableViewTextColor,
    TableViewFont,
    FormViewScroll,
    FormViewConfirmDelete,
    FormViewMaxColumnChars,
    FormViewHoldingTime,
    FormViewSortColumn,
    FormViewConfirmSave,
    FormViewSaveAnswer,
    FormViewUpdateAggregate,
    FormViewYesNo,
    FormViewFitToWindow,
};

enum class SettingKind { Text, Integer, Colors, Font, YesNo };

struct SettingRow {
    Setting id;
    std::u16string_view section;
    std::u16string_view key;
    SettingKind kind;
    std::u16string_view fallback; // of an unset key, as text
    std::u16string_view meaning;  // for people
};

// The configuration: the profile's keys with their types and defaults. Each call goes to the profile, so that
// another window's choice is seen; a damaged value reads as the default.
//
// The words for Yes and No are one pair for the whole program: both sections' keys read the table view's, and
// writing either writes both. Colours have no default here, because the desktop's palette gives it: an unset
// record reads as empty.
class Settings {
public:
    explicit Settings(Profile profile);

    static std::span<const SettingRow> Rows(); // by section, as they are shown
    static const SettingRow& Row(Setting setting);
    static const SettingRow* Find(QStringView section, QStringView key); // in any case; null: no such setting
    // Whether `text` reads as a value of that kind.
    static bool Accepts(const SettingRow& row, const QString& text);

    QString Text(Setting setting) const;
    int Int(Setting setting) const; // 0 for one that is no number
    bool Flag(Setting setting) const { return Int(setting) != 0; }
    std::optional<ColorRecord> Colors(Setting setting) const;
    FontDesc Font(Setting setting) const;
    YesNoWords Words() const;
    QStringList RecentDatabases() const; // full paths, the latest first

    // False when the text is not accepted or the profile cannot be written; the setting is then as it was.
    bool SetText(Setting setting, const QString& text);
    bool SetInt(Setting setting, int number) { return SetText(setting, QString::number(number)); }
    bool SetColors(Setting setting, const ColorRecord& record);
    bool SetFont(Setting setting, const FontDesc& font);
    bool AddRecentDatabase(const QString& path);
    bool ForgetDatabase(const QString& path);

private:
    bool WriteRecent(const QStringList& paths);

    Profile profile_;
};

} // namespace mirel
