#pragma once

#include "tableview/field_lists.h"

#include <QWidget>

class QComboBox;

namespace mirel {

// "Tables:" and "Fields:": two boxes of which the second lists the fields of the table in the first. The lists
// must outlive the chooser.
class FieldChooser : public QWidget {
    Q_OBJECT

public:
    // ToPick: fields are taken into a text, each time again (see PickBox); else one of them is chosen.
    enum class Use { ToChoose, ToPick };
    FieldChooser(FieldLists& lists, Use use, QWidget* parent);

    QString Table() const;
    QString Field() const;
    // Chooses without telling; what is not in the lists leaves the first entry.
    void Choose(const QString& table, const QString& field);

Q_SIGNALS:
    void fieldChanged(); // another table or field stands in the boxes
    void fieldPicked();  // the user took one from the list, the same one again included

private:
    void ListFields(const QString& wanted);

    FieldLists& lists_;
    QComboBox* tables_;
    QComboBox* fields_;
};

} // namespace mirel
