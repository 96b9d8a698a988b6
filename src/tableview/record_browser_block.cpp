#include "tableview/record_browser.h"

#include <algorithm>

// The blocks of cells of the record browser.

namespace mirel {

CellBlock RecordBrowser::Block() const
{
    if (block_)
        return *block_;
    const CellPlace selected{SelectedRecord(), SelectedColumn()};
    return selected.record < 0 || selected.column < 0 ? CellBlock() : CellBlock::Between(selected, selected);
}

void RecordBrowser::CollapseBlock()
{
    if (!extending_)
        block_.reset();
}

bool RecordBrowser::Extend(const std::function<bool(RecordBrowser&)>& move)
{
    if (presentation_ == Presentation::Detail || SelectedRecord() < 0)
        return move(*this);
    if (!block_)
        blockStart_ = {SelectedRecord(), SelectedColumn()};
    extending_ = true;
    const bool moved = move(*this);
    if (moved)
        SelectBlock(CellBlock::Between(blockStart_, {SelectedRecord(), SelectedColumn()}));
    extending_ = false;
    return moved;
}

bool RecordBrowser::ExtendToCell(int row, int column)
{
    return Extend([=](RecordBrowser& browser) { return browser.SelectCell(row, column); });
}

void RecordBrowser::SelectBlock(const CellBlock& block)
{
    if (presentation_ == Presentation::Detail || SelectedRecord() < 0)
        return;
    if (!block_ && !extending_)
        blockStart_ = {SelectedRecord(), SelectedColumn()};
    CellBlock there = block;
    there.firstColumn = std::max(there.firstColumn, 0);
    there.lastColumn = std::min(there.lastColumn, page_.ColumnCount() - 1);
    there.firstRecord = std::max<qint64>(there.firstRecord, 0);
    if (KnownCount())
        there.lastRecord = std::min(there.lastRecord, *KnownCount() - 1);
    block_.reset();
    if (!there.IsEmpty() && !there.IsOneCell())
        block_ = there;
    NoteBlockEnds();
}

void RecordBrowser::NoteBlockEnds()
{
    blockEnds_ = {};
    if (!block_)
        return;
    const std::vector<RecordId> first = result_.IdsFrom(block_->firstRecord, 1);
    const std::vector<RecordId> last = result_.IdsFrom(block_->lastRecord, 1);
    if (!first.empty() && !last.empty())
        blockEnds_ = {first.front(), last.front()};
}

// After records came and went: the block is on the very records it was on, or it is no block any more.
void RecordBrowser::FindBlockAgain()
{
    if (!block_)
        return;
    const qint64 selected = SelectedRecord();
    const qint64 records = block_->Records();
    qint64 first = -1;
    qint64 last = -1;
    if (Recordset().MoveToRecord(blockEnds_.first))
        first = Recordset().Position();
    if (Recordset().MoveToRecord(blockEnds_.last))
        last = Recordset().Position();
    (void)result_.MoveTo(std::max<qint64>(selected, 0));
    if (first < 0 || last - first + 1 != records) {
        block_.reset();
        return;
    }
    blockStart_.record += first - block_->firstRecord;
    block_->firstRecord = first;
    block_->lastRecord = last;
}

void RecordBrowser::SelectAllCells()
{
    if (IsOpen())
        SelectBlock({0, Count() - 1, 0, page_.ColumnCount() - 1});
}

void RecordBrowser::SelectWholeRecords()
{
    const CellBlock block = Block();
    SelectBlock({block.firstRecord, block.lastRecord, 0, page_.ColumnCount() - 1});
}

void RecordBrowser::SelectWholeColumns()
{
    const CellBlock block = Block();
    if (IsOpen())
        SelectBlock({0, Count() - 1, block.firstColumn, block.lastColumn});
}

} // namespace mirel
