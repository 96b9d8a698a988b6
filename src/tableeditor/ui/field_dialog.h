#pragma once

#include "tableeditor/table_design.h"

#include <QDialog>

#include <functional>

class QComboBox;
class QLabel;
class QLineEdit;
class QSpinBox;

namespace mirel {

// One field of a table: its name, type, size and index. OK hands them to `take`; while that refuses them, the
// dialog stays with what was typed.
class CFieldDialog : public QDialog {
    Q_OBJECT

public:
    enum class Focus { Name, Type };
    using Take = std::function<bool(const FieldDesign& field)>;

    CFieldDialog(const QString& title, const FieldDesign& field, Focus focus, Take take, QWidget* parent);

    void accept() override;

private:
    void LayOut();
    void TakeUpType();
    FieldDesign Field() const;

    FieldDesign field_;
    Take take_;
    QLineEdit* name_;
    QComboBox* type_;
    QSpinBox* size_;
    QComboBox* index_;
};

} // namespace mirel
