#pragma once

#include "platform/cell.h"
#include "platform/field_type.h"
#include "platform/hr.h"
#include "platform/record_id.h"
#include "platform/value.h"
#include "provider/database_care.h"
#include "provider/database_location.h"

#include <QString>

#include <functional>
#include <memory>
#include <optional>
#include <span>
#include <vector>

namespace mirel {

// What a data access provider is to the rest of the system. Everything above this folder works through these
// interfaces and knows no engine; src/provider/sqlite/ is the provider "cedb" over the SQLite library.
//
// One thread uses a connection and all that comes from it. No call throws; what fails returns a failed Hr, and
// changes nothing unless it says so. After a failure ErrorContext() adds what only the provider knows (the
// place in a statement, the path and the reason), empty when there is nothing to add.

enum class CursorType : int { ForwardOnly = 0, Static = 3 };
enum class LockType : int { ReadOnly = 1, Optimistic = 3 };

// A column of an open result.
struct ResultField {
    QString name; // as the result shows it
    FieldType type = FieldType::None;
    int size = 0;     // characters of a Text, bytes of every other type; -1 where there is no limit. An Integer of
                      // another program's file has kWideIntegerSize and takes 64 bits
    QString table;    // the table that the column comes from; empty for an expression
    QString column;   // its name in that table; empty for an expression
    QString source{}; // the table's alias in the statement, or its name; empty for an expression
    bool isJoined = false;   // the statement reads from several tables
    QString expression{};    // as the statement writes it, ready to be compared; empty for a column
    bool isRequired = false; // the column takes no NULL, and a new record gets no default for it
};

// A value for a column of an open result, by its index there.
struct FieldChange {
    int field;
    Value value;
};

// Takes one record: its cells in the order of the requested fields, borrowed for the call. False ends the walk.
using CellSink = std::function<bool(std::span<const Cell> cells)>;

// Takes one record of those that were asked for, by its index there.
using RecordSink = std::function<void(size_t index, std::span<const Cell> cells)>;

// Told how many records a bulk run has done; false asks it to stop there.
using BulkProgress = std::function<bool(qint64 done)>;

// Which records Read walks, and which columns of them it hands over.
struct ReadRange {
    enum class Order { Result, Any };

    qint64 first = 0;            // position in the result, from 0
    qint64 count = -1;           // -1: to the end
    std::vector<int> fields;     // indexes in the result; empty: all
    Order order = Order::Result; // Any: whatever is fastest, for sums over the whole result
};

// One result: the records of a table or a SELECT, and a current position in them; or a statement that was run
// and yields no records.
//
// Positions count from 0. A static cursor knows every position: own additions go to the end, own deletions
// leave, and what other results or other programs change is taken up before positions are used again. The current
// record is then found by its identity; when it has been deleted it is gone, and no neighbor takes its place until
// the next move. A forward-only cursor moves on and knows no count.
//
// Writes are optimistic: they compare the record with what GetValue gave, inside their transaction. Update
// compares the values that it replaces, Delete all of the result; either compares all once the file's structure is
// another. A difference is RecordChanged, a record that is gone NoCurrentRecord, and nothing is written.
class ProviderRecordset {
public:
    virtual ~ProviderRecordset() = default;

    // Closes what was open, then runs `source` (a statement, or the bare name of a table) on `database`,
    // a file by its full path; CREATE and DROP DATABASE take an empty location. On success the first record
    // is current, or the result is at its end. On failure nothing is open.
    [[nodiscard]] virtual Hr Open(const QString& source, const DatabaseLocation& database, CursorType cursor,
                                  LockType lock) = 0;
    virtual void Close() = 0;

    virtual QString Source() const = 0;
    // ReadOnly also where a static, optimistic cursor was asked for and the result cannot be updated.
    virtual LockType Lock() const = 0;
    virtual QString ErrorContext() const = 0;
    // Empty for a statement that yields no records.
    virtual std::span<const ResultField> Fields() const = 0;

    // Finishes counting. -1 for a forward-only cursor.
    virtual qint64 RecordCount() = 0;
    // Counts on for about `budgetMs`; true once the count is known. Calls that need positions count by
    // themselves: this is for a window that shows its first page before it knows how many there are. A budget
    // below 0 counts nothing and only asks.
    virtual bool CountStep(int budgetMs) = 0;
    // Grows whenever the records may be others, or stand elsewhere, than before: own changes, and changes of
    // other programs once the cursor has taken them up.
    virtual quint64 Generation() const = 0;

    virtual bool AtBegin() const = 0;    // before the first record
    virtual bool AtEnd() const = 0;      // behind the last record; also when there is none
    virtual bool IsGone() const = 0;     // the current record has been deleted by others
    virtual qint64 Position() const = 0; // of the current record; -1 at either end, and when it is gone

    // Takes up what others changed since: positions, the current record's place, and, unless values are to be kept
    // for the comparison of a write, its values.
    enum class Values { Keep, ReadAgain };
    [[nodiscard]] virtual Hr TakeUpChanges(Values values) = 0;

    // For a window, until the result is closed: where others' changes ask for a new search or sort among so many
    // records, the order stays the old one for now, and the recordset is behind. Values are those of now, and
    // records that are gone leave as soon as they are looked at; new ones, and new places, are still to come.
    // Within a transaction, and to read a whole result, a recordset that is behind takes up everything first.
    virtual void AllowOldOrder(qint64 fromRecords) = 0;
    virtual bool IsBehind() const = 0;
    // Works on the new order for about `budgetMs`. True once the recordset is not behind any more; all positions
    // may then be others, as the generation tells.
    virtual bool CatchUp(int budgetMs) = 0;

    [[nodiscard]] virtual Hr MoveFirst() = 0;
    [[nodiscard]] virtual Hr MoveLast() = 0;
    // From a record that is gone, these two go to the records that were beside it.
    [[nodiscard]] virtual Hr MoveNext() = 0;
    [[nodiscard]] virtual Hr MovePrevious() = 0;
    // To a position from 0. Past the last record it stands at the end, below 0 before the first; both are Ok.
    [[nodiscard]] virtual Hr MoveTo(qint64 position) = 0;

    // The current record's identity among the records of this result. A result over one table gives its records
    // the same ones in every order and under every condition. Null without a current record, and where records are
    // kept rows of their own (groups, DISTINCT).
    virtual RecordId Id() const = 0;
    // The identity in the table that this result can change; null where nothing can be changed.
    virtual RecordId IdInTable() const = 0;
    // Of the records from `first` on, as positions are now; fewer at the end.
    [[nodiscard]] virtual Hr Ids(qint64 first, qint64 count, std::vector<RecordId>& ids) = 0;
    // All fields of these records, as they are now; those that are not there are left out.
    [[nodiscard]] virtual Hr ReadRecords(std::span<const RecordId> ids, const RecordSink& sink) = 0;
    // NoCurrentRecord, and nothing moved, when the result does not hold that record.
    [[nodiscard]] virtual Hr MoveToRecord(const RecordId& id) = 0;

    // The current record's value, as it was when the first of them was asked for since the record became current,
    // was written, or changes were taken up. NoCurrentRecord at either end.
    [[nodiscard]] virtual Hr GetValue(int field, Value& value) = 0;

    // Hands records over without moving the current one: a page, an export, a sum. One read transaction; the
    // sink must not use this recordset. A forward-only cursor starts at the current record and uses it up.
    [[nodiscard]] virtual Hr Read(const ReadRange& range, const CellSink& sink) = 0;

    // Each is one transaction, on disk when the call returns (inside a bulk run: when that ends). Values are
    // checked and converted for their column: what does not read is BadLiteral, what does not fit Overflow.
    // The new record becomes current. It gets the identity `preferred` where that is not null and is free: so a
    // deleted record comes back as the one it was.
    [[nodiscard]] virtual Hr AddNew(std::span<const FieldChange> values, const RecordId& preferred) = 0;
    [[nodiscard]] virtual Hr Update(std::span<const FieldChange> values) = 0;
    [[nodiscard]] virtual Hr Delete() = 0; // the record behind it becomes current, or the end

    // All records of the result, as one transaction. A refused record or a stop commits the records before it.
    // With more than `confirmed` records (-1: any number will do) it is RecordChanged, and none is touched.
    [[nodiscard]] virtual Hr UpdateAll(int field, const Value& value, qint64 confirmed,
                                       const BulkProgress& progress) = 0;
    [[nodiscard]] virtual Hr DeleteAll(qint64 confirmed, const BulkProgress& progress) = 0;
};

// Appends records to one table at the speed of the store: what the CSV import feeds. Records are one
// transaction from creation to Commit(); destroying it without Commit() leaves nothing of the run.
class RecordAppender {
public:
    virtual ~RecordAppender() = default;

    // The columns that Append expects, in that order.
    virtual std::span<const ResultField> Fields() const = 0;

    // One record, a cell a column. Cells are checked against the columns' types and sizes as everywhere (a Text
    // cell for a date column is a stored date); a refused record is not added, and the appender goes on working.
    [[nodiscard]] virtual Hr Append(std::span<const Cell> cells) = 0;
    // Which column, from 0, the last failing Append refused; -1 when it was no single one.
    virtual int RefusedField() const = 0;
    virtual QString ErrorContext() const = 0;

    [[nodiscard]] virtual Hr Commit() = 0;
};

// Writes single records of one table, each known by its identity in the table: what takes many changes back. No
// position is looked for, so a record costs the same in a table of any size. Outside of a ProviderTransaction it
// refuses to write.
//
// What is written is held against `expected`, the values that the record must have, as GetValue gives them:
// NoCurrentRecord when it is gone, RecordChanged when it holds others. Nothing is written then, nor when a value
// or the table refuses it.
class RecordEditor {
public:
    virtual ~RecordEditor() = default;

    // All columns of the table.
    virtual std::span<const ResultField> Fields() const = 0;

    // `id` becomes another where a changed field is the key.
    [[nodiscard]] virtual Hr Update(RecordId& id, std::span<const FieldChange> expected,
                                    std::span<const FieldChange> values) = 0;
    [[nodiscard]] virtual Hr Delete(const RecordId& id, std::span<const FieldChange> expected) = 0;
    // `id`: which one the record is to have, where that is free; on success, which it has.
    [[nodiscard]] virtual Hr Add(RecordId& id, std::span<const FieldChange> values) = 0;

    virtual QString ErrorContext() const = 0; // of the last failure
};

// Changes that are one transaction, on disk when Commit returns: all that is written to the database from its
// making on. Destroyed without Commit, it takes them back. They nest: an inner one that is taken back fails the
// outer one.
class ProviderTransaction {
public:
    virtual ~ProviderTransaction() = default;
    [[nodiscard]] virtual Hr Commit() = 0;
    virtual QString ErrorContext() const = 0;
};

// A provider with the database files that are open in it: one handle a file, opened by the first result that
// names its path and kept until CloseDatabase. Results and appenders must be gone before their connection.
class ProviderConnection {
public:
    virtual ~ProviderConnection() = default;

    virtual std::unique_ptr<ProviderRecordset> CreateRecordset() = 0;

    // `columns` empty: all columns of the table. On failure null; `result` and `context` say why.
    virtual std::unique_ptr<RecordAppender> CreateAppender(const DatabaseLocation& database, const QString& table,
                                                           const QStringList& columns, Hr& result,
                                                           QString& context) = 0;

    // On failure null; `result` and `context` say why.
    virtual std::unique_ptr<RecordEditor> CreateEditor(const DatabaseLocation& database, const QString& table,
                                                       Hr& result, QString& context) = 0;

    // Takes the write lock at once, so that what is compared cannot change before it is written. On failure null;
    // `result` and `context` say why. Must be gone before the connection.
    virtual std::unique_ptr<ProviderTransaction> BeginTransaction(const DatabaseLocation& database, Hr& result,
                                                                  QString& context) = 0;

    // Gives the file up. Results still open on it are closed: their calls fail with NotOpen from then on.
    virtual void CloseDatabase(const DatabaseLocation& database) = 0;

    virtual DatabaseCare& Care() = 0;
};

// The provider of that name ("cedb"), null when there is none.
std::unique_ptr<ProviderConnection> CreateProvider(QStringView name);

} // namespace mirel
