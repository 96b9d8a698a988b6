#pragma once

#include "cli/command.h"

namespace mirel::cli {

// The functions of the command table, by file.

// database_commands.cpp
ExitStatus RunNew(Run& run);
ExitStatus RunDrop(Run& run);
ExitStatus RunTables(Run& run);
ExitStatus RunFields(Run& run);

// care_commands.cpp
ExitStatus RunCheck(Run& run);
ExitStatus RunBackup(Run& run);
ExitStatus RunCompact(Run& run);

// sql_command.cpp
ExitStatus RunSql(Run& run);

// import_command.cpp
ExitStatus RunImport(Run& run);

// design_command.cpp
ExitStatus RunDesign(Run& run);

// export_command.cpp
ExitStatus RunExport(Run& run);

// bulk_commands.cpp
ExitStatus RunAggregateCommand(Run& run);
ExitStatus RunUpdateAll(Run& run);
ExitStatus RunDeleteAll(Run& run);

// query_commands.cpp
ExitStatus RunQueriesList(Run& run);
ExitStatus RunQueriesSave(Run& run);
ExitStatus RunQueriesRun(Run& run);
ExitStatus RunQueriesDelete(Run& run);

// eval_command.cpp
ExitStatus RunEval(Run& run);

// form_commands.cpp
ExitStatus RunFormsList(Run& run);
ExitStatus RunFormsDefault(Run& run);
ExitStatus RunFormsDump(Run& run);
ExitStatus RunFormsExport(Run& run);
ExitStatus RunFormsImport(Run& run);
ExitStatus RunFormsDelete(Run& run);
ExitStatus RunFormsEdit(Run& run);

// form_show_command.cpp
ExitStatus RunFormsShow(Run& run);

// config_commands.cpp
ExitStatus RunConfigGet(Run& run);
ExitStatus RunConfigSet(Run& run);

} // namespace mirel::cli
