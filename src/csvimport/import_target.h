#pragma once

#include "csvimport/key_index.h"
#include "data/db_connection.h"
#include "data/db_recordset.h"
#include "data/db_transaction.h"
#include "provider/provider.h"

#include <memory>
#include <span>
#include <vector>

namespace mirel {

// Where an import's records go: one table, in one transaction. Without Commit nothing of the run stays.
class ImportTarget {
public:
    virtual ~ImportTarget() = default;

    // Those that the plan fills, in its order.
    virtual std::span<const ResultField> Fields() const = 0;

    enum class Taken { Added, Updated, Superseded, Refused };
    // Refused: the record is not there, and the failure below says why. The target goes on working.
    virtual Taken Put(std::span<const Cell> cells, qint64 line) = 0;
    virtual Hr Commit() = 0;

    // Of the last failing call.
    QString ErrorText() const { return errorText_; }
    int RefusedField() const { return refusedField_; } // -1: no single one

protected:
    Taken Refuse(const QString& why, int field)
    {
        errorText_ = why;
        refusedField_ = field;
        return Taken::Refused;
    }

    QString errorText_;
    int refusedField_ = -1;
};

// Adds every record.
class AppendTarget : public ImportTarget {
public:
    // Null when the table cannot be written to; the reason is in `fault`.
    static std::unique_ptr<AppendTarget> Open(DbConnection& connection, const DatabaseLocation& database,
                                              const ImportPlan& plan, QString& fault);

    std::span<const ResultField> Fields() const override { return appender_->Fields(); }
    Taken Put(std::span<const Cell> cells, qint64 line) override;
    Hr Commit() override;

private:
    explicit AppendTarget(std::unique_ptr<RecordAppender> appender)
        : appender_(std::move(appender))
    {
    }
    std::unique_ptr<RecordAppender> appender_;
};

// Changes the records whose key a line bears, and adds the others.
class KeyedTarget : public ImportTarget {
public:
    // Takes the lock for writing and reads the keys of the table; null as above.
    static std::unique_ptr<KeyedTarget> Open(DbConnection& connection, const DatabaseLocation& database,
                                             const ImportPlan& plan, QString& fault);

    // Takes in the lines of the file, which must come before the first Put.
    KeyIndex& Keys() { return keys_; }

    std::span<const ResultField> Fields() const override { return append_->Fields(); }
    Taken Put(std::span<const Cell> cells, qint64 line) override;
    Hr Commit() override;

private:
    KeyedTarget(DbConnection& connection, const DatabaseLocation& database)
        : transaction_(connection, database)
        , table_(connection)
    {
    }
    bool Begin(DbConnection& connection, const DatabaseLocation& database, const ImportPlan& plan, QString& fault);
    Taken Update(const RecordId& record, std::span<const Cell> cells);

    DbTransaction transaction_; // goes last: it takes back what the others wrote
    DbRecordset table_;
    std::unique_ptr<AppendTarget> append_;
    KeyIndex keys_;
    std::vector<int> keyAt_;   // of the plan's fields
    std::vector<int> fieldAt_; // in the table, of each of the plan's fields
};

// Reads the keys of a table into an index; false, with the reason in `fault`.
[[nodiscard]] bool ReadKeys(DbRecordset& table, const DatabaseLocation& database, const ImportPlan& plan,
                            KeyIndex& keys, QString& fault);

} // namespace mirel
