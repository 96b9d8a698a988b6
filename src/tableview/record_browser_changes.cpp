#include "platform/ole_date.h"
#include "resources/string_table.h"
#include "result/cell_text.h"
#include "tableview/record_browser.h"

#include <QDateTime>

#include <algorithm>

// What the record browser writes: cells, records, blocks of cells, and the way back.

namespace mirel {

// The edit stays as the user left it.
bool RecordBrowser::WriteFailure(const QString& text)
{
    writeError_ = text;
    writeFailed_ = true;
    return false;
}

bool RecordBrowser::WriteEdit()
{
    if (!edit_.IsPending())
        return true;
    const FieldChange change{selectedField_, edit_.Stored()};
    switch (result_.Update({&change, 1}, settings_.words)) {
    case OpenResult::Written::Refused:
    case OpenResult::Written::Gone:
        return WriteFailure(result_.LastFailure());
    case OpenResult::Written::Done:
    case OpenResult::Written::GaveWay:
        break;
    }
    writeFailed_ = false;
    fingerprint_.clear();
    if (SelectedRecord() >= 0 && list_.RowOf(SelectedRecord()) != SelectedRow())
        ShowRecordAgain(SelectedRecord()); // others have moved it meanwhile
    edit_.Load(Recordset().FieldValue(selectedField_), TypeOfField(selectedField_),
               Recordset().FieldSize(selectedField_), settings_.leadingNumber);
    RefreshCell();
    return true;
}

// --- drafts -------------------------------------------------------------------------------------------------

std::optional<RecordDraft> RecordBrowser::Draft()
{
    if (!edit_.IsPending())
        return {};
    if (fingerprint_.isEmpty())
        fingerprint_ = result_.Fingerprint();
    const bool isTick = edit_.Kind() == EditorKind::Check;
    const QString text = isTick ? QString::number(edit_.IsChecked() ? 1 : 0) : edit_.Text();
    return RecordDraft{.statement = BaseStatement(),
                       .record = Recordset().Id(),
                       .fingerprint = fingerprint_,
                       .texts = {{selectedField_, FieldName(selectedField_), text, isTick}}};
}

bool RecordBrowser::PutBack(const RecordDraft& draft)
{
    if (!IsOpen() || HasPendingEdit() || draft.texts.size() != 1 || draft.record.IsNull())
        return false;
    const TypedText& typed = draft.texts.front();
    const bool isTick = typed.place >= 0 && TypeOfField(typed.place) == FieldType::YesNo;
    if (!IsWritable(typed.place) || FieldName(typed.place) != typed.name || isTick != typed.isTick)
        return false;
    TakeUpChanges();
    const qint64 before = SelectedRecord();
    const bool isThere = result_.MoveToRecord(draft.record) && result_.Fingerprint() == draft.fingerprint;
    if (isThere) {
        selectedField_ = typed.place;
        visible_[size_t(typed.place)] = true;
        RebuildColumns();
    } else if (before >= 0) {
        (void)result_.MoveTo(before);
    }
    KeepSelectionInPage();
    ShowRecordAgain(SelectedRecord());
    LoadEditor();
    if (!isThere || Recordset().Id() != draft.record)
        return false;
    typed.isTick ? EditChecked(typed.text == u"1") : EditText(typed.text);
    return HasPendingEdit();
}

// --- records ------------------------------------------------------------------------------------------------

// Scrolls to the record, which is current, and fills the page.
void RecordBrowser::ShowRecordAgain(qint64 record)
{
    if (presentation_ == Presentation::List && record >= 0) {
        list_.ScrollTo(list_.Top(), HighestTopRow());
        list_.Show(record);
    }
    FillPage();
}

bool RecordBrowser::IsRecordStillThere()
{
    const RecordId before = Recordset().Id();
    TakeUpChanges();
    if (SelectedRecord() >= 0 && Recordset().Id() == before)
        return true;
    prompt_.Show({Str::RecordDeletedMeanwhile, {}});
    return false;
}

bool RecordBrowser::AddRecord()
{
    if (!IsOpen() || FieldCount() == 0 || !WriteEdit())
        return false;
    std::vector<FieldChange> values = result_.NewRecordValues(QDateTime::currentDateTime());
    if (CanUpdate() && !result_.AskForRequired(values))
        return false;
    if (result_.Add(values) != OpenResult::Written::Done) {
        prompt_.ShowError(result_.LastFailure());
        return false;
    }
    selectedField_ = VisibleFields().front();
    detail_.ScrollTo(0, 0);
    list_.ScrollTo(HighestTopRow(), HighestTopRow());
    ShowRecordAgain(SelectedRecord());
    LoadEditor();
    return true;
}

bool RecordBrowser::DeleteRecord()
{
    if (!IsOpen() || SelectedRecord() < 0 || !WriteEdit())
        return false;
    const SeenRecord asked = result_.Seen(); // what the screen shows, whatever is there by now
    if (!IsRecordStillThere())
        return false;
    if (Block().Records() > 1)
        return DeleteBlock();
    if (settings_.confirmDelete && !prompt_.AskYesNo({Str::DeleteRecordQuestion, {}}))
        return false;
    const OpenResult::Written written = result_.Delete(asked, settings_.words);
    if (written == OpenResult::Written::Refused) {
        prompt_.ShowError(result_.LastFailure());
        RunAgain();
        return false;
    }
    if (written == OpenResult::Written::Gone) {
        prompt_.Show({Str::RecordDeletedMeanwhile, {}});
        TakeUpChanges();
        return false;
    }
    ShowRecordAgain(SelectedRecord());
    LoadEditor();
    return written == OpenResult::Written::Done;
}

// --- many records at once -----------------------------------------------------------------------------------

OpenResult::ManyWritten RecordBrowser::ChangeRecords(const std::vector<SeenRecord>& asked, qint64 count,
                                                     const std::function<std::vector<FieldChange>(qint64)>& values,
                                                     Progress& progress)
{
    if (!CanUpdate() || !WriteEdit())
        return {};
    const std::vector<FieldChange> presets = result_.NewRecordValues(QDateTime::currentDateTime());
    const auto withPresets = [&](qint64 record) {
        std::vector<FieldChange> wanted = values(record);
        for (const FieldChange& preset : presets) {
            const bool isNew = record >= qint64(asked.size());
            if (isNew && std::ranges::find(wanted, preset.field, &FieldChange::field) == wanted.end())
                wanted.push_back(preset);
        }
        return wanted;
    };
    const RecordId selected = Recordset().Id();
    const OpenResult::ManyWritten written = result_.WriteMany(asked, count, withPresets, progress);
    if (!result_.MoveToRecord(selected))
        (void)result_.MoveTo(std::max<qint64>(SelectedRecord(), 0));
    ShowRecordAgain(SelectedRecord());
    LoadEditor();
    return written;
}

bool RecordBrowser::DeleteBlock()
{
    const CellBlock block = Block();
    const std::vector<SeenRecord> asked = SeenFrom(block.firstRecord, block.Records());
    if (settings_.confirmDelete &&
        !prompt_.AskYesNo({Str::DeleteRecordsQuestion, {QString::number(block.Records())}}))
        return false;
    if (block.Records() * FieldCount() > ChangeLog::kMostCells && !prompt_.AskYesNo({Str::BeyondUndo, {}}))
        return false;
    OpenResult::ManyWritten deleted;
    {
        const std::unique_ptr<Progress> progress =
            prompt_.StartProgress({Str::DeletingSelected, {}}, block.Records());
        deleted = result_.DeleteMany(asked, *progress);
    }
    if (!deleted.failure.isEmpty())
        prompt_.ShowError(deleted.failure);
    if (deleted.leftAlone > 0)
        prompt_.Show({Str::LeftAlone, {QString::number(deleted.leftAlone)}});
    CollapseBlock();
    (void)result_.MoveTo(block.firstRecord);
    ShowRecordAgain(SelectedRecord());
    LoadEditor();
    return deleted.failure.isEmpty();
}

// --- the way back -------------------------------------------------------------------------------------------

bool RecordBrowser::Undo()
{
    if (edit_.IsPending()) {
        RevertEdit();
        return true;
    }
    return !IsOpen() || !result_.CanUndo() || ShowTurned(result_.Undo());
}

bool RecordBrowser::Redo()
{
    return !IsOpen() || !CanRedo() || ShowTurned(result_.Redo());
}

bool RecordBrowser::ShowTurned(const ChangeLog::Outcome& outcome)
{
    const auto at = std::ranges::find(Fields(), outcome.column, &ResultField::column);
    const int field = int(at - Fields().begin());
    if (!outcome.record.IsNull() && field < FieldCount() && IsVisible(field))
        selectedField_ = field;
    KeepSelectionInPage();
    ShowRecordAgain(SelectedRecord());
    LoadEditor();
    return outcome.done;
}

} // namespace mirel
