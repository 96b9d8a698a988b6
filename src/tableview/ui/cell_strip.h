#pragma once

#include "tableview/record_browser.h"
#include "tableview/ui/table_command.h"

#include <QWidget>

class QAction;
class QCheckBox;
class QLabel;
class QLineEdit;
class QToolButton;

namespace mirel {

class DateField;

// The line under the grid: the selected field's name and one editor for its value, as text, as text with a
// calendar for dates, or as a tick. It hands over what the user enters; the receiver calls ShowState.
class CellStrip : public QWidget {
    Q_OBJECT

public:
    CellStrip(const RecordBrowser& browser, QWidget* parent);

    void ShowState(bool zoomed);
    void MarkRefused(bool refused); // the text was not stored
    // Puts the focus into the editor; the second goes on with what was typed on the grid.
    void BeginEdit();
    void BeginTyping(const QString& text);
    bool HasEditorFocus() const;

Q_SIGNALS:
    void textEdited(const QString& text);
    void checkEdited(bool checked);
    void commandRequested(TableCommand command);
    void reasonRequested(); // the mark of a text that cannot be stored was tapped
    void typedOverResult(const QString& text);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    void LayOut();
    void ShowLabel();
    bool ShowsTick() const;
    QWidget* Editor() const;

    const RecordBrowser& browser_;
    QLabel* label_;
    DateField* field_;
    QLineEdit* line_;
    QAction* lossMark_; // the text will not be stored as it stands
    QCheckBox* check_;
    QToolButton* zoom_;
};

} // namespace mirel
