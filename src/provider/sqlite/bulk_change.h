#pragma once

#include "provider/sqlite/record_writer.h"
#include "provider/sqlite/result_rows.h"

namespace mirel::sqlite {

// Changes all records of a result as one transaction, a piece of the table at a time, so that a long run can
// show how far it is and be stopped. What was done before a stop or a refused record is committed; a failure of
// the file undoes all of it.
class BulkChange {
public:
    // Both must outlive it. `alias` is what the condition calls the table.
    BulkChange(DatabaseFile& file, const RecordWriter& writer, QByteArray alias)
        : file_(file)
        , writer_(writer)
        , alias_(std::move(alias))
    {
    }

    Outcome Update(const BulkRanges& ranges, const FieldChange& change, const BulkProgress& progress);
    Outcome Delete(const BulkRanges& ranges, const BulkProgress& progress);

private:
    bool HasTriggers() const;
    Outcome DeleteWhole(const BulkRanges& ranges, const BulkProgress& progress);
    QByteArray Target() const { return writer_.Table() + " AS " + alias_; }
    QByteArray Within(const QByteArray& condition) const;
    Outcome Run(const QByteArray& sql, const BulkRanges& ranges, const BulkProgress& progress, const Value* value);
    Outcome RunRanges(const QByteArray& sql, const BulkRanges& ranges, const BulkProgress& progress,
                      const Value* value);

    DatabaseFile& file_;
    const RecordWriter& writer_;
    QByteArray alias_;
};

} // namespace mirel::sqlite
