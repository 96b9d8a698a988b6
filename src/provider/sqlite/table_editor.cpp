#include "provider/sqlite/table_editor.h"

#include "provider/cell_value.h"
#include "provider/sqlite/key_list.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/record_writer.h"
#include "provider/sqlite/row_reader.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel::sqlite {
namespace {

std::vector<int> FieldsOf(std::span<const FieldChange> values)
{
    std::vector<int> fields;
    for (const FieldChange& change : values)
        fields.push_back(change.field);
    return fields;
}

// A statement over some fields, kept as long as the same ones are asked for: a run changes the same fields of one
// record after the other.
class KeptStatement {
public:
    // What `makeSql` gives is prepared unless these fields are those of the statement that is there.
    template <typename MakeSql>
    Outcome For(DatabaseFile& file, std::span<const FieldChange> values, MakeSql makeSql)
    {
        if (statement_ && std::ranges::equal(values, fields_, {}, &FieldChange::field))
            return {};
        Outcome outcome;
        statement_.reset();
        Statement fresh = file.Prepare(makeSql(), outcome);
        if (!fresh)
            return outcome;
        statement_.emplace(std::move(fresh));
        fields_ = FieldsOf(values);
        return {};
    }
    Statement& Get() { return *statement_; }

private:
    std::optional<Statement> statement_;
    std::vector<int> fields_;
};

class TableEditor : public RecordEditor {
public:
    TableEditor(std::shared_ptr<DatabaseFile> file, const dialect::Table& table, std::vector<ResultField> fields)
        : file_(std::move(file))
        , fields_(std::move(fields))
        , writer_(*file_, table, fields_)
    {
    }

    std::span<const ResultField> Fields() const override { return fields_; }
    Hr Update(RecordId& id, std::span<const FieldChange> expected, std::span<const FieldChange> values) override;
    Hr Delete(const RecordId& id, std::span<const FieldChange> expected) override;
    Hr Add(RecordId& id, std::span<const FieldChange> values) override;
    QString ErrorContext() const override { return context_; }

private:
    Hr Keep(Outcome outcome)
    {
        context_ = std::move(outcome.context);
        return outcome.code;
    }
    template <typename Write>
    Hr OnRecord(const RecordId& id, std::span<const FieldChange> expected, Write write);
    Outcome CheckTransaction() const;
    QByteArray SelectSql(std::span<const FieldChange> expected) const;
    Outcome CheckRecord(qint64 rowId, std::span<const FieldChange> expected);
    bool Holds(std::span<const Cell> cells, std::span<const FieldChange> expected) const;
    Outcome Run(Statement& statement, std::span<const FieldChange> values, std::optional<qint64> rowId,
                std::span<const FieldChange> further = {});
    bool HasWritten() const;
    Outcome MustHaveWritten(Outcome outcome) const;
    QByteArray UpdateMatchingSql(std::span<const FieldChange> values) const;
    Outcome UpdateMatching(qint64 rowId, std::span<const FieldChange> expected,
                           std::span<const FieldChange> values);
    Outcome UpdateChecked(qint64 rowId, std::span<const FieldChange> values, RecordId& id);
    Outcome Move(qint64 rowId, std::span<const FieldChange> values, RecordId& id);
    Outcome Insert(std::optional<qint64> rowId, std::span<const FieldChange> values);

    std::shared_ptr<DatabaseFile> file_;
    std::vector<ResultField> fields_;
    RecordWriter writer_;
    KeptStatement read_;
    std::optional<RowReader> reader_; // of read_
    KeptStatement update_;
    KeptStatement updateMatching_;
    KeptStatement insert_;
    KeptStatement insertAtRowId_;
    KeptStatement delete_;
    QString context_;
};

const Outcome& Gone()
{
    static const Outcome kGone{Hr::NoCurrentRecord, StringText(Str::RecordIsGone)};
    return kGone;
}

// Outside of a transaction, or once a full disk or a failing device has taken it back, a write would be on its
// own.
Outcome TableEditor::CheckTransaction() const
{
    if (!file_->IsOpen())
        return {Hr::NotOpen, {}};
    if (!file_->InTransaction())
        return {Hr::Unexpected, StringText(Str::BulkRunUndone, {file_->Path()})};
    return {};
}

// `write` gets the row id of a record that holds what is expected.
template <typename Write>
Hr TableEditor::OnRecord(const RecordId& id, std::span<const FieldChange> expected, Write write)
{
    Outcome outcome = CheckTransaction();
    if (!outcome.Ok())
        return Keep(std::move(outcome));
    const std::optional<RecordKey> key = KeyOf(id, 1);
    outcome = key ? CheckRecord((*key)[0], expected) : Gone();
    return Keep(outcome.Ok() ? write((*key)[0]) : std::move(outcome));
}

QByteArray TableEditor::SelectSql(std::span<const FieldChange> expected) const
{
    QByteArray columns;
    for (const FieldChange& change : expected)
        columns += (columns.isEmpty() ? "" : ",") + writer_.ColumnOf(change.field);
    return "SELECT " + (columns.isEmpty() ? "1" : columns) + " FROM " + writer_.Table() + " WHERE " +
           writer_.RowId() + "=?";
}

Outcome TableEditor::CheckRecord(qint64 rowId, std::span<const FieldChange> expected)
{
    Outcome outcome = read_.For(*file_, expected, [&] {
        reader_.emplace(fields_, FieldsOf(expected), RowReader::Layout::Listed);
        return SelectSql(expected);
    });
    if (!outcome.Ok())
        return outcome;
    Statement& record = read_.Get();
    record.Bind(1, rowId);
    const int result = record.Step();
    outcome = result == SQLITE_DONE ? Gone() : file_->OutcomeOf(result);
    if (result == SQLITE_ROW && !Holds(reader_->Read(record.Get()), expected))
        outcome = {Hr::RecordChanged, StringText(Str::RecordIsChanged)};
    record.Reset();
    return outcome;
}

bool TableEditor::Holds(std::span<const Cell> cells, std::span<const FieldChange> expected) const
{
    return std::ranges::equal(expected, cells, [this](const FieldChange& change, const Cell& cell) {
        return ValueOfCell(cell, fields_[size_t(change.field)].type) == change.value;
    });
}

// `rowId`: bound behind the values, where the statement takes one; `further` behind that.
Outcome TableEditor::Run(Statement& statement, std::span<const FieldChange> values, std::optional<qint64> rowId,
                         std::span<const FieldChange> further)
{
    Outcome outcome;
    int parameter = 0;
    for (size_t i = 0; i < values.size() && outcome.Ok(); ++i) {
        Value converted;
        outcome = writer_.Convert(values[i], converted);
        statement.Bind(++parameter, converted);
    }
    if (rowId)
        statement.Bind(++parameter, *rowId);
    for (const FieldChange& change : further)
        statement.Bind(++parameter, change.value);
    if (outcome.Ok())
        outcome = file_->OutcomeOf(statement.Step());
    statement.Reset();
    return outcome;
}

bool TableEditor::HasWritten() const
{
    return sqlite3_changes64(file_->Handle()) > 0;
}

// After a statement that should have written a record which is there: a trigger or a rule may have ignored it.
Outcome TableEditor::MustHaveWritten(Outcome outcome) const
{
    return outcome.Ok() && !HasWritten() ? Outcome{Hr::IntegrityViolation, {}} : outcome;
}

QByteArray TableEditor::UpdateMatchingSql(std::span<const FieldChange> values) const
{
    QByteArray sql = writer_.UpdateSql(values);
    qsizetype parameter = qsizetype(values.size()) + 1; // the row id's
    for (const FieldChange& change : values) {
        const QByteArray column = writer_.ColumnOf(change.field);
        const QByteArray place = '?' + QByteArray::number(++parameter);
        sql +=
            " AND " + column + " COLLATE BINARY IS " + place + " AND typeof(" + column + ")=typeof(" + place + ')';
    }
    return sql;
}

// Reads and writes by one statement, in half of the time that two take. It finds the values in the form in which
// this system stores them, which is that of nearly all; nothing is written where the record has others.
Outcome TableEditor::UpdateMatching(qint64 rowId, std::span<const FieldChange> expected,
                                    std::span<const FieldChange> values)
{
    Outcome outcome = updateMatching_.For(*file_, values, [&] { return UpdateMatchingSql(values); });
    return outcome.Ok() ? Run(updateMatching_.Get(), values, rowId, expected) : outcome;
}

Hr TableEditor::Update(RecordId& id, std::span<const FieldChange> expected, std::span<const FieldChange> values)
{
    constexpr size_t kMostMatched = 32; // conditions of one statement have their bounds
    Outcome outcome = CheckTransaction();
    const std::optional<RecordKey> key = KeyOf(id, 1);
    if (!outcome.Ok() || !key)
        return Keep(outcome.Ok() ? Gone() : std::move(outcome));
    const bool isPlain = !values.empty() && values.size() <= kMostMatched && !writer_.MovesRecords(values) &&
                         std::ranges::equal(values, expected, {}, &FieldChange::field, &FieldChange::field);
    if (isPlain) {
        outcome = UpdateMatching((*key)[0], expected, values);
        if (outcome.Ok() && HasWritten())
            file_->NoteValues();
        if (!outcome.Ok() || HasWritten())
            return Keep(std::move(outcome));
    }
    return OnRecord(id, expected, [&](qint64 rowId) { return UpdateChecked(rowId, values, id); });
}

Outcome TableEditor::UpdateChecked(qint64 rowId, std::span<const FieldChange> values, RecordId& id)
{
    if (values.empty())
        return {};
    if (writer_.MovesRecords(values))
        return Move(rowId, values, id);
    Outcome outcome = update_.For(*file_, values, [&] { return writer_.UpdateSql(values); });
    if (outcome.Ok())
        outcome = MustHaveWritten(Run(update_.Get(), values, rowId));
    if (outcome.Ok())
        file_->NoteValues();
    return outcome;
}

// An update that may give the record another row id.
Outcome TableEditor::Move(qint64 rowId, std::span<const FieldChange> values, RecordId& id)
{
    Outcome outcome = writer_.Update(values, rowId);
    if (outcome.Ok())
        id = IdOf({rowId});
    return outcome.code == Hr::NoCurrentRecord ? Outcome{Hr::IntegrityViolation, {}} : outcome;
}

Hr TableEditor::Delete(const RecordId& id, std::span<const FieldChange> expected)
{
    return OnRecord(id, expected, [&](qint64 rowId) {
        Outcome outcome = delete_.For(*file_, {}, [&] { return writer_.DeleteSql(); });
        if (outcome.Ok())
            outcome = MustHaveWritten(Run(delete_.Get(), {}, rowId));
        if (outcome.Ok())
            file_->NoteChange(writer_.TableName());
        return outcome;
    });
}

Hr TableEditor::Add(RecordId& id, std::span<const FieldChange> values)
{
    Outcome outcome = CheckTransaction();
    if (!outcome.Ok())
        return Keep(std::move(outcome));
    const std::optional<RecordKey> key = KeyOf(id, 1);
    const bool atRowId = key && !writer_.MovesRecords(values);
    outcome = Insert(atRowId ? std::optional((*key)[0]) : std::nullopt, values);
    if (outcome.Ok()) {
        file_->NoteChange(writer_.TableName());
        id = IdOf({sqlite3_last_insert_rowid(file_->Handle())});
    }
    return Keep(std::move(outcome));
}

Outcome TableEditor::Insert(std::optional<qint64> rowId, std::span<const FieldChange> values)
{
    KeptStatement& insert = rowId ? insertAtRowId_ : insert_;
    Outcome outcome = insert.For(*file_, values, [&] { return writer_.InsertSql(values, rowId.has_value()); });
    if (outcome.Ok())
        outcome = MustHaveWritten(Run(insert.Get(), values, rowId));
    const bool isTaken = outcome.code == Hr::IntegrityViolation &&
                         sqlite3_extended_errcode(file_->Handle()) == SQLITE_CONSTRAINT_ROWID;
    return isTaken && rowId ? Insert({}, values) : outcome;
}

} // namespace

std::unique_ptr<RecordEditor> OpenEditor(std::shared_ptr<DatabaseFile> file, const QString& table,
                                         Outcome& outcome)
{
    const dialect::Table* target = FindWritableTable(*file, table, outcome);
    if (!target)
        return {};
    std::vector<ResultField> fields;
    for (const dialect::Column& column : target->columns)
        fields.push_back(ResultFieldOf(*target, column));
    return std::make_unique<TableEditor>(std::move(file), *target, std::move(fields));
}

} // namespace mirel::sqlite
