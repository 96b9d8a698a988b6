#include "cli/option.h"

#include <algorithm>
#include <array>

namespace mirel::cli {
namespace {

constexpr std::array kOptions = {
    OptionDef{Opt::Home, "--home", ValueKind::Text, "DIR", "the program folder (else MIREL_HOME)"},
    OptionDef{Opt::Help, "--help", ValueKind::Flag, "", "show this help"},
    OptionDef{Opt::Version, "--version", ValueKind::Flag, "", "show the version"},
    OptionDef{Opt::Timing, "--timing", ValueKind::Flag, "", "finish with one line of JSON about the time taken"},
    OptionDef{Opt::Yes, "--yes", ValueKind::Flag, "", "do it without asking"},
    OptionDef{Opt::Format, "--format", ValueKind::Format, "FORMAT", "output format"},
    OptionDef{Opt::Offset, "--offset", ValueKind::Count, "N", "skip the first N records"},
    OptionDef{Opt::Limit, "--limit", ValueKind::Count, "N", "write at most N records"},
    OptionDef{Opt::Table, "--table", ValueKind::Text, "NAME", "the table"},
    OptionDef{Opt::Create, "--create", ValueKind::Flag, "", "create the table first"},
    OptionDef{
        Opt::Columns, "--columns", ValueKind::Text, "auto|LIST",
        "the file's columns in order, \"Name:Type[:Size],...\", \"-\" to skip one; auto: names from the first "
        "line, types from the data"},
    OptionDef{Opt::Header, "--header", ValueKind::Flag, "", "the first line contains the field names"},
    OptionDef{Opt::Separator, "--separator", ValueKind::Separator, "comma|semicolon|tab|space|C",
              "the character between the texts (comma)"},
    OptionDef{Opt::Quote, "--quote", ValueKind::Quote, "C|none", "the quotation mark (\")"},
    OptionDef{Opt::DateOrder, "--date-order", ValueKind::DateOrder, "0..6",
              "0 month-day-year, 1 month-year-day, 2 year-day-month, 3 year-month-day, 4 day-month-year, "
              "5 day-year-month, 6 the locale's own form (6)"},
    OptionDef{Opt::DateSeparator, "--date-separator", ValueKind::Character, "C",
              "separates the parts of a date, for the orders 0 to 5 (-)"},
    OptionDef{Opt::TimeSeparator, "--time-separator", ValueKind::Character, "C",
              "separates the parts of a time, for the orders 0 to 5 (:)"},
    OptionDef{Opt::DoubledQuotes, "--doubled-quotes", ValueKind::Flag, "",
              "quotation marks inside quoted texts are doubled"},
    OptionDef{Opt::Encoding, "--encoding", ValueKind::Text, "NAME", "character encoding of the file (UTF-8)"},
    OptionDef{Opt::WholeTexts, "--whole-texts", ValueKind::Flag, "",
              "do not cut texts of more than 8192 characters"},
    OptionDef{Opt::Detect, "--detect", ValueKind::Flag, "",
              "find out from the file what is not given: separator, marks, header, encoding, names, types, dates"},
    OptionDef{Opt::NoHeader, "--no-header", ValueKind::Flag, "",
              "the first line is a record, whatever it looks like"},
    OptionDef{Opt::QuotedLines, "--quoted-lines", ValueKind::Flag, "",
              "quoted texts may span lines; quotation marks inside them are doubled"},
    OptionDef{Opt::Decimal, "--decimal", ValueKind::Decimal, "point|comma", "the sign before decimals (point)"},
    OptionDef{Opt::SkipTo, "--skip-to", ValueKind::Text, "FILE",
              "write lines that fail to FILE and go on (an existing one with --yes)"},
    OptionDef{Opt::Key, "--key", ValueKind::Text, "FIELD[,FIELD]",
              "change records that have the same values in these fields, add the others"},
    OptionDef{Opt::Bom, "--bom", ValueKind::Flag, "", "begin the file with a byte-order mark"},
    OptionDef{Opt::Database, "--db", ValueKind::Text, "DB", "the database of --source"},
    OptionDef{Opt::Source, "--source", ValueKind::Text, "SOURCE",
              "the records for the expression: a table, a saved query or a SELECT"},
    OptionDef{Opt::Record, "--record", ValueKind::Count, "N", "on record N (1)"},
    OptionDef{Opt::All, "--all", ValueKind::Flag, "", "on every record, one line each"},
    OptionDef{Opt::Condition, "--condition", ValueKind::Flag, "", "parse it as a condition"},
    OptionDef{Opt::Control, "--control", ValueKind::Text, "NAME=TEXT",
              "the text of a form's control; may be repeated"},
    OptionDef{Opt::Tree, "--tree", ValueKind::Flag, "", "print how the expression was parsed"},
    OptionDef{Opt::Explain, "--explain", ValueKind::Flag, "",
              "say what was dropped, what was probably meant differently, and why a value is null"},
    OptionDef{Opt::Query, "--query", ValueKind::Text, "TEXT",
              "for a form: a statement; for an export: the name of a saved query"},
    OptionDef{Opt::Set, "--set", ValueKind::Text, "CONTROL=TEXT",
              "change a control as a user would; --set and --press are carried out in the order given"},
    OptionDef{Opt::Press, "--press", ValueKind::Text, "BUTTON", "press a button"},
    OptionDef{Opt::Name, "--name", ValueKind::Text, "NAME", "the new name"},
    OptionDef{Opt::Replace, "--replace", ValueKind::Flag, "", "replace the query of that name"},
};

constexpr bool StandInTheOrderOfTheirIds()
{
    for (size_t i = 0; i < kOptions.size(); ++i) {
        if (size_t(kOptions[i].id) != i)
            return false;
    }
    return true;
}
static_assert(StandInTheOrderOfTheirIds());

struct NamedCharacter {
    QLatin1StringView name;
    char16_t character;
};
constexpr std::array kSeparators = {
    NamedCharacter{QLatin1StringView("comma"), u','},
    NamedCharacter{QLatin1StringView("semicolon"), u';'},
    NamedCharacter{QLatin1StringView("tab"), u'\t'},
    NamedCharacter{QLatin1StringView("space"), u' '},
};
constexpr std::array kDecimals = {
    NamedCharacter{QLatin1StringView("point"), u'.'},
    NamedCharacter{QLatin1StringView("comma"), u','},
};
constexpr std::array kQuotes = {NamedCharacter{QLatin1StringView("none"), 0}};

std::span<const NamedCharacter> NamedCharacters(ValueKind kind)
{
    if (kind == ValueKind::Separator)
        return kSeparators;
    if (kind == ValueKind::Quote)
        return kQuotes;
    if (kind == ValueKind::Decimal)
        return kDecimals;
    return {};
}

} // namespace

std::span<const OptionDef> Options()
{
    return kOptions;
}

const OptionDef& DefinitionOf(Opt id)
{
    return kOptions[size_t(id)];
}

const OptionDef* FindOption(QStringView name)
{
    const auto option = std::ranges::find_if(
        kOptions, [name](const OptionDef& each) { return name == QLatin1StringView(each.name); });
    return option == kOptions.end() ? nullptr : &*option;
}

std::optional<char16_t> CharacterOf(ValueKind kind, QStringView text)
{
    for (const NamedCharacter& each : NamedCharacters(kind)) {
        if (text == each.name)
            return each.character;
    }
    if (kind == ValueKind::Decimal)
        return {};
    // A line end would cut every record apart, and half a character is none.
    if (text.size() != 1 || text[0].isSurrogate() || text[0].isNull() || text[0] == u'\n' || text[0] == u'\r')
        return {};
    return text[0].unicode();
}

bool IsValidValue(ValueKind kind, const QString& text)
{
    bool ok = false;
    switch (kind) {
    case ValueKind::Flag:
    case ValueKind::Text:
    case ValueKind::Format: // which ones there are depends on the command
        return true;
    case ValueKind::Count:
        return text.toLongLong(&ok) >= 0 && ok;
    case ValueKind::Separator:
    case ValueKind::Quote:
    case ValueKind::Character:
    case ValueKind::Decimal:
        return CharacterOf(kind, text).has_value();
    case ValueKind::DateOrder:
        return text.size() == 1 && text[0] >= u'0' && text[0] <= u'6';
    }
    return false;
}

} // namespace mirel::cli
