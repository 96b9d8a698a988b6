#include "tableview/record_browser.h"

#include "data/catalog.h"
#include "data/provider_error.h"
#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"
#include "tableview/cell_text.h"

#include <QDateTime>

#include <algorithm>

// The result and the editor; the page and the selection are in record_browser_page.cpp, what is written in
// record_browser_changes.cpp.

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// How long a small result may take to be counted before its first page is shown.
constexpr int kFirstCountMs = 3;

} // namespace

RecordBrowser::RecordBrowser(DbConnection& connection, QString database, UserPrompt& prompt,
                             TableViewSettings settings)
    : connection_(connection)
    , recordset_(connection)
    , prompt_(prompt)
    , database_(std::move(database))
    , settings_(std::move(settings))
{
}

QString RecordBrowser::StatementOfTable(QStringView table)
{
    return u"SELECT * FROM "_s + FieldReference(table);
}

bool RecordBrowser::Open(const QString& statement)
{
    if (!WriteEdit())
        return false;
    presentation_ = Presentation::List;
    fieldNames_.clear();
    visible_.clear();
    selectedField_ = -1;
    conditions_.clear();
    sort_ = {};
    baseStatement_ = statement;
    return Execute(statement);
}

bool RecordBrowser::OpenInstead(const QString& statement)
{
    const QString base = baseStatement_;
    const QString current = statement_;
    const QStringList conditions = conditions_;
    const ColumnSort sort = sort_;
    if (Open(statement))
        return true;
    if (writeFailed_ || base.isEmpty())
        return false;
    baseStatement_ = base;
    if (Execute(current)) {
        conditions_ = conditions;
        sort_ = sort;
    }
    return false;
}

bool RecordBrowser::Rewrite(const QString& statement)
{
    if (!WriteEdit())
        return false;
    const QString previous = statement_;
    if (Execute(statement))
        return true;
    Execute(previous);
    return false;
}

bool RecordBrowser::RunAgain()
{
    if (!WriteEdit())
        return false;
    const qint64 record = SelectedRecord();
    const qint64 top = topRow_;
    if (!Execute(statement_))
        return false;
    if (top > 0 || record > 0) {
        const qint64 last = Count() - 1;
        topRow_ = std::min(top, HighestTopRow());
        ShowRecord(std::min(record, last));
    }
    FillPage();
    LoadEditor();
    return true;
}

void RecordBrowser::Close()
{
    recordset_.Close();
    Clear();
}

bool RecordBrowser::Execute(const QString& statement)
{
    statement_ = statement;
    if (!recordset_.Open(statement, database_, CursorType::Static, LockType::Optimistic)) {
        ReportFailure();
        recordset_.Close();
        Clear();
        return false;
    }
    TakeUpFields();
    Recount();
    topRow_ = 0;
    selectedRow_ = IsEmpty() ? -1 : 0;
    detailRecord_ = selectedRow_;
    listState_ = {0, selectedRow_};
    topFieldRow_ = 0;
    selectedField_ = SelectedFieldOrFirstVisible();
    RebuildColumns();
    FillPage();
    LoadEditor();
    return true;
}

void RecordBrowser::Clear()
{
    count_ = 0;
    fieldNames_.clear();
    visible_.clear();
    topRow_ = 0;
    selectedRow_ = -1;
    selectedField_ = -1;
    detailRecord_ = -1;
    topFieldRow_ = 0;
    RebuildColumns();
    page_.rows.clear();
    ++pageRevision_;
    edit_.Unload();
}

// Hidden columns stay hidden, and the selected one selected, as long as the result has the same fields: who
// sorts by a column far to the right wants to go on looking at it.
void RecordBrowser::TakeUpFields()
{
    QStringList names;
    for (const ResultField& field : recordset_.Fields())
        names += field.name;
    if (names == fieldNames_)
        return;
    fieldNames_ = names;
    selectedField_ = -1;
    visible_.assign(size_t(names.size()), true);
}

void RecordBrowser::RebuildColumns()
{
    page_.columns.clear();
    page_.rows.clear(); // they were cut for the columns before
    if (presentation_ == Presentation::Detail && IsOpen()) {
        page_.columns = {{StringText(Str::DetailFieldColumn), false, -1},
                         {StringText(Str::DetailValueColumn), false, -1}};
    } else {
        for (const int field : VisibleFields())
            page_.columns.push_back({FieldName(field), IsRightAligned(TypeOfField(field)), field});
    }
    ++columnsRevision_;
}

bool RecordBrowser::ChangeSettings(const TableViewSettings& settings)
{
    if (!WriteEdit())
        return false;
    settings_ = settings;
    FillPage();
    return true;
}

bool RecordBrowser::CountOn(int budgetMs)
{
    if (!count_ && !working_ && recordset_.CountStep(budgetMs))
        Count();
    return count_.has_value();
}

qint64 RecordBrowser::Count()
{
    if (!count_) {
        count_ = std::max<qint64>(recordset_.RecordCount(), 0);
        generation_ = recordset_.Generation();
    }
    return *count_;
}

void RecordBrowser::Recount()
{
    count_.reset();
    generation_ = recordset_.Generation();
    CountOn(kFirstCountMs);
}

void RecordBrowser::ReportFailure()
{
    ReportProviderError(prompt_, &recordset_, recordset_.LastResult());
}

// --- the editor ---------------------------------------------------------------------------------------------

QString RecordBrowser::FieldLabel() const
{
    if (!shownLabel_.isEmpty())
        return shownLabel_;
    return selectedField_ < 0 ? QString() : StringText(Str::FieldLabel, {FieldName(selectedField_)});
}

Value RecordBrowser::SelectedValue() const
{
    return SelectedRecord() < 0 ? Value::Null() : recordset_.FieldValue(selectedField_);
}

void RecordBrowser::ShowInEditor(const QString& label, const QString& text)
{
    shownLabel_ = label;
    edit_.ShowText(text);
}

bool RecordBrowser::IsWritable(int field) const
{
    return field >= 0 && CanUpdate() && !recordset_.Fields()[size_t(field)].column.isEmpty() &&
           !IsBinary(TypeOfField(field));
}

bool RecordBrowser::CanEdit() const
{
    return edit_.Kind() != EditorKind::None && IsWritable(selectedField_);
}

void RecordBrowser::EditText(const QString& text)
{
    if (CanEdit() && edit_.Kind() != EditorKind::Check)
        edit_.SetText(text);
}

void RecordBrowser::EditChecked(bool checked)
{
    if (CanEdit() && edit_.Kind() == EditorKind::Check)
        edit_.SetChecked(checked);
}

void RecordBrowser::ClearCell()
{
    if (CanEdit())
        edit_.Clear();
}

void RecordBrowser::InsertCurrentDateTime()
{
    if (const std::optional<double> now = OleDate(QDateTime::currentDateTime()))
        EditText(UserLocale::Current().DateTimeText(*now));
}

void RecordBrowser::RepeatAbove()
{
    if (!CanEdit() || SelectedRecord() < 1)
        return;
    const FieldType type = TypeOfField(selectedField_);
    const ReadRange above{.first = SelectedRecord() - 1, .count = 1, .fields = {selectedField_}};
    const bool read = recordset_.Read(above, [&](std::span<const Cell> cells) {
        if (type == FieldType::YesNo)
            edit_.SetChecked(cells.front().integer != 0);
        else
            edit_.SetText(GridText(cells.front(), type, settings_.words, TableViewSettings::kNoColumnLimit));
        return false;
    });
    if (!read)
        ReportFailure();
}

void RecordBrowser::RevertEdit()
{
    edit_.Revert();
    writeFailed_ = false;
}

QString RecordBrowser::SelectedText() const
{
    if (edit_.IsUnset())
        return {};
    return edit_.Kind() == EditorKind::Check ? settings_.words.Of(edit_.IsChecked()) : edit_.Text();
}

void RecordBrowser::ShowWriteError()
{
    if (!writeFailed_)
        return;
    writeFailed_ = false;
    prompt_.ShowError(writeError_);
}

} // namespace mirel
