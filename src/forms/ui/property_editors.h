#pragma once

#include "forms/design/expression_desk.h"
#include "forms/design/form_maker.h"
#include "forms/design/properties.h"

#include <QWidget>

#include <functional>

namespace mirel {

// The dialogs that the form maker takes from the program around it. True: the value was changed.
struct MakerDialogs {
    std::function<bool(TextStyle& style, QWidget& parent)> chooseFont;
    std::function<bool(quint32& color, QWidget& parent)> chooseColor;
    struct Query {
        QString text;
        QString table;
        bool followsSelect = false; // the text stands behind "SELECT * "
    };
    std::function<bool(Query& query, QWidget& parent)> buildQuery; // null: there is no query builder
};

// What the editors of a property sheet work on. All of it must outlive them.
struct SheetContext {
    FormMaker& maker;
    ExpressionDesk& desk;
    const MakerDialogs& dialogs;
    int control = -1; // that the sheet is about; -1: the form
};

// The editor of one property: shows its value, and tells what the user makes of it.
class PropertyEditor : public QWidget {
    Q_OBJECT
public:
    using QWidget::QWidget;

    virtual void Show(const QString& value) = 0;
    virtual bool HasOwnCaption() const { return false; } // a check box has its caption beside it
    virtual bool IsWide() const { return false; }        // it stands below its caption

Q_SIGNALS:
    void changed(const QString& value);
};

PropertyEditor* MakePropertyEditor(const PropertyDef& def, const SheetContext& context, QWidget* parent);

} // namespace mirel
