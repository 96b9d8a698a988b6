#include "querybuilder/first_records.h"

#include "data/db_recordset.h"
#include "data/provider_error.h"
#include "provider/stop_check.h"
#include "result/cell_text.h"

#include <QElapsedTimer>

namespace mirel {
namespace {

constexpr int kMaxChars = 80;

class TimeLimit {
public:
    explicit TimeLimit(int budgetMs)
    {
        clock_.start();
        SetStopCheck([this, budgetMs] { return clock_.elapsed() > budgetMs; });
    }
    ~TimeLimit() { SetStopCheck({}); }
    Q_DISABLE_COPY_MOVE(TimeLimit)

private:
    QElapsedTimer clock_;
};

} // namespace

FirstRecords ReadFirstRecords(DbConnection& connection, const DatabaseLocation& database, const QString& statement,
                              int count, int budgetMs)
{
    FirstRecords first;
    const TimeLimit limit(budgetMs);
    DbRecordset records(connection);
    bool read = records.OpenSource(statement, database, CursorType::ForwardOnly, LockType::ReadOnly);
    if (read) {
        for (const ResultField& field : records.Fields())
            first.columns.push_back({field.name, IsRightAligned(field.type)});
        const YesNoWords words;
        read = records.Read({.first = 0, .count = count, .fields = {}}, [&](std::span<const Cell> cells) {
            QStringList row;
            for (size_t i = 0; i < cells.size(); ++i)
                row += GridText(cells[i], records.TypeOfField(int(i)), words, kMaxChars);
            first.rows.push_back(row);
            return qsizetype(first.rows.size()) < count;
        });
    }
    if (read)
        return first;
    first.stopped = records.LastResult() == kStopped;
    if (!first.stopped)
        first.error = ProviderErrorText(&records, records.LastResult(), records.ErrorContext());
    return first;
}

} // namespace mirel
