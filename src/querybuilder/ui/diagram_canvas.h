#pragma once

#include "querybuilder/query_diagram.h"
#include "tableview/field_lists.h"

#include <QFrame>
#include <QHash>

class QListWidget;
class QToolButton;

namespace mirel {

// A table of the drawing: its name to be dragged by, its fields with ticks. A field can be dragged onto one of
// another table.
class DiagramBox : public QFrame {
    Q_OBJECT
public:
    DiagramBox(DiagramTable table, const std::vector<FieldLists::Field>& fields, QWidget* parent);

    const DiagramTable& Table() const { return table_; }
    void ShowTicks(const QueryDiagram& diagram);
    // The middle of the field's line, in the parent; within the box also where the list is scrolled away from it.
    int LineOf(const QString& field) const;

Q_SIGNALS:
    void ticked(const QString& field, bool shown);
    void joined(const QString& otherSource, const QString& otherField, const QString& field);
    void joinMenuRequested(const QString& field, const QPoint& globalPosition);
    void removeRequested();
    void moved();
    void scrolled();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    DiagramTable table_;
    QWidget* title_;
    QListWidget* fields_;
    QPoint dragFrom_;
    bool filling_ = false;
};

// The drawing: a box a table, a line a join with a button in its middle. It changes the diagram as the user does
// and says so; ShowDiagram takes up what others changed. Diagram and lists must outlive it.
class DiagramCanvas : public QWidget {
    Q_OBJECT
public:
    DiagramCanvas(QueryDiagram& diagram, FieldLists& lists, QWidget* parent);

    void ShowDiagram();

    QSize sizeHint() const override;

Q_SIGNALS:
    void changed();

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    DiagramBox* BoxOf(const QString& source) const;
    DiagramBox* MakeBox(const DiagramTable& table);
    QPoint FreePlace() const;
    void ShowJoins();
    void FillJoinMenu(size_t join);
    void OfferJoins(const QString& source, const QString& field, const QPoint& globalPosition);
    QPolygon LineOfJoin(const DiagramJoin& join) const;
    void FitToBoxes();

    QueryDiagram& diagram_;
    FieldLists& lists_;
    std::vector<DiagramBox*> boxes_;
    std::vector<QToolButton*> joinButtons_;
    QHash<QString, QPoint> places_; // of boxes by their source, also of those taken away
};

} // namespace mirel
