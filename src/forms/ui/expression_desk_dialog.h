#pragma once

#include "forms/design/expression_desk.h"
#include "forms/design/form_maker.h"

#include <QDialog>
#include <QTimer>

class QLabel;
class QListWidget;
class QPlainTextEdit;
class QTabWidget;
class QToolButton;

namespace mirel {

// The expression desk: an expression is written with its value on the current record and the neighbors in sight,
// with the fields, functions and controls that it can name, its meaning in words, and what the language leaves
// out. What would silently be nothing is accepted after a question only.
class CExpressionDesk : public QDialog {
    Q_OBJECT
public:
    CExpressionDesk(ExpressionDesk& desk, FormMaker& maker, const DeskQuestion& question, QWidget* parent);

    QString Text() const;
    void accept() override;

private:
    void LayOut();
    void FillLists();
    QListWidget* AddList(Str title);
    void Insert(const QString& text);
    void Step(int by);
    void ShowAnswer();
    DeskQuestion Question() const;

    ExpressionDesk& desk_;
    FormMaker& maker_;
    DeskQuestion question_;
    QPlainTextEdit* text_;
    QLabel* value_;
    QLabel* neighbors_;
    QToolButton* previous_;
    QToolButton* next_;
    QTabWidget* tabs_;
    QPlainTextEdit* meaning_;
    QPlainTextEdit* notes_;
    QLabel* help_;
    QTimer wait_;
    QStringList losses_;
};

} // namespace mirel
