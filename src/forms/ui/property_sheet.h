#pragma once

#include "forms/ui/property_editors.h"

#include <QDialog>

class QComboBox;
class QVBoxLayout;

namespace mirel {

// The property sheet of what is selected: a control, or the form. Each line changes the design at once. Of several
// selected controls it shows the form's.
class PropertySheet : public QWidget {
    Q_OBJECT
public:
    PropertySheet(FormMaker& maker, ExpressionDesk& desk, const MakerDialogs& dialogs, QWidget* parent);

    void ShowState();
    void FocusFirst();

Q_SIGNALS:
    void acted();

private:
    struct Line {
        const ControlProperty* control = nullptr; // one of the two
        const FormProperty* form = nullptr;
        PropertyEditor* editor = nullptr;
    };
    std::vector<Line> LinesFor(int control) const;
    void Build(int control);
    const PropertyDef* FocusedLine() const; // null: none
    void AddLine(QVBoxLayout& column, Line& line, int number);
    void ShowTargets();
    void Write(const Line& line, int number, const QString& value);

    SheetContext context_;
    QComboBox* target_;
    QWidget* page_ = nullptr;
    QVBoxLayout* column_;
    std::vector<Line> lines_;
    std::vector<Line> shownLines_; // while others take their place
    QStringList targets_;
    bool built_ = false;
    bool writing_ = false;
    QString table_; // whose fields the editors offer
};

// The same as a sheet over a small window.
class CPropertySheet : public QDialog {
    Q_OBJECT
public:
    CPropertySheet(FormMaker& maker, ExpressionDesk& desk, const MakerDialogs& dialogs, QWidget* parent);

Q_SIGNALS:
    void acted();
};

} // namespace mirel
