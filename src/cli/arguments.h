#pragma once

#include "cli/option.h"

#include <QStringList>

#include <optional>
#include <vector>

namespace mirel::cli {

struct CommandDef;

// One call of the program, parsed and checked: a command with its arguments and options.
class Arguments {
public:
    struct Given {
        Opt option;
        QString value; // empty for a flag
    };

    const CommandDef* command = nullptr; // null: the program itself (--help, --version), or a group's help
    QString group;                       // "forms" where only the first word of a command was given
    QStringList positional;
    std::vector<Given> options; // in the order given

    bool Has(Opt option) const;
    // The last one given; else `otherwise`.
    QString Text(Opt option, const QString& otherwise = {}) const;
    qint64 Count(Opt option, qint64 otherwise) const;
    char16_t Character(Opt option, char16_t otherwise) const;
};

// Why the words were refused, in one line, and which help says more: a command or a group, or neither.
struct ArgumentFault {
    QString text;
    QString helpOn;
};

// Parses the words after the program's name. Options may come anywhere, also as "--name=value". A minus followed
// by a digit or a point begins a value, and after "--" every word is one. On failure the result is empty and
// `fault` says why.
std::optional<Arguments> ParseArguments(const QStringList& words, ArgumentFault& fault);

// The help that these arguments ask for: on their command, on its group, or on the program.
QString HelpFor(const Arguments& arguments);

} // namespace mirel::cli
