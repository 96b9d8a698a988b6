#pragma once

#include "data/db_connection.h"
#include "querybuilder/query_diagram.h"
#include "querybuilder/query_draft.h"
#include "tableview/field_lists.h"

#include <QTimer>
#include <QWidget>

class QLabel;
class QLineEdit;
class QTableWidget;

namespace mirel {

class DiagramCanvas;

// The "Diagram" tab: the drawing, the grid of its fields, the first records of its statement. Each change writes
// the draft's statement; a look at it changes nothing. All that it is given must outlive it.
class DiagramPage : public QWidget {
    Q_OBJECT
public:
    DiagramPage(QueryDraft& draft, FieldLists& lists, DbConnection& connection, DatabaseLocation database,
                QWidget* parent);

    // The draft's statement; false: the diagram cannot show it, and why.
    bool ShowStatement(Str& why);
    void AddTable(const QString& table);
    void AddField(const QString& table, const QString& field);
    const QueryDiagram& Diagram() const { return diagram_; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QWidget* MakeGrid();
    void ShowGrid();
    void FillRow(int row);
    void TakeRow(int row);
    void Changed();
    void ShowFirstRecords();

    QueryDraft& draft_;
    FieldLists& lists_;
    DbConnection& connection_;
    DatabaseLocation database_;
    QueryDiagram diagram_;
    DiagramCanvas* canvas_;
    QTableWidget* grid_;
    QLineEdit* other_;
    QTableWidget* records_;
    QLabel* recordsNote_;
    QTimer recordsTimer_;
    QString shownRecordsOf_;
    bool filling_ = false;
};

} // namespace mirel
