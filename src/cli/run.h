#pragma once

#include "app/database_session.h"
#include "app/settings.h"
#include "cli/arguments.h"
#include "cli/command.h"
#include "cli/console_prompt.h"
#include "cli/output.h"
#include "cli/record_writer.h"
#include "data/db_connection.h"
#include "platform/program_folder.h"

#include <QElapsedTimer>

#include <memory>
#include <optional>

namespace mirel::cli {

// The figures of --timing; those that do not apply stay empty.
struct Timing {
    qint64 openMs = 0;
    qint64 rows = 0;
    std::optional<qint64> jumpUs;
    std::optional<double> nsPerEval;
};

// One run of one command: its arguments and everything it works with.
class Run {
public:
    Run(Arguments arguments, Output& output);
    Q_DISABLE_COPY_MOVE(Run)

    const Arguments& Args() const { return arguments_; }
    QString Argument(int index) const { return arguments_.positional.value(index); }
    // A file named on the command line, by its full path.
    QString PathArgument(int index) const;
    QString FilePath(const QString& given) const; // the same of an option's

    // Opens the database that the first argument names, or `file`, as the window does. On false the reason has
    // been reported.
    [[nodiscard]] bool OpenDatabase() { return OpenDatabase(Argument(0)); }
    [[nodiscard]] bool OpenDatabase(const QString& file);
    DatabaseSession& Session() { return session_; }
    DbConnection& Connection() { return connection_; }
    ConsolePrompt& Prompt() { return prompt_; }
    const ProgramFolder& Folder() const { return folder_; }
    Output& Out() { return output_; }
    Timing& Times() { return timing_; }

    // The user's words for Yes and No.
    YesNoWords Words() const { return Settings(folder_.OpenProfile()).Words(); }
    bool IsSet(Setting setting) const { return Settings(folder_.OpenProfile()).Flag(setting); }
    // In the format that --format names, with the user's words for Yes and No.
    std::unique_ptr<RecordWriter> MakeWriter();
    void WriteTiming() const;
    // Reports what is wrong with the arguments, and how to get help.
    ExitStatus Refuse(const QString& fault) const;
    // Whether that is the name of one of the user's tables.
    bool IsTable(const QString& name);
    // The statement for a source: the name of a table, which needs no brackets here, the name of a saved query, or
    // the statement itself.
    QString SourceOf(const QString& given);

private:
    Arguments arguments_;
    Output& output_;
    QElapsedTimer sinceStart_;
    ProgramFolder folder_;
    ConsolePrompt prompt_;
    DbConnection connection_;
    DatabaseSession session_;
    Timing timing_;
};

// The whole program; `words` are its arguments.
ExitStatus RunProgram(const QStringList& words, Output& output);

} // namespace mirel::cli
