#include "tableview/record_browser.h"

#include "data/catalog.h"
#include "data/provider_error.h"
#include "platform/ole_date.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"
#include "result/cell_text.h"

#include <QDateTime>

#include <algorithm>
#include <utility>

// The result and the editor; the page and the selection are in record_browser_page.cpp, what is written in
// record_browser_changes.cpp.

namespace mirel {

using namespace Qt::StringLiterals;

RecordBrowser::RecordBrowser(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt,
                             TableViewSettings settings)
    : result_(connection, std::move(database), prompt)
    , prompt_(prompt)
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
    sort_ = {};
    return Execute([&] { return result_.Open(statement); });
}

bool RecordBrowser::OpenInstead(const QString& statement)
{
    if (!WriteEdit())
        return false;
    const QStringList names = std::exchange(fieldNames_, {});
    const ColumnSort sort = std::exchange(sort_, {});
    if (Execute([&] { return result_.OpenInstead(statement); })) {
        presentation_ = Presentation::List;
        RebuildColumns();
        FillPage();
        LoadEditor();
        return true;
    }
    if (fieldNames_ == names)
        sort_ = sort;
    return false;
}

bool RecordBrowser::Rewrite(const QString& statement)
{
    return WriteEdit() && Execute([&] { return result_.Rewrite(statement); });
}

bool RecordBrowser::OpenRenamed(const std::function<QString(const QString&)>& renamed)
{
    if (!WriteEdit())
        return false;
    fieldNames_.clear(); // a hidden column shows again: it may bear another name
    visible_.clear();
    return Execute([&] { return result_.OpenRenamed(renamed); });
}

bool RecordBrowser::RunAgain()
{
    if (!WriteEdit())
        return false;
    const qint64 top = list_.Top();
    const qint64 row = SelectedRecord() - top;
    if (!Execute([&] { return result_.RunAgain(); }))
        return false;
    ShowRecordAgain(result_.Position());
    if (presentation_ == Presentation::List && result_.Position() >= 0) {
        list_.ScrollTo(result_.Position() - row, HighestTopRow());
        list_.Show(result_.Position());
    }
    FillPage();
    LoadEditor();
    return true;
}

void RecordBrowser::Close()
{
    result_.Close();
    Clear();
}

// Whatever came of it: a refused statement may have left the one before, run again.
bool RecordBrowser::Execute(const std::function<bool()>& run)
{
    const bool done = run();
    if (IsOpen())
        ShowFromStart();
    else
        Clear();
    return done;
}

void RecordBrowser::ShowFromStart()
{
    TakeUpFields();
    list_.ScrollTo(0, 0);
    detail_.ScrollTo(0, 0);
    if (result_.Position() > 0)
        list_.Show(result_.Position());
    listState_ = {list_.Top(), result_.Position(), {}};
    selectedField_ = SelectedFieldOrFirstVisible();
    RebuildColumns();
    FillPage();
    LoadEditor();
}

void RecordBrowser::Clear()
{
    fieldNames_.clear();
    visible_.clear();
    list_.ScrollTo(0, 0);
    detail_.ScrollTo(0, 0);
    selectedField_ = -1;
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
    for (const ResultField& field : Fields())
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

void RecordBrowser::ChangeSettings(const TableViewSettings& settings)
{
    settings_ = settings;
    FillPage();
}

bool RecordBrowser::IsSettled() const
{
    return !IsOpen() || (KnownCount() && !result_.IsBehind());
}

bool RecordBrowser::SettleOn(int budgetMs)
{
    if (working_)
        return IsSettled();
    if (!result_.IsBehind())
        return result_.CountOn(budgetMs);
    if (!result_.CatchUp(budgetMs))
        return false;
    TakeUpChanges();
    return true;
}

// --- the editor ---------------------------------------------------------------------------------------------

QString RecordBrowser::FieldLabel() const
{
    if (!shownLabel_.isEmpty())
        return shownLabel_;
    return selectedField_ < 0 ? QString() : StringText(Str::FieldLabel, {FieldName(selectedField_)});
}

void RecordBrowser::ShowInEditor(const QString& label, const QString& text)
{
    shownLabel_ = label;
    shownResult_ = text;
}

QString RecordBrowser::WhyNotEditable() const
{
    if (edit_.Kind() == EditorKind::None || CanEdit())
        return {};
    if (!CanUpdate())
        return StringText(Str::WhyReadOnly);
    const Str why = IsBinary(TypeOfField(selectedField_)) ? Str::WhyBytes : Str::WhyComputed;
    return StringText(why, {FieldName(selectedField_)});
}

bool RecordBrowser::CanEdit() const
{
    return edit_.Kind() != EditorKind::None && IsWritable(selectedField_);
}

void RecordBrowser::EditText(const QString& text)
{
    if (!CanEdit() || edit_.Kind() == EditorKind::Check)
        return;
    EndResult();
    edit_.SetText(text);
}

void RecordBrowser::EditChecked(bool checked)
{
    if (!CanEdit() || edit_.Kind() != EditorKind::Check)
        return;
    EndResult();
    edit_.SetChecked(checked);
}

void RecordBrowser::ClearCell()
{
    if (!CanEdit())
        return;
    EndResult();
    edit_.Clear();
}

QString RecordBrowser::CurrentDateTimeText()
{
    const std::optional<double> now = OleDate(QDateTime::currentDateTime());
    return now ? UserLocale::Current().DateTimeText(*now) : QString();
}

void RecordBrowser::InsertCurrentDateTime()
{
    EditText(CurrentDateTimeText());
}

void RecordBrowser::RepeatAbove()
{
    if (!CanEdit() || SelectedRecord() < 1)
        return;
    EndResult();
    const FieldType type = TypeOfField(selectedField_);
    const ReadRange above{.first = SelectedRecord() - 1, .count = 1, .fields = {selectedField_}};
    const bool read = Recordset().Read(above, [&](std::span<const Cell> cells) {
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
    EndResult();
    edit_.Revert();
    fingerprint_.clear();
    writeFailed_ = false;
    TakeUpChanges(); // what others did to this very record was kept from the editor
}

QString RecordBrowser::SelectedText() const
{
    return edit_.IsUnset() ? QString() : EditedText();
}

QString RecordBrowser::EditedText() const
{
    return edit_.Kind() == EditorKind::Check ? settings_.words.Of(edit_.IsChecked()) : edit_.Text();
}

void RecordBrowser::ShowWriteError()
{
    if (!writeFailed_)
        return;
    writeFailed_ = false;
    const QString why = WhyNotStored();
    prompt_.ShowErrorWithReason(
        writeError_, why.isEmpty() ? why : StringText(Str::WhyOfField, {FieldName(selectedField_), why}));
}

} // namespace mirel
