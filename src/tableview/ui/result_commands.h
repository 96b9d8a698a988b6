#pragma once

#include "data/db_connection.h"
#include "platform/user_prompt.h"
#include "tableview/aggregate.h"
#include "tableview/record_browser.h"
#include "tableview/ui/query_writer.h"

#include <QObject>

class QWidget;

namespace mirel {

class FormStore;

// The commands of the table view that work on its result as a whole: filters and sorts put together in a dialog,
// sums, "Edit All", saved queries, the export. All that it is given must outlive it.
class ResultCommands : public QObject {
    Q_OBJECT

public:
    ResultCommands(RecordBrowser& browser, DbConnection& connection, UserPrompt& prompt, QWidget& view);

    // What the view calls its result.
    void SetTitle(const QString& title) { title_ = title; }
    // Where the database keeps its saved queries; null: nowhere.
    void SetStore(FormStore* store) { store_ = store; }
    // Empty: statements cannot be written here.
    void SetQueryWriter(WriteQuery write) { writeQuery_ = std::move(write); }

    // Each returns whether it was carried out; the user's Cancel counts as carried out.
    bool FilterByExpression();
    bool ChangeFilter(int filter); // by its place among the browser's
    bool SortByExpression();
    bool DeleteAll();
    bool UpdateAll();
    bool Compute(Aggregate function);
    bool CanWriteQuery() const { return bool(writeQuery_); }
    bool NewQuery();
    bool EditStatement(); // that is shown now
    bool CanOpenQuery() const;
    bool OpenQuery();
    bool CanSaveQuery() const;
    bool SaveQuery();
    bool Export();

Q_SIGNALS:
    void queryOpened(const QString& name);
    void queriesChanged();

private:
    bool Write(const QString& statement);
    QString SelectedColumn() const; // in its table; empty for an expression

    RecordBrowser& browser_;
    DbConnection& connection_;
    UserPrompt& prompt_;
    QWidget& view_;
    FormStore* store_ = nullptr;
    WriteQuery writeQuery_;
    QString title_;
};

} // namespace mirel
