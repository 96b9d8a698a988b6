#pragma once

#include "cli/option.h"

#include <QStringList>

#include <optional>
#include <vector>

namespace mirel::cli {

struct CommandDef;

// One call of the program, taken apart and checked: a command with its arguments and options.
class Arguments {
public:
    struct Given {
        Opt option;
        QString value; // empty for a flag
    };

    const CommandDef* command = nullptr; // null: the program itself (--help, --version)
    QStringList positional;
    std::vector<Given> options; // in the order in which they stand

    bool Has(Opt option) const;
    // The last one given; else `otherwise`.
    QString Text(Opt option, const QString& otherwise = {}) const;
    qint64 Count(Opt option, qint64 otherwise) const;
    char16_t Character(Opt option, char16_t otherwise) const;
};

// Reads what stands behind the program's name. Options may stand anywhere; "--name=value" is taken as well, and
// behind "--" nothing is an option. Empty when something is wrong: `fault` says in one line what it is, and
// `command` is set as far as it was understood.
std::optional<Arguments> ParseArguments(const QStringList& words, QString& fault, const CommandDef*& command);

QString ProgramHelp();
QString CommandHelp(const CommandDef& command);

} // namespace mirel::cli
