#pragma once

#include "forms/ui/property_editors.h"

#include <QTimer>

class QLabel;
class QPlainTextEdit;

namespace mirel {

// How an expression's answer is told in a line: "= 12.50", and below it what is wrong.
QString AnswerText(const DeskAnswer& answer, bool ticks);

// An expression in a property sheet: its text, its value on the current record, what of it will be nothing, and
// the way to the expression desk.
class ExpressionField : public PropertyEditor {
    Q_OBJECT
public:
    ExpressionField(const PropertyDef& def, const SheetContext& context, QWidget* parent);

    void Show(const QString& value) override;
    bool IsWide() const override { return true; }

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void ShowLines();
    DeskQuestion Question() const;
    void ShowAnswer();
    void OpenDesk();

    SheetContext context_;
    QPlainTextEdit* text_;
    QLabel* answer_;
    QLabel* losses_;
    QString answerText_;
    QString lossText_;
    QTimer wait_; // until typing rests
    quint64 shown_ = 0;
    bool showing_ = false;
};

} // namespace mirel
