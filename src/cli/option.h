#pragma once

#include <QString>

#include <optional>
#include <span>

namespace mirel::cli {

// Every option of the program. The table of commands says which command takes which.
enum class Opt {
    Home,
    Help,
    Version,
    Timing,
    Yes,
    Format,
    Offset,
    Limit,
    Table,
    Create,
    Columns,
    Header,
    Separator,
    Quote,
    DateOrder,
    DateSeparator,
    TimeSeparator,
    DoubledQuotes,
    Encoding,
    WholeTexts,
    Detect,
    NoHeader,
    QuotedLines,
    Decimal,
    SkipTo,
    Key,
    Bom,
    Database,
    Source,
    Record,
    All,
    Condition,
    Control,
    Tree,
    Explain,
    Query,
    Set,
    Press,
    Name,
    Replace,
};

// What an option's value must be; any other value is refused before the command runs.
enum class ValueKind { Flag, Text, Count, Format, Separator, Quote, Character, DateOrder, Decimal };

struct OptionDef {
    Opt id;
    const char* name; // with its dashes
    ValueKind kind;
    const char* value; // the value's name in the help; empty for a flag
    const char* help;
};

std::span<const OptionDef> Options();
const OptionDef& DefinitionOf(Opt id);
const OptionDef* FindOption(QStringView name); // null: unknown

// The character that the value means: "comma", "tab" or the character itself; 0 for "none". Empty for any other
// text.
std::optional<char16_t> CharacterOf(ValueKind kind, QStringView text);
bool IsValidValue(ValueKind kind, const QString& text);

} // namespace mirel::cli
