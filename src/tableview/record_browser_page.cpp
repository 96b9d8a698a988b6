#include "tableview/cell_text.h"
#include "tableview/record_browser.h"

#include <algorithm>
#include <utility>

// The page and the selection of the record browser.

namespace mirel {

using namespace Qt::StringLiterals;

// --- the page -----------------------------------------------------------------------------------------------

qint64 RecordBrowser::HighestTopRow() const
{
    if (count_)
        return std::max<qint64>(*count_ - rowsPerPage_, 0);
    // Until the count is known the end is where the page has shown that it goes on.
    return topRow_ + std::max(page_.RowCount() - rowsPerPage_, 0);
}

int RecordBrowser::HighestFieldRow() const
{
    return std::max(FieldCount() - rowsPerPage_, 0);
}

qint64 RecordBrowser::ScrollPosition() const
{
    return presentation_ == Presentation::List ? topRow_ : topFieldRow_;
}

qint64 RecordBrowser::HighestScrollPosition() const
{
    return presentation_ == Presentation::List ? HighestTopRow() : HighestFieldRow();
}

// The page grows and shrinks around the selected record: a keyboard that slides up must not move it.
void RecordBrowser::SetRowsPerPage(int wholeRows)
{
    wholeRows = std::max(wholeRows, 1);
    if (wholeRows == rowsPerPage_)
        return;
    rowsPerPage_ = wholeRows;
    if (!IsOpen())
        return;
    KeepSelectionInPage();
    FillPage();
}

void RecordBrowser::KeepSelectionInPage()
{
    if (presentation_ == Presentation::Detail) {
        topFieldRow_ =
            std::clamp(topFieldRow_, std::max(selectedField_ - rowsPerPage_ + 1, 0), std::max(selectedField_, 0));
        topFieldRow_ = std::min(topFieldRow_, HighestFieldRow());
        return;
    }
    const qint64 record = SelectedRecord();
    if (record < 0)
        return;
    topRow_ = std::clamp(topRow_, std::max<qint64>(record - rowsPerPage_ + 1, 0), record);
    topRow_ = std::min(topRow_, HighestTopRow());
    selectedRow_ = int(record - topRow_);
}

bool RecordBrowser::ScrollTo(qint64 position)
{
    if (presentation_ == Presentation::List && position > HighestTopRow())
        Count();
    position = std::clamp<qint64>(position, 0, HighestScrollPosition());
    if (position == ScrollPosition())
        return true;
    if (!WriteEdit())
        return false;
    if (presentation_ == Presentation::List) {
        topRow_ = position;
    } else {
        const int row = selectedField_ - topFieldRow_;
        topFieldRow_ = int(position);
        selectedField_ = std::min(topFieldRow_ + row, FieldCount() - 1);
    }
    FillPage();
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
    if (!IsOpen() || edit_.IsPending() || working_)
        return;
    const quint64 before = generation_;
    FillPage();
    if (generation_ == before)
        return;
    // The recordset has found its record again, wherever it stands now.
    const qint64 record = recordset_.Position();
    if (record >= 0 && presentation_ == Presentation::List)
        topRow_ = std::clamp<qint64>(record - std::max(selectedRow_, 0), 0, HighestTopRow());
    ShowRecord(record >= 0 ? record : std::min(SelectedRecord(), Count() - 1));
    FillPage();
    LoadEditor();
}

void RecordBrowser::FillPage()
{
    if (working_) {
        fillLater_ = true;
        return;
    }
    const auto fill = [this] { presentation_ == Presentation::List ? FillList() : FillDetail(); };
    fill();
    if (IsOpen() && recordset_.Generation() != generation_) { // another program was here
        Recount();
        topRow_ = std::min(topRow_, HighestTopRow());
        fill();
    }
    ++pageRevision_;
}

void RecordBrowser::FillList()
{
    page_.rows.clear();
    if (!IsOpen() || IsEmpty()) {
        selectedRow_ = -1;
        return;
    }
    if (!ReadRows(topRow_, rowsPerPage_ + 1)) {
        ReportFailure();
        page_.rows.clear();
    }
    if (page_.rows.empty() && !count_)
        Count();
    selectedRow_ = page_.rows.empty() ? -1 : std::clamp(selectedRow_, 0, page_.RowCount() - 1);
}

bool RecordBrowser::ReadRows(qint64 first, int count)
{
    const std::vector<int> fields = VisibleFields();
    return recordset_.Read({.first = first, .count = count, .fields = fields}, [&](std::span<const Cell> cells) {
        std::vector<PageCell> row(cells.size());
        for (size_t i = 0; i < cells.size(); ++i) {
            row[i] = {GridText(cells[i], TypeOfField(fields[i]), settings_.words, settings_.maxColumnChars),
                      cells[i].kind == Cell::Kind::Null};
        }
        page_.rows.push_back(std::move(row));
        return true;
    });
}

void RecordBrowser::FillDetail()
{
    page_.rows.clear();
    if (!IsOpen() || detailRecord_ < 0)
        return;
    const int last = std::min(topFieldRow_ + rowsPerPage_ + 1, FieldCount());
    std::vector<int> fields;
    for (int field = topFieldRow_; field < last; ++field)
        fields.push_back(field);
    const ReadRange range{.first = detailRecord_, .count = 1, .fields = fields};
    const bool read = recordset_.Read(range, [&](std::span<const Cell> cells) {
        for (size_t i = 0; i < cells.size(); ++i) {
            const FieldType type = TypeOfField(fields[i]);
            page_.rows.push_back({{FieldName(fields[i]), false},
                                  {GridText(cells[i], type, settings_.words, settings_.maxColumnChars),
                                   cells[i].kind == Cell::Kind::Null}});
        }
        return true;
    });
    if (!read)
        ReportFailure();
    if (page_.rows.empty())
        detailRecord_ = -1;
}

// The selected cell as the store has it now.
void RecordBrowser::RefreshCell()
{
    const int row = SelectedRow();
    const int column = SelectedColumn();
    if (row < 0 || row >= page_.RowCount() || column < 0)
        return;
    const Value value = recordset_.FieldValue(selectedField_);
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
    if (presentation_ == Presentation::List)
        return selectedRow_;
    const int row = selectedField_ - topFieldRow_;
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
    if (presentation_ == Presentation::Detail)
        return detailRecord_;
    return selectedRow_ < 0 ? -1 : topRow_ + selectedRow_;
}

void RecordBrowser::LoadEditor()
{
    const qint64 record = SelectedRecord();
    CollapseBlock();
    writeFailed_ = false;
    shownLabel_.clear();
    const bool stands = IsOpen() && record >= 0 && selectedField_ >= 0 && recordset_.MoveTo(record) &&
                        recordset_.Position() == record;
    if (!stands) {
        edit_.Unload();
        return;
    }
    edit_.Load(recordset_.FieldValue(selectedField_), TypeOfField(selectedField_),
               recordset_.FieldSize(selectedField_));
}

// Selects the record and scrolls no further than it takes to show it; the page is then to be filled.
void RecordBrowser::ShowRecord(qint64 record)
{
    detailRecord_ = record;
    if (presentation_ == Presentation::Detail)
        return;
    if (record < 0) {
        selectedRow_ = -1;
        return;
    }
    topRow_ = std::clamp(topRow_, std::max<qint64>(record - rowsPerPage_ + 1, 0), record);
    selectedRow_ = int(record - topRow_);
}

bool RecordBrowser::SelectCell(int row, int column)
{
    if (row < 0 || row >= page_.RowCount() || column < 0 || column >= page_.ColumnCount())
        return true;
    const bool list = presentation_ == Presentation::List;
    const int field = list ? page_.columns[size_t(column)].field : topFieldRow_ + row;
    CollapseBlock();
    if (row == SelectedRow() && field == selectedField_)
        return true;
    if (!WriteEdit())
        return false;
    selectedField_ = field;
    if (list)
        selectedRow_ = row;
    LoadEditor();
    return true;
}

bool RecordBrowser::MoveToRecord(qint64 record)
{
    if (!IsOpen() || IsEmpty() || !WriteEdit())
        return !HasPendingEdit();
    const qint64 lastOnPage = topRow_ + page_.RowCount() - 1;
    if (presentation_ == Presentation::Detail || record > lastOnPage)
        record = std::min(record, Count() - 1);
    record = std::max<qint64>(record, 0);
    CollapseBlock();
    if (record == SelectedRecord())
        return true;
    const qint64 top = topRow_;
    ShowRecord(record);
    if (presentation_ == Presentation::Detail || topRow_ != top)
        FillPage();
    LoadEditor();
    return true;
}

bool RecordBrowser::GoToFirst()
{
    return MoveToRecord(0);
}

bool RecordBrowser::GoToLast()
{
    return !IsOpen() || MoveToRecord(Count() - 1);
}

bool RecordBrowser::GoToNext()
{
    return MoveToRecord(SelectedRecord() + 1);
}

bool RecordBrowser::GoToPrevious()
{
    return MoveToRecord(SelectedRecord() - 1);
}

bool RecordBrowser::GoToRecord(qint64 number)
{
    const qint64 record = number - 1;
    if (!IsOpen() || record < 0 || record >= Count())
        return true;
    if (!WriteEdit())
        return false;
    topRow_ = std::min(record, HighestTopRow()); // it becomes the top row, not just a row of the page
    ShowRecord(record);
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
        return SelectCell(selectedRow_, page_.ColumnOfField(field));
    return MoveRows(field - selectedField_);
}

bool RecordBrowser::MoveRows(qint64 rows)
{
    if (presentation_ == Presentation::List)
        return MoveToRecord(SelectedRecord() + rows);
    if (page_.rows.empty() || !WriteEdit())
        return !HasPendingEdit();
    selectedField_ = int(std::clamp<qint64>(selectedField_ + rows, 0, FieldCount() - 1));
    const int top = topFieldRow_;
    KeepSelectionInPage();
    if (topFieldRow_ != top)
        FillPage();
    LoadEditor();
    return true;
}

// A page on, and at the end of all pages to the last row.
bool RecordBrowser::MovePages(int direction)
{
    const qint64 before = ScrollPosition();
    if (!ScrollBy(qint64(direction) * rowsPerPage_))
        return false;
    return ScrollPosition() != before || MoveRows(qint64(direction) * rowsPerPage_);
}

bool RecordBrowser::MoveColumns(int columns)
{
    if (presentation_ == Presentation::Detail)
        return MoveToRecord(SelectedRecord() + columns);
    const int column = SelectedColumn();
    return SelectCell(selectedRow_, std::clamp(column + columns, 0, std::max(page_.ColumnCount() - 1, 0)));
}

bool RecordBrowser::MoveToFirstColumn()
{
    return presentation_ == Presentation::Detail ? MoveRows(-FieldCount()) : SelectCell(selectedRow_, 0);
}

bool RecordBrowser::MoveToLastColumn()
{
    return presentation_ == Presentation::Detail ? MoveRows(FieldCount())
                                                 : SelectCell(selectedRow_, page_.ColumnCount() - 1);
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
    if (!IsOpen() || !WriteEdit())
        return false;
    if (presentation_ == Presentation::List) {
        listState_ = {topRow_, selectedRow_};
        detailRecord_ = SelectedRecord();
        presentation_ = Presentation::Detail;
        topFieldRow_ = 0;
    } else {
        presentation_ = Presentation::List;
        selectedField_ = SelectedFieldOrFirstVisible();
        const qint64 saved = listState_.row < 0 ? -1 : listState_.topRow + listState_.row;
        const bool inRange = saved >= 0 && saved < Count();
        topRow_ = inRange ? std::min(listState_.topRow, HighestTopRow()) : 0;
        ShowRecord(inRange ? saved : std::min<qint64>(Count(), 1) - 1);
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
    const QString count = count_ ? QString::number(*count_) : u"…"_s;
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
