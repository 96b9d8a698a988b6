#pragma once

#include "tableeditor/table_designer.h"

#include <QDialog>

#include <vector>

class QAction;
class QLabel;
class QLineEdit;
class QPushButton;
class QStackedWidget;
class QToolButton;
class QTreeWidget;

namespace mirel {

// "Mirel Create Table" and "Mirel Edit Table": a table's name, and the list of its fields with what can be done to
// them. It shows a TableDesigner, which must outlive it; a change of an existing table is made at once, so there
// is nothing to be confirmed at the end.
class CTableDialog : public QDialog {
    Q_OBJECT

public:
    CTableDialog(TableDesigner& designer, QWidget* parent);

protected:
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    enum class Command { NewField, EditField, ChangeType, DropField, MoveUp, MoveDown };

    QWidget* MakeNameRow();
    QWidget* MakeFields();
    QWidget* MakeTools();
    QWidget* MakeButtons();
    void AddCommand(Command command, Str text, Str tip, QStringView icon, const QString& keys);

    void Do(Command command);
    void EditField(bool type);
    void NewField();
    void CreateTable();
    void DropTable();
    void RenameTable();
    void ShowDesign();
    void ShowSelection();
    void ShowValues();
    void FitTools();
    void FitName();

    TableDesigner& designer_;
    QLineEdit* name_;
    QPushButton* rename_ = nullptr;
    QPushButton* create_ = nullptr;
    QStackedWidget* pages_;
    QTreeWidget* list_;
    QLabel* emptyText_;
    QWidget* tools_ = nullptr;
    std::vector<QAction*> actions_; // by Command
    std::vector<QToolButton*> toolButtons_;
    bool filling_ = false;
};

} // namespace mirel
