#pragma once

#include <QString>

#include <optional>
#include <span>

namespace mirel::cli {

// Every option of the program by name. Which command takes which one stands in the table of commands.
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

// What an option's value has to be; a value that is not is refused before the command runs.
enum class ValueKind { Flag, Text, Count, Format, Separator, Quote, Character, DateOrder };

struct OptionDef {
    Opt id;
    const char* name; // with its dashes
    ValueKind kind;
    const char* value; // how the help calls the value; empty for a flag
    const char* help;
};

std::span<const OptionDef> Options();
const OptionDef& DefinitionOf(Opt id);
const OptionDef* FindOption(QStringView name); // null: there is none of that name

// The value as the character that a file is written with: "comma", "tab" or the character itself; "none" is 0.
// Empty when the text is none of these.
std::optional<char16_t> CharacterOf(ValueKind kind, QStringView text);
bool IsValidValue(ValueKind kind, const QString& text);

} // namespace mirel::cli
