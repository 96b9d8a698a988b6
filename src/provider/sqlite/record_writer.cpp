#include "provider/sqlite/record_writer.h"

#include "provider/conversion.h"
#include "provider/dialect/structure_checker.h"
#include "provider/sqlite/sql_writer.h"
#include "resources/string_table.h"

#include <algorithm>
#include <optional>

namespace mirel::sqlite {

const dialect::Table* FindWritableTable(DatabaseFile& file, const QString& name, Outcome& outcome)
{
    outcome = file.RefreshSchema();
    if (!outcome.Ok())
        return nullptr;
    const dialect::Table* table = file.Schema().FindTable(name);
    if (!table)
        outcome = {Hr::NoSuchTable, {}};
    else if (const std::optional<dialect::Failure> refused = dialect::RefuseChange(*table))
        outcome = {refused->code, refused->context};
    return outcome.Ok() ? table : nullptr;
}

RecordWriter::RecordWriter(DatabaseFile& file, const dialect::Table& table, std::span<const ResultField> fields)
    : file_(file)
    , name_(table.name)
    , table_(QuoteName(table.storedName))
    , rowId_(table.rowId)
    , fields_(fields.begin(), fields.end())
{
}

QByteArray RecordWriter::ColumnOf(int field) const
{
    return QuoteName(fields_[size_t(field)].column);
}

// One of them alone may be the row id under another name.
const QStringList& RecordWriter::KeyColumns() const
{
    if (keyColumns_)
        return *keyColumns_;
    keyColumns_.emplace();
    Outcome outcome;
    Statement columns =
        file_.Prepare("SELECT name FROM pragma_table_info(" + QuoteText(name_) + ") WHERE pk>0", outcome);
    while (columns && columns.Step() == SQLITE_ROW)
        *keyColumns_ += columns.Text(0);
    return *keyColumns_;
}

bool RecordWriter::MovesRecords(int field) const
{
    return KeyColumns().contains(fields_[size_t(field)].column);
}

bool RecordWriter::MovesRecords(std::span<const FieldChange> values) const
{
    return std::ranges::any_of(values, [this](const FieldChange& change) { return MovesRecords(change.field); });
}

Outcome RecordWriter::Convert(const FieldChange& change, Value& converted) const
{
    const ResultField& field = fields_[size_t(change.field)];
    if (field.column.isEmpty())
        return {Hr::ReadOnly, StringText(Str::ColumnIsComputed, {field.name})};
    return {ConvertForColumn(change.value, field.type, field.size, converted), {}};
}

Outcome RecordWriter::ConvertAll(std::span<const FieldChange> values, std::vector<Value>& converted) const
{
    for (const FieldChange& change : values) {
        if (Outcome outcome = Convert(change, converted.emplace_back()); !outcome.Ok())
            return outcome;
    }
    return {};
}

QByteArray RecordWriter::InsertSql(std::span<const FieldChange> values, bool atRowId) const
{
    if (values.empty() && !atRowId)
        return "INSERT INTO " + table_ + " DEFAULT VALUES";
    QByteArray names;
    QByteArray places;
    const auto add = [&](const QByteArray& column) {
        names += (names.isEmpty() ? "" : ",") + column;
        places += places.isEmpty() ? "?" : ",?";
    };
    for (const FieldChange& change : values)
        add(ColumnOf(change.field));
    if (atRowId)
        add(rowId_);
    return "INSERT INTO " + table_ + " (" + names + ") VALUES (" + places + ')';
}

QByteArray RecordWriter::UpdateSql(std::span<const FieldChange> values) const
{
    QByteArray assignments;
    for (const FieldChange& change : values)
        assignments += (assignments.isEmpty() ? "" : ",") + ColumnOf(change.field) + "=?";
    return "UPDATE " + table_ + " SET " + assignments + " WHERE " + rowId_ + "=?";
}

QByteArray RecordWriter::DeleteSql() const
{
    return "DELETE FROM " + table_ + " WHERE " + rowId_ + "=?";
}

Outcome RecordWriter::Run(const QByteArray& sql, std::span<const Value> values, qint64& rowId)
{
    Outcome outcome;
    Statement statement = file_.Prepare(sql + " RETURNING " + rowId_, outcome);
    if (!statement)
        return outcome;
    for (size_t i = 0; i < values.size(); ++i)
        statement.Bind(int(i) + 1, values[i]);
    if (sqlite3_bind_parameter_count(statement.Get()) > int(values.size()))
        statement.Bind(int(values.size()) + 1, rowId);
    std::optional<qint64> written;
    int result = statement.Step();
    for (; result == SQLITE_ROW; result = statement.Step())
        written = statement.Integer(0);
    if (result != SQLITE_DONE) // what it returned is undone: the file was in use when it came to commit
        return file_.OutcomeOf(result);
    if (!written)
        return {Hr::NoCurrentRecord, StringText(Str::RecordIsGone)};
    rowId = *written;
    return {};
}

bool RecordWriter::IsFree(qint64 rowId) const
{
    Outcome outcome;
    Statement record = file_.Prepare("SELECT 1 FROM " + table_ + " WHERE " + rowId_ + "=?", outcome);
    if (record)
        record.Bind(1, rowId);
    return record && record.Step() == SQLITE_DONE;
}

Outcome RecordWriter::Add(std::span<const FieldChange> values, std::optional<qint64> preferred, qint64& rowId)
{
    std::vector<Value> converted;
    if (Outcome outcome = ConvertAll(values, converted); !outcome.Ok())
        return outcome;
    const bool atPreferred = preferred && !MovesRecords(values) && IsFree(*preferred);
    if (atPreferred)
        rowId = *preferred;
    Outcome outcome = Run(InsertSql(values, atPreferred), converted, rowId);
    if (outcome.Ok())
        file_.NoteChange(name_);
    return outcome;
}

Outcome RecordWriter::Update(std::span<const FieldChange> values, qint64& rowId)
{
    std::vector<Value> converted;
    if (Outcome outcome = ConvertAll(values, converted); !outcome.Ok())
        return outcome;
    if (values.empty())
        return {};
    const qint64 old = rowId;
    Outcome outcome = Run(UpdateSql(values), converted, rowId);
    if (outcome.Ok())
        file_.NoteValues();
    if (outcome.Ok() && rowId != old)
        file_.NoteChange(name_);
    return outcome;
}

Outcome RecordWriter::Delete(qint64 rowId)
{
    Outcome outcome = Run(DeleteSql(), {}, rowId);
    if (outcome.Ok())
        file_.NoteChange(name_);
    return outcome;
}

} // namespace mirel::sqlite
