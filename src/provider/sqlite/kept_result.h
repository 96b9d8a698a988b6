#pragma once

#include "provider/sqlite/database_file.h"
#include "provider/sqlite/plan.h"

namespace mirel::sqlite {

// The rows of a result that has no keys (DISTINCT, GROUP BY, sums, views), kept as they were when it was
// opened: in a temporary table, which lies in memory while it is small and in a file once it is not.
class KeptResult {
public:
    explicit KeptResult(DatabaseFile& file);
    ~KeptResult();
    Q_DISABLE_COPY_MOVE(KeptResult)

    Outcome Fill(const SelectPlan& plan);
    // The kept rows as a table that a cursor can read.
    SelectPlan Plan(const SelectPlan& plan) const;

private:
    DatabaseFile& file_;
    QByteArray table_;
    bool isThere_ = false;
};

} // namespace mirel::sqlite
