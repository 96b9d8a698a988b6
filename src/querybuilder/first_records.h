#pragma once

#include "data/db_connection.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace mirel {

// The first records of a statement, as texts to be shown.
struct FirstRecords {
    struct Column {
        QString name;
        bool rightAligned = false;
    };
    std::vector<Column> columns;
    std::vector<QStringList> rows;
    QString error;        // why there are none, in the system's words
    bool stopped = false; // it took too long
};

// Runs a SELECT for at most about `budgetMs` and reads `count` records of it. Anything but a SELECT is refused.
// While it runs it has the process's stop check (SetStopCheck), which asks nobody afterwards.
FirstRecords ReadFirstRecords(DbConnection& connection, const DatabaseLocation& database, const QString& statement,
                              int count, int budgetMs);

} // namespace mirel
