#pragma once

#include "provider/provider.h"

#include <QDialog>
#include <QListWidget>

#include <vector>

namespace mirel {

// The fields of a form's table, to be dragged onto the form.
class FieldList : public QListWidget {
    Q_OBJECT
public:
    explicit FieldList(QWidget* parent);

protected:
    QMimeData* mimeData(const QList<QListWidgetItem*>& items) const override;
};

// Name and type of each field; the name is the item's user data.
void FillFieldList(QListWidget& list, const std::vector<ResultField>& fields);

// The same on a small window: each field that is added goes below what is there.
class CFieldsDialog : public QDialog {
    Q_OBJECT
public:
    CFieldsDialog(const std::vector<ResultField>& fields, QWidget* parent);

Q_SIGNALS:
    void fieldChosen(const QString& name);

private:
    void Take();

    QListWidget* list_;
};

} // namespace mirel
