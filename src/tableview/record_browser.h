#pragma once

#include "data/db_recordset.h"
#include "data/filter_condition.h"
#include "platform/user_prompt.h"
#include "tableview/cell_block.h"
#include "tableview/cell_edit.h"
#include "tableview/record_page.h"
#include "tableview/table_view_settings.h"
#include "tableview/undo_log.h"

#include <QString>
#include <QStringList>

#include <functional>
#include <optional>
#include <vector>

namespace mirel {

// The list shows a page of records, a row each; the detail shows one record, a row for each of its fields.
enum class Presentation { List, Detail };

enum class SortDirection { Ascending, Descending };

// One open result as the user walks through it: the page that the grid shows, the selected cell, the editor of
// its value, the record counter; all that the table view does, without a window.
//
// Records and fields count from 0; rows count from 0 within the page. Hidden columns stay in the result.
//
// An edit is pending until it is written: by every call that moves, adds, deletes or runs a statement. When that
// write is refused, the call does nothing and returns false, the edit stays as the user left it, and
// WriteFailed() holds until ShowWriteError() has told the user why. All other failures are reported through the
// prompt at once.
//
// Connection and prompt must outlive the browser.
class RecordBrowser {
public:
    RecordBrowser(DbConnection& connection, QString database, UserPrompt& prompt, TableViewSettings settings);
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
    void Close();
    bool IsOpen() const { return recordset_.IsOpen(); }
    bool CanUpdate() const { return IsOpen() && recordset_.Lock() != LockType::ReadOnly; }
    const QString& Statement() const { return statement_; }
    const QString& BaseStatement() const { return baseStatement_; }
    const QString& Database() const { return database_; }

    const TableViewSettings& Settings() const { return settings_; }
    bool ChangeSettings(const TableViewSettings& settings);

    int FieldCount() const { return recordset_.FieldCount(); }
    QString FieldName(int field) const { return recordset_.FieldName(field); }
    FieldType TypeOfField(int field) const { return recordset_.TypeOfField(field); }
    std::span<const ResultField> Fields() const { return recordset_.Fields(); }
    // The result itself, for the commands that work on all of its records. They leave it on the selected one.
    DbRecordset& Recordset() { return recordset_; }

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

    // The count, where it is known; CountOn counts on for a while and returns true once it is.
    std::optional<qint64> KnownCount() const { return count_; }
    bool CountOn(int budgetMs);
    bool IsEmpty() const { return count_ == 0; }

    // --- the page ---------------------------------------------------------------------------------------

    const RecordPage& Page() const { return page_; }
    // Grow whenever the page holds other texts; whenever it has other columns.
    quint64 PageRevision() const { return pageRevision_; }
    quint64 ColumnsRevision() const { return columnsRevision_; }

    void SetRowsPerPage(int wholeRows);
    int RowsPerPage() const { return rowsPerPage_; }
    // What the vertical scroll bar counts: records in the list, fields in the detail.
    qint64 ScrollPosition() const;
    qint64 HighestScrollPosition() const;
    bool ScrollTo(qint64 position); // out of range positions stop at the end
    bool ScrollBy(qint64 rows) { return ScrollTo(ScrollPosition() + rows); }
    // Reads the page again where another program has changed the records since.
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
    bool IsFiltered() const { return !conditions_.isEmpty(); }
    const QStringList& Conditions() const { return conditions_; }

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

    // The field as a statement names it: with its table where the result draws on more than one.
    QString ReferenceOf(int field) const;
    // The table that the field comes from; for an expression the result's first one.
    QString TableOf(int field) const;

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
    bool IsWritable(int field) const;
    bool HasPendingEdit() const { return edit_.IsPending(); }
    // Each makes a pending edit; on a cell that cannot be edited it does nothing.
    void EditText(const QString& text);
    void EditChecked(bool checked);
    void ClearCell(); // NULL
    void InsertCurrentDateTime();
    void RepeatAbove(); // the value of the same field in the record before
    void RevertEdit();
    QString SelectedText() const; // what the cell holds, or would with the pending edit; whole
    Value SelectedValue() const;  // what the record holds; null without a selection
    // What is pending as a value of the field's type.
    Value EditedValue() const { return edit_.Stored(); }
    // Shows a text in the editor that is none of the record's: the result of a command. It is no edit.
    void ShowInEditor(const QString& label, const QString& text);

    [[nodiscard]] bool WriteEdit();
    bool WriteFailed() const { return writeFailed_; }
    void ShowWriteError();

    // --- records ------------------------------------------------------------------------------------------

    bool AddRecord();
    bool DeleteRecord(); // all records that have selected cells

    // What is more than this is not kept to be taken back: whoever changes so many cells asks first.
    static constexpr qint64 kMostUndoneCells = 200'000;

    // What a change of many records came to. Where it stopped early, the records before are written.
    struct ManyChanged {
        qint64 records = 0;    // written
        QString failure;       // why it stopped; empty: it did not, or the user asked for it
        int refusedField = -1; // whose value was refused; -1: it was no single one
    };
    // Writes `count` records from `first` on, as one step to undo; those behind the last are added. `values` is
    // asked for each, counting from 0. Values are refused rather than cut, whatever an editor would do.
    ManyChanged ChangeRecords(qint64 first, qint64 count,
                              const std::function<std::vector<FieldChange>(qint64)>& values, Progress& progress);

    // A pending edit goes first; then what was written, added and deleted, step by step.
    bool CanUndo() const { return edit_.IsPending() || undo_.CanUndo(); }
    bool Undo();

private:
    struct ListState {
        qint64 topRow = 0;
        int row = -1;
    };

    // The result.
    bool Execute(const QString& statement);
    void Clear();
    void TakeUpFields();
    void RebuildColumns();
    qint64 Count();
    void Recount();
    void ReportFailure();

    // The page.
    void FillPage();
    void FillList();
    void FillDetail();
    bool ReadRows(qint64 first, int count);
    void RefreshCell();
    qint64 HighestTopRow() const;
    int HighestFieldRow() const;
    void KeepSelectionInPage();

    // The selection. The recordset stands on the selected record at all times.
    void LoadEditor();
    void ShowRecord(qint64 record);
    bool MoveToRecord(qint64 record); // stops at either end
    int SelectedFieldOrFirstVisible() const;
    bool MovePages(int direction);
    void CollapseBlock();

    // The records.
    std::vector<FieldChange> NewRecordValues() const;
    // A step of null: it is not to be undone.
    bool ChangeOne(qint64 record, std::vector<FieldChange> values, UndoLog::Step* step);
    bool AddOne(std::vector<FieldChange> values, UndoLog::Step* step);
    std::optional<RecordChange> NewChange(RecordChange::Kind kind) const; // none: it cannot be undone
    void NoteAdded(UndoLog::Step& step) const;
    void NoteDeleted(DbRecordset& table, UndoLog::Step& step);
    bool DeleteBlock();
    bool DeleteFrom(qint64 first, qint64 last, UndoLog::Step* step);

    DbConnection& connection_;
    DbRecordset recordset_;
    UserPrompt& prompt_;
    QString database_;
    TableViewSettings settings_;
    QString baseStatement_;
    QString statement_;
    QStringList conditions_; // put onto the base statement, in their order
    ColumnSort sort_;
    std::optional<qint64> count_;
    quint64 generation_ = 0; // of the recordset, when count_ was taken
    QStringList fieldNames_;
    std::vector<bool> visible_; // a flag a field

    Presentation presentation_ = Presentation::List;
    RecordPage page_;
    quint64 pageRevision_ = 0;
    quint64 columnsRevision_ = 0;
    bool working_ = false;
    bool fillLater_ = false; // the page was to be filled while a command worked
    int rowsPerPage_ = 1;
    qint64 topRow_ = 0;
    int selectedRow_ = -1; // in the list
    int selectedField_ = -1;
    qint64 detailRecord_ = -1;
    int topFieldRow_ = 0;
    ListState listState_; // while the detail is shown
    std::optional<CellBlock> block_;
    CellPlace blockStart_;
    bool extending_ = false;

    CellEdit edit_;
    QString shownLabel_; // of a text in the editor that is none of the record's
    bool writeFailed_ = false;
    QString writeError_;
    UndoLog undo_;
};

} // namespace mirel
