#include "data/catalog.h"
#include "data/provider_error.h"
#include "platform/ole_date.h"
#include "provider/conversion.h"
#include "resources/string_table.h"
#include "tableview/record_browser.h"

#include <QDateTime>

#include <algorithm>

// What the record browser writes: cells, records, blocks of cells, and the way back.

namespace mirel {

using namespace Qt::StringLiterals;

bool RecordBrowser::WriteEdit()
{
    if (!edit_.IsPending())
        return true;
    const Value before = recordset_.FieldValue(selectedField_);
    if (!recordset_.Update(selectedField_, edit_.Stored())) {
        writeError_ = ProviderErrorText(&recordset_, recordset_.LastResult(), recordset_.ErrorContext());
        writeFailed_ = true;
        return false;
    }
    generation_ = recordset_.Generation();
    writeFailed_ = false;
    const Value after = recordset_.FieldValue(selectedField_);
    std::optional<RecordChange> change = NewChange(RecordChange::Kind::Changed);
    if (change && before != after) {
        change->fields = {{recordset_.Fields()[size_t(selectedField_)].column, before, after}};
        undo_.Add({*change});
    }
    edit_.Load(after, TypeOfField(selectedField_), recordset_.FieldSize(selectedField_));
    RefreshCell();
    return true;
}

// --- records ------------------------------------------------------------------------------------------------

// Only what a new record does not have by itself: the store fills in its own keys and defaults.
std::vector<FieldChange> RecordBrowser::NewRecordValues() const
{
    const std::optional<double> today = OleDate(QDate::currentDate().startOfDay());
    std::vector<FieldChange> values;
    for (int field = 0; field < FieldCount(); ++field) {
        if (!IsWritable(field))
            continue;
        if (TypeOfField(field) == FieldType::Date && today)
            values.push_back({field, Value::Date(*today)});
        else if (TypeOfField(field) == FieldType::YesNo)
            values.push_back({field, Value::Bool(false)});
    }
    return values;
}

bool RecordBrowser::AddRecord()
{
    if (!IsOpen() || FieldCount() == 0 || !WriteEdit())
        return false;
    UndoLog::Step step;
    if (!AddOne({}, &step)) {
        ReportFailure();
        return false;
    }
    undo_.Add(std::move(step));
    count_.reset();
    const qint64 added = Count() - 1;
    const std::vector<int> fields = VisibleFields();
    selectedField_ = fields.front();
    topFieldRow_ = 0;
    topRow_ = HighestTopRow();
    ShowRecord(added);
    FillPage();
    LoadEditor();
    return true;
}

bool RecordBrowser::DeleteRecord()
{
    const qint64 record = SelectedRecord();
    if (record < 0 || !WriteEdit())
        return false;
    if (Block().Records() > 1)
        return DeleteBlock();
    if (settings_.confirmDelete && !prompt_.AskYesNo({Str::DeleteRecordQuestion, {}}))
        return false;
    UndoLog::Step step;
    DbRecordset table(connection_);
    NoteDeleted(table, step);
    if (!recordset_.Delete()) {
        ReportFailure();
        RunAgain();
        return false;
    }
    undo_.Add(std::move(step));
    count_.reset();
    topRow_ = std::min(topRow_, HighestTopRow());
    ShowRecord(std::min(record, Count() - 1));
    FillPage();
    LoadEditor();
    return true;
}

// --- many records at once -----------------------------------------------------------------------------------

RecordBrowser::ManyChanged
RecordBrowser::ChangeRecords(qint64 first, qint64 count,
                             const std::function<std::vector<FieldChange>(qint64)>& values, Progress& progress)
{
    constexpr qint64 kRecordsAStep = 64;
    ManyChanged changed;
    if (!CanUpdate() || !WriteEdit())
        return changed;
    ProviderConnection& provider = *connection_.Provider();
    if (const Hr begun = provider.BeginBulk(database_); Failed(begun)) {
        changed.failure = ProviderErrorText(nullptr, begun, {});
        return changed;
    }
    Count();
    UndoLog::Step step;
    while (changed.records < count && changed.failure.isEmpty()) {
        if (changed.records % kRecordsAStep == 0 && !progress.Advance(changed.records))
            break;
        const std::vector<FieldChange> wanted = values(changed.records);
        const auto refused = std::ranges::find_if(wanted, [this](const FieldChange& change) {
            Value converted;
            return Failed(ConvertForColumn(change.value, TypeOfField(change.field),
                                           recordset_.FieldSize(change.field), converted));
        });
        if (refused != wanted.end())
            changed.refusedField = refused->field;
        const bool isUndone = count * qint64(wanted.size()) <= kMostUndoneCells;
        if (ChangeOne(first + changed.records, wanted, isUndone ? &step : nullptr))
            ++changed.records;
        else
            changed.failure = ProviderErrorText(&recordset_, recordset_.LastResult(), recordset_.ErrorContext());
    }
    if (const Hr ended = provider.EndBulk(database_); Failed(ended)) {
        changed = {0, ProviderErrorText(nullptr, ended, {}), -1};
        step.clear();
    }
    undo_.Add(std::move(step));
    count_.reset();
    ShowRecord(std::clamp<qint64>(SelectedRecord(), 0, Count() - 1));
    FillPage();
    LoadEditor();
    return changed;
}

bool RecordBrowser::DeleteBlock()
{
    const CellBlock block = Block();
    if (settings_.confirmDelete &&
        !prompt_.AskYesNo({Str::DeleteRecordsQuestion, {QString::number(block.Records())}}))
        return false;
    const bool isUndone = block.Records() * FieldCount() <= kMostUndoneCells;
    if (!isUndone && !prompt_.AskYesNo({Str::BeyondUndo, {}}))
        return false;
    ProviderConnection& provider = *connection_.Provider();
    Hr result = provider.BeginBulk(database_);
    if (Failed(result)) {
        ReportProviderError(prompt_, nullptr, result);
        return false;
    }
    UndoLog::Step step;
    const bool deleted = DeleteFrom(block.firstRecord, block.lastRecord, isUndone ? &step : nullptr);
    if (!deleted)
        ReportFailure();
    result = provider.EndBulk(database_);
    ReportProviderError(prompt_, nullptr, result);
    if (!Failed(result))
        undo_.Add(std::move(step));
    count_.reset();
    topRow_ = std::min(topRow_, HighestTopRow());
    ShowRecord(std::min(block.firstRecord, Count() - 1));
    FillPage();
    LoadEditor();
    return deleted && !Failed(result);
}

// From the last to the first, so that those still to go keep their places. A stop is no failure.
bool RecordBrowser::DeleteFrom(qint64 first, qint64 last, UndoLog::Step* step)
{
    constexpr qint64 kRecordsAStep = 64;
    const std::unique_ptr<Progress> progress =
        prompt_.StartProgress({Str::DeletingSelected, {}}, last - first + 1);
    DbRecordset table(connection_);
    for (qint64 record = last; record >= first; --record) {
        if ((last - record) % kRecordsAStep == 0 && !progress->Advance(last - record))
            return true;
        if (!recordset_.MoveTo(record))
            return false;
        if (step)
            NoteDeleted(table, *step);
        if (!recordset_.Delete())
            return false;
    }
    return true;
}

bool RecordBrowser::ChangeOne(qint64 record, std::vector<FieldChange> values, UndoLog::Step* step)
{
    if (record >= *count_)
        return AddOne(std::move(values), step);
    if (!recordset_.MoveTo(record))
        return false;
    std::optional<RecordChange> change;
    if (step)
        change = NewChange(RecordChange::Kind::Changed);
    const auto read = [&](Value RecordChange::Field::*into) {
        for (size_t i = 0; change && i < values.size(); ++i)
            change->fields[i].*into = recordset_.FieldValue(values[i].field);
    };
    if (change) {
        for (const FieldChange& value : values)
            change->fields.push_back({recordset_.Fields()[size_t(value.field)].column, {}, {}});
    }
    read(&RecordChange::Field::before);
    if (!recordset_.Update(values))
        return false;
    read(&RecordChange::Field::after);
    if (change)
        step->push_back(std::move(*change));
    return true;
}

bool RecordBrowser::AddOne(std::vector<FieldChange> values, UndoLog::Step* step)
{
    for (const FieldChange& preset : NewRecordValues()) {
        if (std::ranges::find(values, preset.field, &FieldChange::field) == values.end())
            values.push_back(preset);
    }
    if (!recordset_.AddNew(values))
        return false;
    if (step)
        NoteAdded(*step);
    return true;
}

// --- the way back -------------------------------------------------------------------------------------------

// Of the current record, without its fields.
std::optional<RecordChange> RecordBrowser::NewChange(RecordChange::Kind kind) const
{
    const std::optional<qint64> id = recordset_.RecordId();
    const std::span<const ResultField> fields = recordset_.Fields();
    const auto from =
        std::ranges::find_if(fields, [](const ResultField& field) { return !field.column.isEmpty(); });
    if (!id || from == fields.end())
        return {};
    return RecordChange{.kind = kind, .table = from->table, .id = *id, .fields = {}};
}

void RecordBrowser::NoteAdded(UndoLog::Step& step) const
{
    std::optional<RecordChange> change = NewChange(RecordChange::Kind::Added);
    if (!change)
        return;
    for (int field = 0; field < FieldCount(); ++field) {
        const QString& column = recordset_.Fields()[size_t(field)].column;
        if (!column.isEmpty())
            change->fields.push_back({column, {}, recordset_.FieldValue(field)});
    }
    step.push_back(std::move(*change));
}

// The whole record, also what of it the result does not show: `table` is opened for that where it is not yet.
void RecordBrowser::NoteDeleted(DbRecordset& table, UndoLog::Step& step)
{
    std::optional<RecordChange> change = NewChange(RecordChange::Kind::Deleted);
    if (!change)
        return;
    if (!table.IsOpen() &&
        !table.Open(StatementOfTable(change->table), database_, CursorType::Static, LockType::Optimistic))
        return;
    std::vector<int> shown; // where the result has each of the table's columns
    for (const ResultField& column : table.Fields()) {
        const auto at = std::ranges::find(recordset_.Fields(), column.column, &ResultField::column);
        shown.push_back(at == recordset_.Fields().end() ? -1 : int(at - recordset_.Fields().begin()));
    }
    const bool isWhole = std::ranges::find(shown, -1) == shown.end();
    if (!isWhole && !table.MoveToRecord(change->id))
        return;
    for (int column = 0; column < table.FieldCount(); ++column) {
        const Value value = isWhole ? recordset_.FieldValue(shown[size_t(column)]) : table.FieldValue(column);
        change->fields.push_back({table.Fields()[size_t(column)].column, value, {}});
    }
    step.push_back(std::move(*change));
}

bool RecordBrowser::Undo()
{
    if (edit_.IsPending()) {
        RevertEdit();
        return true;
    }
    if (!IsOpen() || !undo_.CanUndo())
        return true;
    qint64 record = std::max<qint64>(SelectedRecord(), 0);
    const UndoLog::Outcome outcome = undo_.Undo(connection_, database_, recordset_, prompt_);
    count_.reset();
    record = std::min(record, Count() - 1);
    if (outcome.record && recordset_.MoveToRecord(*outcome.record)) {
        record = recordset_.Position();
        const auto at = std::ranges::find(recordset_.Fields(), outcome.column, &ResultField::column);
        const int field = int(at - recordset_.Fields().begin());
        if (field < FieldCount() && IsVisible(field))
            selectedField_ = field;
    }
    topRow_ = std::min(topRow_, HighestTopRow());
    ShowRecord(record);
    FillPage();
    LoadEditor();
    return outcome.done;
}

} // namespace mirel
