#pragma once

#include "data/filter_condition.h"
#include "platform/user_prompt.h"
#include "result/open_result.h"
#include "result/record_draft.h"
#include "tableview/cell_block.h"
#include "tableview/cell_edit.h"
#include "tableview/presentation.h"
#include "tableview/record_page.h"
#include "tableview/table_view_settings.h"

#include <QString>
#include <QStringList>

#include <functional>
#include <optional>
#include <vector>

namespace mirel {

enum class SortDirection { Ascending, Descending };

// One open result as the user walks through it: the page that the grid shows, the selected cell, the editor of
// its value, the record counter; all that the table view does, without a window.
//
// Records and fields count from 0; rows count from 0 within the page. Hidden columns stay in the result.
//
// The selected record is the current one of the result, known by its identity: see OpenResult for what others may
// do to it. What they did is taken up before each step that depends on a position.
//
// An edit is pending until it is written: by every call that moves, adds, deletes or runs a statement. When that
// write is refused, the call does nothing and returns false, the edit stays as the user left it, and
// WriteFailed() holds until ShowWriteError() has told the user why. All other failures are reported through the
// prompt at once.
//
// Connection and prompt must outlive the browser.
class RecordBrowser {
public:
    RecordBrowser(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt,
                  TableViewSettings settings);
    Q_DISABLE_COPY_MOVE(RecordBrowser)

    // The statement that shows a whole table. Never the bare name: filters are appended to it.
    static QString StatementOfTable(QStringView table);

    // --- the result -------------------------------------------------------------------------------------

    // Runs `statement`, which becomes the base and the current statement, and shows its first page as a list.
    // False, with nothing open, when the provider refuses it.
    bool Open(const QString& statement);
    // The same; but when it is refused, what was shown before is shown again, with its filters and its order.
    bool OpenInstead(const QString& statement);
    // Makes `statement`, a filter or sort put onto the current one, current. When it is refused, the one before
    // is run again.
    bool Rewrite(const QString& statement);
    bool RunAgain(); // the current statement; the selection stays on its position
    bool OpenRenamed(const std::function<QString(const QString&)>& renamed); // as OpenResult's
    void Close();
    bool IsOpen() const { return result_.IsOpen(); }
    bool CanUpdate() const { return result_.CanUpdate(); }
    const QString& Statement() const { return result_.Statement(); }
    const QString& BaseStatement() const { return result_.BaseStatement(); }
    const DatabaseLocation& Database() const { return result_.Database(); }

    const TableViewSettings& Settings() const { return settings_; }
    void ChangeSettings(const TableViewSettings& settings); // a pending edit stays

    int FieldCount() const { return result_.FieldCount(); }
    QString FieldName(int field) const { return result_.Records().FieldName(field); }
    FieldType TypeOfField(int field) const { return result_.Records().TypeOfField(field); }
    std::span<const ResultField> Fields() const { return result_.Fields(); }
    // The result itself, for the commands that work on many of its records. They leave it on the selected one.
    OpenResult& Result() { return result_; }
    DbRecordset& Recordset() { return result_.Records(); }

    // As long as one lives, a command works through the records and the window lives on beside it: whatever that
    // asks for, nothing else reads the result meanwhile. The page is filled again afterwards where it has to be.
    class Work {
    public:
        explicit Work(RecordBrowser& browser);
        ~Work();
        Q_DISABLE_COPY_MOVE(Work)

    private:
        RecordBrowser& browser_;
    };

    std::optional<qint64> KnownCount() const { return result_.KnownCount(); }
    // The count is known, and the order is that of now. SettleOn works at it for a while and returns true once
    // there may be something new to show.
    bool IsSettled() const;
    bool SettleOn(int budgetMs);
    bool IsEmpty() const { return result_.KnownCount() == 0; }

    // --- the page ---------------------------------------------------------------------------------------

    const RecordPage& Page() const { return page_; }
    // Grow whenever the page holds other texts; whenever it has other columns.
    quint64 PageRevision() const { return pageRevision_; }
    quint64 ColumnsRevision() const { return columnsRevision_; }

    void SetRowsPerPage(int wholeRows);
    int RowsPerPage() const { return list_.WholeRows(); }
    // What the vertical scroll bar counts: records in the list, fields in the detail.
    qint64 ScrollPosition() const;
    qint64 HighestScrollPosition() const;
    bool ScrollTo(qint64 position); // out of range positions stop at the end
    bool ScrollBy(qint64 rows) { return ScrollTo(ScrollPosition() + rows); }
    // Shows what others changed since the last look, in this program or another. The selection stays on its
    // record, and in its row; where the record is gone, the one behind it is selected. What is being typed stays.
    void TakeUpChanges();

    // --- moving -----------------------------------------------------------------------------------------

    Presentation CurrentPresentation() const { return presentation_; }
    bool TogglePresentation();

    int SelectedRow() const; // -1: none
    int SelectedColumn() const;
    qint64 SelectedRecord() const; // -1: none
    int SelectedField() const { return selectedField_; }
    bool SelectCell(int row, int column);

    bool GoToFirst();
    bool GoToLast();
    bool GoToNext();
    bool GoToPrevious();
    bool GoToRecord(qint64 number); // counts from 1; does nothing when there is no such record

    // The arrow keys and their kin: rows are records in the list, fields in the detail.
    bool MoveRows(qint64 rows);
    bool PageDown() { return MovePages(1); }
    bool PageUp() { return MovePages(-1); }
    bool MoveColumns(int columns);
    bool MoveToFirstColumn();
    bool MoveToLastColumn();
    // Tab and Shift+Tab: the next cell, and behind the last of a record the first of the next one.
    bool MoveToNextCell();
    bool MoveToPreviousCell();

    // To any cell of the result, with no more scrolling than it takes to show it. Does nothing where the field
    // has no column.
    bool GoToCell(qint64 record, int field);

    // "2/10000"; "2/…" while the count is unknown. The second: while the scroll bar is dragged to `position`.
    QString CounterText() const;
    QString CounterTextAt(qint64 position) const;

    // --- blocks of cells, in the list -----------------------------------------------------------------------

    // The selected cells: the block, or the selected cell alone; empty without a selection. A block ends with the
    // next move.
    CellBlock Block() const;
    bool HasBlock() const { return block_.has_value(); }
    // Moves the selected cell, and selects all cells between it and where the block began.
    bool Extend(const std::function<bool(RecordBrowser&)>& move);
    bool ExtendToCell(int row, int column);
    void SelectBlock(const CellBlock& block); // what of it there is; the selected cell stays
    void SelectAllCells();
    void SelectWholeRecords(); // those that have selected cells
    void SelectWholeColumns();

    // --- filters and sorts: rewrites of the current statement ---------------------------------------------

    // Each does nothing when the result holds no record. False when the provider refused the rewritten
    // statement: the result before is then shown again.
    bool FilterByCell(CellFilter filter); // the selected cell
    bool AddCondition(const QString& condition);
    bool RemoveFilter(); // back to the base statement, its order included
    bool IsFiltered() const { return !Filters().empty(); }
    QStringList Conditions() const { return result_.Conditions(); } // those in force
    const std::vector<OpenResult::Filter>& Filters() const { return result_.Filters(); }
    // One of the filters, by its place in the list. They work on an empty result, too.
    bool TakeFilterOff(int filter);
    bool SwitchFilter(int filter);
    bool ChangeFilter(int filter, const QString& condition);

    bool SortByColumn(int field, SortDirection direction);
    bool SortByTerms(const QString& terms);
    // A tap on a column's header: ascending, and the other way round with the next tap on the same column. Does
    // nothing where the settings do not ask for it.
    bool TapHeader(int column);
    struct ColumnSort {
        int field = -1; // -1: the order is not that of a column
        SortDirection direction = SortDirection::Ascending;
    };
    ColumnSort CurrentSort() const { return sort_; }

    QString ReferenceOf(int field) const { return result_.ReferenceOf(field); }
    QString TableOf(int field) const { return result_.TableOf(field); }

    // --- columns ----------------------------------------------------------------------------------------

    bool CanHideColumn() const;
    bool CanShowAllColumns() const;
    bool HideColumn(); // the selected one
    bool ShowAllColumns();
    bool IsVisible(int field) const { return visible_[size_t(field)]; }
    std::vector<int> VisibleFields() const;

    // --- the editor of the selected cell ------------------------------------------------------------------

    QString FieldLabel() const; // "Name:"; empty without a selection
    const CellEdit& Edit() const { return edit_; }
    bool CanEdit() const;
    bool IsWritable(int field) const { return result_.IsWritable(field); }
    bool HasPendingEdit() const { return edit_.IsPending(); }
    // Each makes a pending edit; on a cell that cannot be edited it does nothing.
    void EditText(const QString& text);
    void EditChecked(bool checked);
    void ClearCell(); // NULL
    void InsertCurrentDateTime();
    static QString CurrentDateTimeText();
    void RepeatAbove(); // the value of the same field in the record before
    void RevertEdit();
    QString SelectedText() const; // what the cell holds, or would with the pending edit; whole
    // What is pending as a value of the field's type.
    Value EditedValue() const { return edit_.Stored(); }
    QString EditedText() const; // the same as the user writes it: a Yes/No without a value is stored as No
    // Shows the result of a command in the editor's place. It is not the cell's text: nothing edits it, and any
    // edit, revert or move ends it.
    void ShowInEditor(const QString& label, const QString& text);
    bool ShowsResult() const { return !shownLabel_.isEmpty(); }
    void EndResult() { shownLabel_.clear(); }
    const QString& ShownResult() const { return shownResult_; }

    // In plain words. Empty: it can be edited; all of what is pending can be stored.
    QString WhyNotEditable() const;
    QString WhyNotStored() const { return edit_.WhyNotStored(); }

    [[nodiscard]] bool WriteEdit();
    bool WriteFailed() const { return writeFailed_; }
    void ShowWriteError();
    const QString& WriteError() const { return writeError_; } // of the last write that failed

    // What is pending, to be kept for the case that the program is killed before it is written; none: nothing is.
    std::optional<RecordDraft> Draft();
    // Makes it pending again, in the cell that it was typed into. False, and nothing changed, where that cell's
    // record is gone or holds other values by now, or while something else is pending.
    bool PutBack(const RecordDraft& draft);

    // --- records ------------------------------------------------------------------------------------------

    // Whether the selected record is still there, once what others did has been taken up; else the user is told,
    // and nothing that was meant for it may be done to another. For commands that change it.
    bool IsRecordStillThere();
    bool AddRecord();
    bool DeleteRecord(); // all records that have selected cells

    // Writes `count` records from the first of `asked` on, which SeenBlock gave before any question, as one step
    // to undo; those behind the last are added. `values` is asked for each, counting from 0. Values are refused
    // rather than cut, whatever an editor would do.
    OpenResult::ManyWritten ChangeRecords(const std::vector<SeenRecord>& asked, qint64 count,
                                          const std::function<std::vector<FieldChange>(qint64)>& values,
                                          Progress& progress);
    // The records of the block and those that follow it, as they are seen now.
    std::vector<SeenRecord> SeenFrom(qint64 first, qint64 count) { return result_.SeenFrom(first, count); }

    // A pending edit goes first; then what was written, added and deleted, step by step.
    bool CanUndo() const { return edit_.IsPending() || result_.CanUndo(); }
    bool CanRedo() const { return !edit_.IsPending() && result_.CanRedo(); }
    bool Undo();
    bool Redo();

private:
    struct ListState {
        qint64 topRow = 0;
        qint64 record = -1;
        RecordId id;
    };
    struct BlockEnds { // of a block, so that it is found again when records come and go
        RecordId first;
        RecordId last;
    };

    // The result.
    bool Execute(const std::function<bool()>& run);
    bool Refilter(const std::vector<OpenResult::Filter>& filters);
    void ShowFromStart();
    void Clear();
    void TakeUpFields();
    void RebuildColumns();
    qint64 Count() { return result_.Count(); }
    void ReportFailure() { result_.Report(); }

    // The page.
    void FillPage();
    void FillList();
    void FillDetail();
    bool ReadRows(qint64 first, int count);
    void RefreshCell();
    qint64 HighestTopRow() const;
    qint64 HighestFieldRow() const { return detail_.HighestTop(FieldCount()); }
    void KeepSelectionInPage();

    // The selection.
    void LoadEditor();
    void SelectRecord(qint64 record);
    void SelectRecordInRow(int row);
    bool PrepareStep();
    bool MoveToRecord(qint64 record); // stops at either end
    int SelectedFieldOrFirstVisible() const;
    bool MovePages(int direction);
    void CollapseBlock();
    void NoteBlockEnds();
    void FindBlockAgain();

    // The records.
    bool WriteFailure(const QString& text);
    bool DeleteBlock();
    bool ShowTurned(const ChangeLog::Outcome& outcome);
    void ShowRecordAgain(qint64 record);

    OpenResult result_;
    UserPrompt& prompt_;
    TableViewSettings settings_;
    ColumnSort sort_;
    QStringList fieldNames_;
    std::vector<bool> visible_; // a flag a field

    Presentation presentation_ = Presentation::List;
    ListPresentation list_;
    DetailPresentation detail_;
    RecordPage page_;
    quint64 pageRevision_ = 0;
    quint64 columnsRevision_ = 0;
    bool working_ = false;
    bool fillLater_ = false; // the page was to be filled while a command worked
    int selectedField_ = -1;
    ListState listState_; // while the detail is shown
    std::optional<CellBlock> block_;
    BlockEnds blockEnds_;
    CellPlace blockStart_;
    bool extending_ = false;

    CellEdit edit_;
    QByteArray fingerprint_; // of the record that the edit was begun on, once it was asked for
    QString shownLabel_;     // of a command's result; empty: the editor shows the cell
    QString shownResult_;
    bool writeFailed_ = false;
    QString writeError_;
};

} // namespace mirel
