#pragma once

#include "provider/provider.h"
#include "provider/sqlite/database_file.h"

#include <optional>
#include <span>

namespace mirel::sqlite {

// The table of that name; null, and why, when it is not there or cannot be written.
const dialect::Table* FindWritableTable(DatabaseFile& file, const QString& name, Outcome& outcome);

// Writes single records of one table, by row id. Values are checked and converted for their columns first, so
// a refused one leaves the record as it was.
class RecordWriter {
public:
    // `fields` are a result's; all that are written must be columns of `table`. The file must outlive it.
    RecordWriter(DatabaseFile& file, const dialect::Table& table, std::span<const ResultField> fields);

    // The record gets the row id `preferred` where no other has it.
    Outcome Add(std::span<const FieldChange> values, std::optional<qint64> preferred, qint64& rowId);
    // `rowId` becomes another where a column that is the row id was changed.
    Outcome Update(std::span<const FieldChange> values, qint64& rowId);
    Outcome Delete(qint64 rowId);

    // Ends with ReadOnly for an expression, BadLiteral or Overflow for what does not fit.
    Outcome Convert(const FieldChange& change, Value& converted) const;
    // Each has a place for each value, and at the end one for the row id, where it takes one.
    QByteArray InsertSql(std::span<const FieldChange> values, bool atRowId) const;
    QByteArray UpdateSql(std::span<const FieldChange> values) const;
    QByteArray DeleteSql() const;
    QByteArray ColumnOf(int field) const;
    // Whether the field may be the row id under a name of its own, so that records move when it is written.
    bool MovesRecords(int field) const;
    bool MovesRecords(std::span<const FieldChange> values) const;
    const QString& TableName() const { return name_; }
    const QByteArray& Table() const { return table_; } // as SQL
    const QByteArray& RowId() const { return rowId_; } // its alias

private:
    bool IsFree(qint64 rowId) const;
    const QStringList& KeyColumns() const;
    Outcome ConvertAll(std::span<const FieldChange> values, std::vector<Value>& converted) const;
    Outcome Run(const QByteArray& sql, std::span<const Value> values, qint64& rowId);

    DatabaseFile& file_;
    QString name_;
    QByteArray table_;
    QByteArray rowId_;
    std::vector<ResultField> fields_;
    mutable std::optional<QStringList> keyColumns_; // once asked for
};

} // namespace mirel::sqlite
