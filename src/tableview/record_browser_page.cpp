#include "result/cell_text.h"
#include "tableview/record_browser.h"

#include <algorithm>
#include <utility>

// The page and the selection of the record browser.

namespace mirel {

using namespace Qt::StringLiterals;

namespace {

QString PageText(const Cell& cell, FieldType type, const TableViewSettings& settings)
{
    return cell.kind == Cell::Kind::Binary ? BlobText(qint64(cell.bytes.size()))
                                           : GridText(cell, type, settings.words, settings.maxColumnChars);
}

} // namespace

// --- the page -----------------------------------------------------------------------------------------------

qint64 RecordBrowser::HighestTopRow() const
{
    if (const std::optional<qint64> count = KnownCount())
        return list_.HighestTop(*count);
    // Until the count is known the end is where the page has shown that it goes on.
    return list_.Top() + std::max(page_.RowCount() - list_.WholeRows(), 0);
}

qint64 RecordBrowser::ScrollPosition() const
{
    return presentation_ == Presentation::List ? list_.Top() : detail_.Top();
}

qint64 RecordBrowser::HighestScrollPosition() const
{
    return presentation_ == Presentation::List ? HighestTopRow() : HighestFieldRow();
}

// The page grows and shrinks around the selected record: a keyboard that slides up must not move it.
void RecordBrowser::SetRowsPerPage(int wholeRows)
{
    wholeRows = std::max(wholeRows, 1);
    if (wholeRows == list_.WholeRows())
        return;
    list_.SetWholeRows(wholeRows);
    detail_.SetWholeRows(wholeRows);
    if (!IsOpen())
        return;
    KeepSelectionInPage();
    FillPage();
}

void RecordBrowser::KeepSelectionInPage()
{
    if (presentation_ == Presentation::Detail) {
        detail_.Show(selectedField_);
        detail_.ScrollTo(detail_.Top(), HighestFieldRow());
    } else if (SelectedRecord() >= 0) {
        list_.Show(SelectedRecord());
        list_.ScrollTo(list_.Top(), HighestTopRow());
    }
}

bool RecordBrowser::ScrollTo(qint64 position)
{
    if (!edit_.IsPending())
        TakeUpChanges();
    if (presentation_ == Presentation::List && position > HighestTopRow())
        Count();
    position = std::clamp<qint64>(position, 0, HighestScrollPosition());
    if (position == ScrollPosition())
        return true;
    if (!WriteEdit())
        return false;
    if (presentation_ == Presentation::List) {
        const int row = SelectedRow();
        list_.ScrollTo(position, HighestTopRow());
        FillPage();
        SelectRecordInRow(row);
    } else {
        const int row = detail_.RowOf(selectedField_);
        detail_.ScrollTo(position, HighestFieldRow());
        selectedField_ = std::min(detail_.TopField() + row, FieldCount() - 1);
        FillPage();
    }
    LoadEditor();
    return true;
}

RecordBrowser::Work::Work(RecordBrowser& browser)
    : browser_(browser)
{
    Q_ASSERT(!browser_.working_);
    browser_.working_ = true;
}

RecordBrowser::Work::~Work()
{
    browser_.working_ = false;
    if (std::exchange(browser_.fillLater_, false))
        browser_.FillPage();
}

void RecordBrowser::TakeUpChanges()
{
    if (!IsOpen() || working_)
        return;
    const qint64 row = SelectedRecord() - list_.Top();
    const bool isTyping = edit_.IsPending();
    const auto values = isTyping ? ProviderRecordset::Values::Keep : ProviderRecordset::Values::ReadAgain;
    const bool isOther = result_.TakeUpChanges(values);
    const bool leavesGone = result_.IsGone() && !isTyping;
    if (!isOther && !leavesGone)
        return;
    if (leavesGone || (result_.Position() < 0 && Count() > 0))
        (void)result_.MoveTo(std::max<qint64>(result_.Position(), 0));
    if (presentation_ == Presentation::List && result_.Position() >= 0)
        list_.ScrollTo(result_.Position() - std::max<qint64>(row, 0), HighestTopRow());
    FindBlockAgain();
    FillPage();
    if (isTyping)
        return;
    const std::optional<CellBlock> block = block_;
    LoadEditor();
    block_ = block;
}

void RecordBrowser::FillPage()
{
    if (working_) {
        fillLater_ = true;
        return;
    }
    presentation_ == Presentation::List ? FillList() : FillDetail();
    ++pageRevision_;
}

void RecordBrowser::FillList()
{
    page_.rows.clear();
    if (!IsOpen() || IsEmpty())
        return;
    if (!ReadRows(list_.Top(), list_.WholeRows() + 1)) {
        ReportFailure();
        page_.rows.clear();
    }
    if (page_.rows.empty() && !KnownCount())
        Count();
}

bool RecordBrowser::ReadRows(qint64 first, int count)
{
    const std::vector<int> fields = VisibleFields();
    return Recordset().Read({.first = first, .count = count, .fields = fields}, [&](std::span<const Cell> cells) {
        std::vector<PageCell> row(cells.size());
        for (size_t i = 0; i < cells.size(); ++i) {
            row[i] = {PageText(cells[i], TypeOfField(fields[i]), settings_), cells[i].kind == Cell::Kind::Null};
        }
        page_.rows.push_back(std::move(row));
        return true;
    });
}

void RecordBrowser::FillDetail()
{
    page_.rows.clear();
    if (!IsOpen() || SelectedRecord() < 0 || result_.IsGone())
        return;
    const int last = std::min(detail_.TopField() + detail_.WholeRows() + 1, FieldCount());
    std::vector<int> fields;
    for (int field = detail_.TopField(); field < last; ++field)
        fields.push_back(field);
    const ReadRange range{.first = SelectedRecord(), .count = 1, .fields = fields};
    const bool read = Recordset().Read(range, [&](std::span<const Cell> cells) {
        for (size_t i = 0; i < cells.size(); ++i) {
            const FieldType type = TypeOfField(fields[i]);
            page_.rows.push_back({{FieldName(fields[i]), false},
                                  {PageText(cells[i], type, settings_), cells[i].kind == Cell::Kind::Null}});
        }
        return true;
    });
    if (!read)
        ReportFailure();
}

// The selected cell as the store has it now.
void RecordBrowser::RefreshCell()
{
    const int row = SelectedRow();
    const int column = SelectedColumn();
    if (row < 0 || row >= page_.RowCount() || column < 0)
        return;
    const Value value = Recordset().FieldValue(selectedField_);
    const QString text = DisplayText(value, TypeOfField(selectedField_), settings_.words);
    page_.rows[size_t(row)][size_t(column)] = {CutForGrid(text, settings_.maxColumnChars), value.IsNull()};
    ++pageRevision_;
}

std::vector<int> RecordBrowser::VisibleFields() const
{
    std::vector<int> fields;
    for (int field = 0; field < int(visible_.size()); ++field) {
        if (visible_[size_t(field)])
            fields.push_back(field);
    }
    return fields;
}

// --- the selection ------------------------------------------------------------------------------------------

int RecordBrowser::SelectedRow() const
{
    const bool list = presentation_ == Presentation::List;
    const int row = list ? list_.RowOf(SelectedRecord()) : detail_.RowOf(selectedField_);
    return row >= 0 && row < page_.RowCount() ? row : -1;
}

int RecordBrowser::SelectedColumn() const
{
    if (presentation_ == Presentation::Detail)
        return page_.rows.empty() ? -1 : 1;
    return page_.ColumnOfField(selectedField_);
}

qint64 RecordBrowser::SelectedRecord() const
{
    return result_.Position();
}

void RecordBrowser::LoadEditor()
{
    CollapseBlock();
    writeFailed_ = false;
    shownLabel_.clear();
    fingerprint_.clear();
    if (!IsOpen() || SelectedRecord() < 0 || selectedField_ < 0 || result_.IsGone()) {
        edit_.Unload();
        return;
    }
    edit_.Load(Recordset().FieldValue(selectedField_), TypeOfField(selectedField_),
               Recordset().FieldSize(selectedField_), settings_.leadingNumber);
}

// Makes the record current, and scrolls no further than it takes to show it; the page is then to be filled.
void RecordBrowser::SelectRecord(qint64 record)
{
    if (record < 0 || !result_.MoveTo(record))
        return;
    if (presentation_ == Presentation::List)
        list_.Show(result_.Position());
}

void RecordBrowser::SelectRecordInRow(int row)
{
    if (!page_.rows.empty())
        SelectRecord(list_.Top() + std::clamp(row, 0, page_.RowCount() - 1));
}

bool RecordBrowser::SelectCell(int row, int column)
{
    if (row < 0 || row >= page_.RowCount() || column < 0 || column >= page_.ColumnCount())
        return true;
    const bool list = presentation_ == Presentation::List;
    const int field = list ? page_.columns[size_t(column)].field : detail_.TopField() + row;
    CollapseBlock();
    if (row == SelectedRow() && field == selectedField_)
        return true;
    // The row is the one that the page shows: it is found before anything else moves.
    std::vector<RecordId> pointed;
    if (list && row != SelectedRow())
        pointed = result_.IdsFrom(list_.Top() + row, 1);
    if (!WriteEdit())
        return false;
    selectedField_ = field;
    if (list && row != SelectedRow()) {
        SelectRecordInRow(row);
        const bool isOther = !pointed.empty() && Recordset().Id() != pointed.front();
        if (isOther && result_.MoveToRecord(pointed.front()))
            ShowRecordAgain(result_.Position());
    }
    LoadEditor();
    return true;
}

bool RecordBrowser::MoveToRecord(qint64 record)
{
    if (!IsOpen() || IsEmpty() || !WriteEdit())
        return !HasPendingEdit();
    const qint64 lastOnPage = list_.Top() + page_.RowCount() - 1;
    if (presentation_ == Presentation::Detail || record > lastOnPage)
        record = std::min(record, Count() - 1);
    record = std::max<qint64>(record, 0);
    CollapseBlock();
    if (record == SelectedRecord())
        return true;
    const qint64 top = list_.Top();
    SelectRecord(record);
    if (presentation_ == Presentation::Detail || list_.Top() != top)
        FillPage();
    LoadEditor();
    return true;
}

// Writes what is typed and takes up what others did, so that the step goes from where the record is now. False:
// the step must not be taken.
bool RecordBrowser::PrepareStep()
{
    if (!WriteEdit())
        return false;
    TakeUpChanges();
    return IsOpen();
}

bool RecordBrowser::GoToFirst()
{
    return MoveToRecord(0);
}

bool RecordBrowser::GoToLast()
{
    return !IsOpen() || (PrepareStep() && MoveToRecord(Count() - 1));
}

bool RecordBrowser::GoToNext()
{
    return !IsOpen() || (PrepareStep() && MoveToRecord(SelectedRecord() + 1));
}

bool RecordBrowser::GoToPrevious()
{
    return !IsOpen() || (PrepareStep() && MoveToRecord(SelectedRecord() - 1));
}

bool RecordBrowser::GoToRecord(qint64 number)
{
    const qint64 record = number - 1;
    if (!IsOpen() || record < 0 || record >= Count())
        return true;
    if (!WriteEdit())
        return false;
    list_.ScrollTo(record, HighestTopRow()); // it becomes the top row, not just a row of the page
    SelectRecord(record);
    FillPage();
    LoadEditor();
    return true;
}

bool RecordBrowser::GoToCell(qint64 record, int field)
{
    const bool list = presentation_ == Presentation::List;
    if (record < 0 || field < 0 || field >= FieldCount() || (list && !IsVisible(field)))
        return true;
    if (!MoveToRecord(record))
        return false;
    if (list)
        return SelectCell(SelectedRow(), page_.ColumnOfField(field));
    return MoveRows(field - selectedField_);
}

bool RecordBrowser::MoveRows(qint64 rows)
{
    if (presentation_ == Presentation::List)
        return !IsOpen() || (PrepareStep() && MoveToRecord(SelectedRecord() + rows));
    if (page_.rows.empty() || !WriteEdit())
        return !HasPendingEdit();
    selectedField_ = int(std::clamp<qint64>(selectedField_ + rows, 0, FieldCount() - 1));
    const qint64 top = detail_.Top();
    KeepSelectionInPage();
    if (detail_.Top() != top)
        FillPage();
    LoadEditor();
    return true;
}

// A page on, and at the end of all pages to the last row.
bool RecordBrowser::MovePages(int direction)
{
    const qint64 before = ScrollPosition();
    if (!ScrollBy(qint64(direction) * list_.WholeRows()))
        return false;
    return ScrollPosition() != before || MoveRows(qint64(direction) * list_.WholeRows());
}

bool RecordBrowser::MoveColumns(int columns)
{
    if (presentation_ == Presentation::Detail)
        return !IsOpen() || (PrepareStep() && MoveToRecord(SelectedRecord() + columns));
    const int column = SelectedColumn();
    return SelectCell(SelectedRow(), std::clamp(column + columns, 0, std::max(page_.ColumnCount() - 1, 0)));
}

bool RecordBrowser::MoveToFirstColumn()
{
    return presentation_ == Presentation::Detail ? MoveRows(-FieldCount()) : SelectCell(SelectedRow(), 0);
}

bool RecordBrowser::MoveToLastColumn()
{
    return presentation_ == Presentation::Detail ? MoveRows(FieldCount())
                                                 : SelectCell(SelectedRow(), page_.ColumnCount() - 1);
}

bool RecordBrowser::MoveToNextCell()
{
    const bool list = presentation_ == Presentation::List;
    const bool lastCell = list ? SelectedColumn() == page_.ColumnCount() - 1 : selectedField_ == FieldCount() - 1;
    if (!lastCell)
        return list ? MoveColumns(1) : MoveRows(1);
    const qint64 record = SelectedRecord();
    if (!GoToNext())
        return false;
    return SelectedRecord() == record || MoveToFirstColumn();
}

bool RecordBrowser::MoveToPreviousCell()
{
    const bool list = presentation_ == Presentation::List;
    const bool firstCell = list ? SelectedColumn() == 0 : selectedField_ == 0;
    if (!firstCell)
        return list ? MoveColumns(-1) : MoveRows(-1);
    const qint64 record = SelectedRecord();
    if (!GoToPrevious())
        return false;
    return SelectedRecord() == record || MoveToLastColumn();
}

bool RecordBrowser::TogglePresentation()
{
    if (!IsOpen() || !PrepareStep())
        return false;
    if (presentation_ == Presentation::List) {
        listState_ = {list_.Top(), SelectedRecord(), Recordset().Id()};
        presentation_ = Presentation::Detail;
        detail_.ScrollTo(0, 0);
    } else {
        presentation_ = Presentation::List;
        selectedField_ = SelectedFieldOrFirstVisible();
        const bool inRange = listState_.record >= 0 && listState_.record < Count();
        if (!listState_.id.IsNull() && result_.MoveToRecord(listState_.id))
            list_.ScrollTo(listState_.topRow + result_.Position() - listState_.record, HighestTopRow());
        else if (result_.MoveTo(inRange ? listState_.record : 0))
            list_.ScrollTo(inRange ? listState_.topRow : 0, HighestTopRow());
        list_.Show(std::max<qint64>(result_.Position(), 0));
    }
    RebuildColumns();
    KeepSelectionInPage();
    FillPage();
    LoadEditor();
    return true;
}

int RecordBrowser::SelectedFieldOrFirstVisible() const
{
    if (selectedField_ >= 0 && visible_[size_t(selectedField_)])
        return selectedField_;
    const std::vector<int> fields = VisibleFields();
    return fields.empty() ? -1 : fields.front();
}

// --- counter and columns ------------------------------------------------------------------------------------

QString RecordBrowser::CounterText() const
{
    return CounterTextAt(SelectedRecord());
}

QString RecordBrowser::CounterTextAt(qint64 position) const
{
    const QString count = KnownCount() ? QString::number(*KnownCount()) : u"…"_s;
    return QString::number(position + 1) + u'/' + count;
}

bool RecordBrowser::CanHideColumn() const
{
    return presentation_ == Presentation::List && page_.ColumnCount() > 1 && selectedField_ >= 0;
}

bool RecordBrowser::CanShowAllColumns() const
{
    return presentation_ == Presentation::List && page_.ColumnCount() < FieldCount();
}

bool RecordBrowser::HideColumn()
{
    if (!CanHideColumn())
        return true;
    if (!WriteEdit())
        return false;
    const int column = SelectedColumn();
    visible_[size_t(selectedField_)] = false;
    RebuildColumns();
    selectedField_ = page_.columns[size_t(std::min(column, page_.ColumnCount() - 1))].field;
    FillPage();
    LoadEditor();
    return true;
}

bool RecordBrowser::ShowAllColumns()
{
    if (!CanShowAllColumns())
        return true;
    if (!WriteEdit())
        return false;
    visible_.assign(visible_.size(), true);
    RebuildColumns();
    FillPage();
    CollapseBlock();
    return true;
}

} // namespace mirel
