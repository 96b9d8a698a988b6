#pragma once

#include "tableview/field_lists.h"

#include <QDialog>

class QLineEdit;

namespace mirel {

// "Sort Expression": the text behind ORDER BY, typed or put together from fields and directions.
class CSortDialog : public QDialog {
    Q_OBJECT

public:
    CSortDialog(FieldLists& lists, const QString& table, const QString& field, QWidget* parent);

    QString Terms() const;

private:
    void Insert(const QString& text);

    QLineEdit* terms_;
};

} // namespace mirel
