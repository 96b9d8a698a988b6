#pragma once

#include "tableview/ui/table_command.h"

#include <QWidget>

#include <optional>

class QLabel;
class QPushButton;

namespace mirel {

// What the grid shows where there are no records: that there are none, and what can be done about it.
class EmptyNote : public QWidget {
    Q_OBJECT
public:
    explicit EmptyNote(QWidget* parent);

    // `offered`: the command of the button; none: there is no button.
    void Show(const QString& text, std::optional<TableCommand> offered);

Q_SIGNALS:
    void commandRequested(TableCommand command);

private:
    QLabel* text_;
    QPushButton* button_;
    std::optional<TableCommand> offered_;
};

} // namespace mirel
