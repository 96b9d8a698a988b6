#pragma once

#include "platform/ui/hosted_view.h"
#include "platform/ui/view_look.h"
#include "tableview/block_commands.h"
#include "tableview/column_widths.h"
#include "tableview/record_browser.h"
#include "tableview/ui/query_writer.h"
#include "tableview/ui/table_command.h"

#include <QTimer>

#include <functional>

class QAction;
class QMenu;
class QStackedWidget;

namespace mirel {

class CellStrip;
class CommandActions;
class ErrorLine;
class FilterBar;
class FindLine;
class FormStore;
class MemoEdit;
class NavigationRow;
class RecordGrid;
class ResultCommands;

// The view of one open result: the grid, the editor of the selected cell under it, the buttons that walk
// through the records. It shows what its record browser holds and hands it what the user does.
//
// Connection and prompt must outlive the view.
class CTableView : public HostedView {
    Q_OBJECT

public:
    CTableView(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt,
               const TableViewSettings& settings, QWidget* parent = nullptr);
    ~CTableView() override;

    // Each shows its result from the first record on; false when the provider refuses it, which the prompt has
    // then told.
    bool OpenTable(const QString& table);
    bool OpenStatement(const QString& title, const QString& statement);

    // Where the database keeps its saved queries, for "Open Query" and "Save As Query"; must outlive the view.
    void SetStore(FormStore& store);
    // For "New Query", a change of the statement, and the source of an export; empty: they are not offered.
    void SetQueryWriter(WriteQuery write);

    const RecordBrowser& Browser() const { return browser_; }

    // Options that were confirmed in another view.
    void ChangeSettings(const TableViewSettings& settings);
    // For those who change the structure of what it shows.
    const QString& Title() const { return title_; }
    bool Shows(const QString& table) const;
    bool WritePending() { return Settle(browser_.WriteEdit()); } // false: it was refused, and why was told
    bool RunAgain();
    // The same when names have become others: `renamed` makes a statement say the new ones.
    bool RunRenamed(const QString& title, const std::function<QString(const QString&)>& renamed);

    void SetLook(const ViewLook& look);
    ColumnWidths WidthsByHand() const;
    void SetWidthsByHand(const ColumnWidths& widths);

    QList<QMenu*> Menus() const override { return menus_; }
    QList<KeyHint> Keys() const override;
    bool MayClose() override { return givenUp_ || Settle(browser_.WriteEdit()); }
    void GiveUpEdits() override { givenUp_ = true; }
    void TakeUpChanges() override;
    bool IsSettled() const override { return browser_.IsSettled(); }
    std::optional<RecordDraft> Draft() override;
    bool PutBack(const RecordDraft& draft) override;

    static std::optional<TableCommand> CommandOfKey(KeyPlace place, QKeyCombination keys);

Q_SIGNALS:
    // The user wants to change that of the look; its owner answers with SetLook.
    void lookRequested(mirel::LookItem item);
    // The user has confirmed other options; they are in force already.
    void settingsChanged(const TableViewSettings& settings);
    void queriesChanged(); // of the store

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void SetTitle(const QString& title);
    void LayOut();
    void CreateActions(); // and menus
    void ConnectParts();

    struct Commands;
    void Do(TableCommand command);
    bool Run(bool (*call)(RecordBrowser&)) { return Settle(call(browser_)); }
    // The same; and from the editor the focus goes back to the grid.
    void Walk(bool (*call)(RecordBrowser&));
    // After every call of the browser: shows what it holds now. When a write was refused, the user is told why
    // once the event that led here is over, and stays in the editor. Gives `done` back.
    bool Settle(bool done);
    void ShowState();
    void ShowZoom();
    void ShowReason();              // why what is typed was not, or will not be, stored
    void Note(const QString& text); // until another cell is selected
    void ShowActions();

    void ChangeFilters(const std::function<bool(RecordBrowser&)>& change);
    void Edit(const QString* typed); // null: as the cell is
    void Revert();
    void Copy(FieldNames names);
    void Paste();
    void Clear();
    void GoTo();
    void ChooseOptions();
    void FocusNextPane();
    void ToggleZoom();
    void ShowPopup(const QPoint& globalPosition);
    void ShowStatement();
    QAction* ActionOf(TableCommand command) const;

    RecordBrowser browser_;
    UserPrompt& prompt_;
    BlockCommands blocks_;
    QString title_;
    ResultCommands* resultCommands_;
    CommandActions* actions_ = nullptr;
    QList<QMenu*> menus_;
    QStackedWidget* stack_;
    RecordGrid* grid_;
    MemoEdit* zoomEdit_;
    CellStrip* strip_;
    ErrorLine* error_;
    FindLine* findLine_ = nullptr;
    FilterBar* filters_ = nullptr;
    NavigationRow* navigation_ = nullptr;
    QTimer settleTimer_;
    bool zoomed_ = false;
    bool hadEdit_ = false; // when it was shown last
    bool refused_ = false; // the error stands beside the editor, until the edit ends
    struct Refusal {
        QString text;
        QString why;
    };
    Refusal refusal_;        // the last one of the store, and of which text
    CellPlace notedAt_;      // the note is about that cell
    bool givenUp_ = false;   // its records are gone: nothing is read or written any more
    quint64 generation_ = 0; // of the records, when others were told of them last
};

} // namespace mirel
