#pragma once

#include "data/db_connection.h"

#include <QString>

#include <memory>
#include <span>
#include <vector>

namespace mirel {

// Whether the statement yields records and does nothing else: a SELECT, or the bare name of a table. True also
// for a text that does not parse: the provider then says what is wrong with it.
bool OnlyReads(const QString& statement);

// One open result: the rows of a table or of a SELECT, and a current position in them. Every statement of the
// system runs through Open, even those that return no rows.
//
// Positions count from 0. After Open the first record is current, or the recordset is at its end if it has no
// records. Field indexes count from 0 in the order of the result's columns.
//
// Owns its cursor and closes it when destroyed; the connection must outlive it. A call that fails returns false
// and keeps the position; LastResult() says why. Missing fields give neutral values.
class DbRecordset {
public:
    explicit DbRecordset(DbConnection& connection);
    ~DbRecordset();
    Q_DISABLE_COPY_MOVE(DbRecordset)

    // Closes what was open, then runs `source` (a statement, or the bare name of a table) on the database file
    // with the full path `database`. CREATE and DROP DATABASE take an empty path.
    [[nodiscard]] bool Open(const QString& source, const DatabaseLocation& database, CursorType cursor,
                            LockType lock);
    // The same for a source: what is shown, exported, summed up or changed as a whole. That is a table or a
    // SELECT; any other statement is refused before it runs (SyntaxError, with the reason as context).
    [[nodiscard]] bool OpenSource(const QString& source, const DatabaseLocation& database, CursorType cursor,
                                  LockType lock);
    void Close();
    bool IsOpen() const { return open_; }

    Hr LastResult() const { return lastResult_; }
    QString ErrorContext() const; // what the provider adds to the last failure
    QString Source() const;
    LockType Lock() const; // ReadOnly also for a result that cannot be updated

    int FieldCount() const;                 // 0 when not open
    QString FieldName(int index) const;     // empty: no such column
    int FieldIndex(QStringView name) const; // exact, case counts; -1: no such column
    FieldType TypeOfField(int index) const; // None: no such column
    int FieldSize(int index) const;         // -1: no such column, or no limit
    std::span<const ResultField> Fields() const;

    // A move past either end stops there and succeeds.
    [[nodiscard]] bool MoveFirst();
    [[nodiscard]] bool MoveLast();
    [[nodiscard]] bool MoveNext();
    [[nodiscard]] bool MovePrevious();
    [[nodiscard]] bool MoveTo(qint64 position);
    bool IsEof() const;
    bool IsBof() const;
    qint64 Position() const; // -1 at either end
    bool IsGone() const;     // the current record has been deleted by others
    [[nodiscard]] bool TakeUpChanges(ProviderRecordset::Values values = ProviderRecordset::Values::ReadAgain);
    // See ProviderRecordset: an order that takes long to make stays the old one for a while.
    void AllowOldOrder(qint64 fromRecords);
    bool IsBehind() const;
    bool CatchUp(int budgetMs);

    // See ProviderRecordset: a record's identity in this result and in its table, and the way back to it. False
    // when it is not there.
    RecordId Id() const;
    RecordId IdInTable() const;
    [[nodiscard]] bool Ids(qint64 first, qint64 count, std::vector<RecordId>& ids);
    [[nodiscard]] bool ReadRecords(std::span<const RecordId> ids, const RecordSink& sink);
    [[nodiscard]] bool MoveToRecord(const RecordId& id);

    qint64 RecordCount();         // finishes counting; -1 when not open or forward-only
    bool CountStep(int budgetMs); // true once the count is known
    quint64 Generation() const;   // grows when records may have changed or moved

    // The current record's value, as ProviderRecordset::GetValue gives it; integer 0 when there is no such column,
    // null at either end.
    Value FieldValue(int index) const;
    Value FieldValue(QStringView name) const;
    // The value as text: VariantText of it, with empty text for NULL.
    QString ValueText(int index) const;

    [[nodiscard]] bool Read(const ReadRange& range, const CellSink& sink);

    [[nodiscard]] bool AddNew(std::span<const FieldChange> values, const RecordId& preferred = {});
    [[nodiscard]] bool Update(std::span<const FieldChange> values);
    [[nodiscard]] bool Update(int index, const Value& value);
    [[nodiscard]] bool Delete();
    [[nodiscard]] bool UpdateAll(int field, const Value& value, qint64 confirmed, const BulkProgress& progress);
    [[nodiscard]] bool DeleteAll(qint64 confirmed, const BulkProgress& progress);

private:
    bool Keep(Hr result) const; // remembers the result; true for success

    std::unique_ptr<ProviderRecordset> cursor_;
    bool open_ = false;
    bool isNoSource_ = false; // OpenSource refused the statement
    mutable Hr lastResult_ = Hr::Ok;
};

} // namespace mirel
