#pragma once

#include <QFrame>

class QAction;
class QLabel;

namespace mirel {

// Says which filter is in force, and takes it away with its cross. Hidden while there is none.
class FilterChip : public QFrame {
    Q_OBJECT

public:
    // `remove` is "Remove Filter".
    FilterChip(QAction* remove, QWidget* parent);

    void ShowConditions(const QStringList& conditions);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void ShowText();

    QString text_;
    QLabel* label_;
};

} // namespace mirel
