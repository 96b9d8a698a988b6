#pragma once

#include "platform/tap.h"

#include <QStyledItemDelegate>
#include <QTreeWidget>

namespace mirel {

// The rows of the side bar: headings that fold, with what is under them. It says what was tapped; what that means
// is its owner's to decide. Enter is told apart from taps.
class SideTree : public QTreeWidget {
    Q_OBJECT
public:
    enum Role { DetailRole = Qt::UserRole, DimmedRole };

    explicit SideTree(QWidget* parent);

    static bool IsHeading(const QTreeWidgetItem& item) { return !item.parent(); }

Q_SIGNALS:
    void Tapped(QTreeWidgetItem* item, mirel::Tap tap);
    void EnterPressed(QTreeWidgetItem* item);

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
};

class SideTreeDelegate : public QStyledItemDelegate {
    Q_OBJECT
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override;
    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const override;
};

} // namespace mirel
