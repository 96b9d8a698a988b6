#include "cli/command.h"

#include "cli/commands.h"

#include <algorithm>
#include <array>

namespace mirel::cli {
namespace {

constexpr std::array kDropOptions = {Opt::Yes};
constexpr std::array kFormatOptions = {Opt::Format};
constexpr std::array kQueryOptions = {Opt::Format, Opt::Yes};
constexpr std::array kSqlOptions = {Opt::Format, Opt::Offset, Opt::Limit};
constexpr std::array kImportOptions = {
    Opt::Table,    Opt::Create,        Opt::Columns,   Opt::Header,        Opt::Separator,
    Opt::Quote,    Opt::DoubledQuotes, Opt::DateOrder, Opt::DateSeparator, Opt::TimeSeparator,
    Opt::Encoding, Opt::WholeTexts,    Opt::Detect,    Opt::NoHeader,      Opt::QuotedLines,
    Opt::Decimal,  Opt::SkipTo,        Opt::Key,       Opt::Yes,
};
constexpr std::array kEvalOptions = {Opt::Database, Opt::Source, Opt::Record, Opt::All,    Opt::Condition,
                                     Opt::Control,  Opt::Format, Opt::Tree,   Opt::Explain};
constexpr std::array kShowOptions = {Opt::Query, Opt::Record, Opt::Set, Opt::Press, Opt::Yes, Opt::Format};
constexpr std::array kNameOptions = {Opt::Name};
constexpr std::array kImportNeeds = {Opt::Table};
constexpr std::array kExportOptions = {
    Opt::Query,         Opt::Yes,           Opt::Header,        Opt::Separator, Opt::Quote, Opt::DateOrder,
    Opt::DateSeparator, Opt::TimeSeparator, Opt::DoubledQuotes, Opt::Encoding,  Opt::Bom,   Opt::Format,
};
constexpr std::array kSaveOptions = {Opt::Table, Opt::Replace, Opt::Yes};

constexpr std::array kCommands = {
    CommandDef{"new", "DB", "create a database", {}, {}, RunNew},
    CommandDef{"drop", "DB", "delete a database with its forms, queries and favorites", kDropOptions, kDropOptions,
               RunDrop},
    CommandDef{"backup",
               "DB FILE",
               "copy a database with its forms and queries while others work",
               kDropOptions,
               {},
               RunBackup},
    CommandDef{"compact", "DB", "give a database's unused space back", {}, {}, RunCompact},
    CommandDef{
        "check", "DB", "look for damage, and for forms and queries that refer to nothing", {}, {}, RunCheck},
    CommandDef{"sql",
               "DB STATEMENT",
               "run a statement (-: statements from standard input) and print its records",
               kSqlOptions,
               {},
               RunSql},
    CommandDef{"tables", "DB", "list the tables", {}, {}, RunTables},
    CommandDef{"fields", "DB TABLE", "list the fields of a table", kFormatOptions, {}, RunFields},
    CommandDef{"import", "DB FILE", "import a CSV file into a table", kImportOptions, kImportNeeds, RunImport},
    CommandDef{"export",
               "DB [SOURCE] FILE",
               "export a table, a saved query or a SELECT as a file: CSV, JSON or a web page (-: standard output)",
               kExportOptions,
               {},
               RunExport,
               "csv|json|html"},
    CommandDef{"design",
               "DB TABLE FILE",
               "make or change a table by a list of its fields in JSON: name, type, size, index, was",
               kDropOptions,
               {},
               RunDesign},
    CommandDef{"aggregate",
               "DB SOURCE FIELD sum|max|min|avg",
               "compute a field's aggregate over all records of a table, a saved query or a SELECT",
               {},
               {},
               RunAggregateCommand},
    CommandDef{"update-all", "DB SOURCE FIELD VALUE",
               "set a field in all records of a table, a saved query or a SELECT", kDropOptions, kDropOptions,
               RunUpdateAll},
    CommandDef{"delete-all", "DB SOURCE", "delete all records of a table, a saved query or a SELECT", kDropOptions,
               kDropOptions, RunDeleteAll},
    CommandDef{"eval", "EXPRESSION", "evaluate an expression", kEvalOptions, {}, RunEval, "text|json"},
    CommandDef{"forms list",
               "DB",
               "list the forms with their tables and control counts",
               kFormatOptions,
               {},
               RunFormsList},
    CommandDef{"forms default", "DB TABLE", "create the default form of a table", {}, {}, RunFormsDefault},
    CommandDef{"forms show",
               "DB NAME",
               "run a form: set controls, press buttons, print the result",
               kShowOptions,
               {},
               RunFormsShow,
               "table|json"},
    CommandDef{"forms dump",
               "DB-OR-FILE",
               "print the whole contents of a database's forms or of a form file, as JSON",
               {},
               {},
               RunFormsDump},
    CommandDef{"forms export", "DB NAME FILE", "export a form to a file", kDropOptions, {}, RunFormsExport},
    CommandDef{"forms import", "DB FILE", "add the form in a form file", kNameOptions, {}, RunFormsImport},
    CommandDef{"forms edit",
               "DB NAME FILE",
               "replace a form by the one in a JSON file as \"forms dump\" writes it",
               {},
               {},
               RunFormsEdit},
    CommandDef{"forms delete", "DB NAME", "delete a form", kDropOptions, kDropOptions, RunFormsDelete},
    CommandDef{"queries list",
               "DB",
               "list the saved queries with their tables and statements",
               kFormatOptions,
               {},
               RunQueriesList},
    CommandDef{"queries save", "DB NAME STATEMENT", "save a statement as a query", kSaveOptions, kImportNeeds,
               RunQueriesSave},
    CommandDef{"queries run", "DB NAME", "print the records of a saved query", kQueryOptions, {}, RunQueriesRun},
    CommandDef{"queries delete", "DB NAME", "delete a saved query", kDropOptions, kDropOptions, RunQueriesDelete},
    CommandDef{"config get", "SECTION KEY", "print a setting", {}, {}, RunConfigGet},
    CommandDef{"config set", "SECTION KEY VALUE", "change a setting", {}, {}, RunConfigSet},
};

} // namespace

std::span<const CommandDef> Commands()
{
    return kCommands;
}

const CommandDef* FindCommand(QStringView name)
{
    const auto command = std::ranges::find_if(
        kCommands, [name](const CommandDef& each) { return name == QLatin1StringView(each.name); });
    return command == kCommands.end() ? nullptr : &*command;
}

ArgumentCount ArgumentCountOf(const CommandDef& command)
{
    const QStringList words = QString::fromLatin1(command.arguments).split(u' ', Qt::SkipEmptyParts);
    const auto optional = std::ranges::count_if(words, [](const QString& word) { return word.startsWith(u'['); });
    return {words.size() - optional, words.size()};
}

} // namespace mirel::cli
