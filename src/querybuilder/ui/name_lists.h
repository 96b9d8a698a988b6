#pragma once

#include "tableview/field_lists.h"

#include <QWidget>

class QComboBox;
class QListWidget;
class QStackedWidget;

namespace mirel {

// "Tables:" and "Table Fields:": what a statement can name. In a wide window two lists, of which a double tap or
// Enter takes an entry; in a narrow one two boxes: each choice in the second takes a field, or its first entry,
// the table. The lists must outlive it.
class NameLists : public QWidget {
    Q_OBJECT
public:
    NameLists(FieldLists& lists, const QString& table, QWidget* parent);

    void SetNarrow(bool narrow);
    QString Table() const { return table_; }
    QString Field() const { return field_; }

Q_SIGNALS:
    void tablePicked(const QString& table);
    void fieldPicked(const QString& table, const QString& field);

private:
    QWidget* WidePart();
    QWidget* NarrowPart();
    void ChooseTable(const QString& table);

    FieldLists& lists_;
    QString table_;
    QString field_;
    QStackedWidget* parts_;
    QListWidget* tableList_;
    QListWidget* fieldList_;
    QComboBox* tableBox_;
    QComboBox* fieldBox_;
};

} // namespace mirel
