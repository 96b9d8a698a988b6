#pragma once

#include "cli/arguments.h"
#include "cli/output.h"

#include <initializer_list>
#include <span>

namespace mirel::cli {

class Run;

enum class ExitStatus : int { Done = 0, Failed = 1, BadArguments = 2 };

// One command: a row of the table in command.cpp, which drives the parser, the help and the program. A new command
// is one row there and one function, declared in commands.h.
struct CommandDef {
    const char* name;      // one word, or two in a group: "forms list"
    const char* arguments; // as the help shows them, optional ones in brackets
    const char* help;      // one line
    std::span<const Opt> options;
    std::span<const Opt> needed; // those of them that are required
    ExitStatus (*run)(Run& run);
    const char* formats = "table|csv|tsv|json|jsonl"; // what --format may name
};

struct ArgumentCount {
    qsizetype least;
    qsizetype most;
};

std::span<const CommandDef> Commands();
const CommandDef* FindCommand(QStringView name); // null: unknown
ArgumentCount ArgumentCountOf(const CommandDef& command);

} // namespace mirel::cli
