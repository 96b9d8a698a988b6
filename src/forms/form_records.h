#pragma once

#include "forms/stored_text.h"

#include <QString>

#include <array>
#include <vector>

namespace mirel {

// What the system keeps of forms and saved queries. These are the fields of the store file, with their numbers
// and their order; docs/store-file.md shows the bytes. Colours are 0x00BBGGRR, kDefaultColor leaves them to
// the painter. Flags are numbers because a file may hold others than 0 and 1, and keeps them; any but 0 is
// "yes". Reserved bytes have no meaning here and come back as they were.

inline constexpr quint32 kDefaultColor = 0xFFFFFFFF;
inline constexpr qsizetype kMaxNameLength = 40;
inline constexpr qsizetype kMaxTableNameLength = 31;

struct TextStyle {
    FixedText<32> faceName; // empty: the system's default
    quint32 italic = 0;
    quint32 bold = 0;
    quint32 strikeout = 0;
    quint32 underline = 0;
    qint32 pointSize = 0; // 0: the default font's
    quint32 color = kDefaultColor;

    friend bool operator==(const TextStyle&, const TextStyle&) = default;
};

enum class ControlType : qint32 {
    None = 0,
    Label = 200,
    EditBox = 201,
    List = 202,
    DropDownBox = 203,
    Button = 204,
    CheckBox = 205,
};

enum class EditKind : qint32 { None = 0, Plain = 1, DatePicker = 5, Extendable = 6 };

enum class SourceScope : qint32 { None = 0, Record = 1, WholeResult = 2 };

enum class ButtonFunction : qint32 {
    None = 0,
    Select = 1,
    DeleteRecord = 2,
    Update = 3,
    Insert = 4, // from here to Previous, and Close and Nothing: never offered, but taken from a file
    First = 5,
    Last = 6,
    Next = 7,
    Previous = 8,
    ClearForm = 9,
    Close = 10,
    Nothing = 11,
    Recalc = 12,
    CallForm = 13,
    UpdateAll = 14,
};

// Bits of ControlDef::windowStyle that have a meaning here; the others are kept.
namespace style {
inline constexpr quint32 kAlignMask = 0x00000003;
inline constexpr quint32 kCentre = 0x00000001;
inline constexpr quint32 kRight = 0x00000002;
inline constexpr quint32 kAutoHorizontalScroll = 0x00000080;
inline constexpr quint32 kVerticalScrollBar = 0x00200000;
inline constexpr quint32 kBorder = 0x00800000;
} // namespace style

// Signs that structure a ControlSource.
inline constexpr QChar kListNameEnd{2};
inline constexpr QChar kListColumnEnd{3};
inline constexpr QChar kAssignmentTarget{5};
inline constexpr QChar kAssignmentValue{6};
inline constexpr QChar kDropDownQueryEnd{8};

struct ControlDef {
    qint32 controlId = -1; // unique within the form; the record counter's is 0
    ControlType type = ControlType::None;
    qint32 fieldBound = 0;
    qint32 hasSource = 0; // the ControlSource is in force
    EditKind editKind = EditKind::None;
    SourceScope sourceScope = SourceScope::None;
    qint32 left = -1; // pixels, form coordinates
    qint32 top = -1;
    qint32 height = -1;
    qint32 width = -1;
    quint32 windowStyle = 0; // each creator sets it
    qint32 lines = -1;       // of an extendable edit box; -1: unused
    ButtonFunction buttonFunction = ButtonFunction::None;
    quint32 backgroundColor = kDefaultColor;
    TextStyle textStyle;
    FixedText<41> name; // a label's and a button's caption as well
    FixedText<41> defaultValue;
    quint8 option1 = 0; // SELECT: default query; CALL FORM: with the current query result
    quint8 option2 = 0; // CALL FORM: close the current form
    std::array<quint8, 8> reserved{};
    std::array<quint8, 2> padding{};
    VariableText source;

    void SetSource(QStringView text) { source.Set(text); }
    void ClearSource() { source.Clear(); }

    friend bool operator==(const ControlDef&, const ControlDef&) = default;
};

struct FormDef {
    qint32 formTag = -1;
    FixedText<41> name; // unique within a database
    FixedText<33> tableName;
    qint32 width = 0; // pixels
    qint32 height = 0;
    qint32 reservedNumber = 0;
    qint32 counterA = 0;
    qint32 counterB = 0;
    quint8 raiseInputPanel = 0;
    quint8 formScrollBar = 0;
    quint8 defaultQueryOnStartup = 0;
    std::array<quint8, 3> reserved{};
    std::array<quint8, 2> padding{};
    quint32 backgroundColor = kDefaultColor;
    TextStyle textStyle;
    VariableText defaultQuery;
    std::vector<ControlDef> controls; // in tab and paint order; the record's control count is their number

    void SetName(QStringView text) { name.Set(text, kMaxNameLength); }
    void SetTableName(QStringView text) { tableName.Set(text, kMaxTableNameLength); }
    void SetDefaultQuery(QStringView text) { defaultQuery.Set(text); }
    void ClearDefaultQuery() { defaultQuery.Clear(); }
    void AddControl(ControlDef control) { controls.push_back(std::move(control)); }
    // A deep copy in which the names obey this system's lengths, whatever a foreign file held.
    void CopyFrom(const FormDef& other);

    friend bool operator==(const FormDef&, const FormDef&) = default;
};

struct QueryDef {
    FixedText<41> name;
    FixedText<33> tableName; // the table it was built on
    VariableText text;

    void SetName(QStringView newName) { name.Set(newName, kMaxNameLength); }
    void SetTableName(QStringView table) { tableName.Set(table, kMaxTableNameLength); }
    void SetText(QStringView statement) { text.Set(statement); }
    void ClearText() { text.Clear(); }

    friend bool operator==(const QueryDef&, const QueryDef&) = default;
};

} // namespace mirel
