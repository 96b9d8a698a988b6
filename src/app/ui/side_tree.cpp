#include "app/ui/side_tree.h"

#include <QApplication>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>

namespace mirel {
namespace {

constexpr int kGap = 8;
constexpr int kAccentWidth = 3;
constexpr qreal kTint = 0.14; // of the accent on the ground, under the selected row

QColor Mixed(const QColor& ground, const QColor& ink, qreal share)
{
    const auto mix = [share](int a, int b) { return int(a + (b - a) * share); };
    return {mix(ground.red(), ink.red()), mix(ground.green(), ink.green()), mix(ground.blue(), ink.blue())};
}

} // namespace

SideTree::SideTree(QWidget* parent)
    : QTreeWidget(parent)
{
    setItemDelegate(new SideTreeDelegate(this));
    setHeaderHidden(true);
    setRootIsDecorated(false);
    setIndentation(0);
    setUniformRowHeights(true);
    setEditTriggers(NoEditTriggers);
    setExpandsOnDoubleClick(false);
    setFrameShape(NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollMode(ScrollPerPixel);
    setContextMenuPolicy(Qt::CustomContextMenu);
    viewport()->setBackgroundRole(QPalette::Window);
    connect(this, &QTreeWidget::itemClicked, this,
            [this](QTreeWidgetItem* item) { Q_EMIT Tapped(item, Tap::Single); });
}

void SideTree::keyPressEvent(QKeyEvent* event)
{
    const bool enter = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (!enter || !currentItem() || event->modifiers() != (event->modifiers() & Qt::KeypadModifier))
        return QTreeWidget::keyPressEvent(event);
    if (IsHeading(*currentItem()))
        currentItem()->setExpanded(!currentItem()->isExpanded());
    else
        Q_EMIT EnterPressed(currentItem());
}

void SideTree::mousePressEvent(QMouseEvent* event)
{
    QTreeWidget::mousePressEvent(event);
    QTreeWidgetItem* item = itemAt(event->pos());
    if (item && IsHeading(*item) && event->button() == Qt::LeftButton)
        item->setExpanded(!item->isExpanded());
}

void SideTree::mouseDoubleClickEvent(QMouseEvent* event)
{
    QTreeWidgetItem* item = itemAt(event->pos());
    if (item && IsHeading(*item))
        return mousePressEvent(event);
    QTreeWidget::mouseDoubleClickEvent(event);
    if (item && event->button() == Qt::LeftButton)
        Q_EMIT Tapped(item, Tap::Double);
}

void SideTreeDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const
{
    QStyleOptionViewItem item = option;
    initStyleOption(&item, index);
    const bool heading = !index.parent().isValid();
    const bool selected = item.state.testFlag(QStyle::State_Selected);
    const bool focused = item.state.testFlag(QStyle::State_HasFocus);
    const QPalette& palette = item.palette;
    const QColor ground =
        palette.color(item.widget ? static_cast<const QTreeWidget*>(item.widget)->viewport()->backgroundRole()
                                  : QPalette::Window);
    const QColor ink = palette.color(QPalette::Text);
    const QColor dim = palette.color(QPalette::PlaceholderText);
    const QColor accent = palette.color(QPalette::Highlight);

    painter->save();
    painter->setRenderHint(QPainter::Antialiasing);
    const QRect row = item.rect.adjusted(4, 1, -4, -1);
    if (selected || item.state.testFlag(QStyle::State_MouseOver)) {
        painter->setPen(Qt::NoPen);
        painter->setBrush(Mixed(ground, accent, selected ? kTint : kTint / 2));
        painter->drawRoundedRect(row, 4, 4);
    }
    if (selected) {
        QRect bar(row.left(), row.top(), kAccentWidth, row.height());
        painter->setBrush(accent);
        painter->drawRoundedRect(QStyle::visualRect(item.direction, row, bar), 1, 1);
    }
    if (focused) {
        painter->setBrush(Qt::NoBrush);
        painter->setPen(accent);
        painter->drawRoundedRect(QRectF(row).adjusted(0.5, 0.5, -0.5, -0.5), 4, 4);
    }

    const QStyle* style = item.widget ? item.widget->style() : QApplication::style();
    const int mark = style->pixelMetric(QStyle::PM_SmallIconSize, &item, item.widget);
    QRect line = row.adjusted(kGap, 0, -kGap, 0);
    QRect markRect(line.left(), line.center().y() - mark / 2, mark, mark);
    markRect = QStyle::visualRect(item.direction, line, markRect);
    if (heading) {
        QStyleOption arrow = item;
        arrow.rect = markRect.adjusted(mark / 4, mark / 4, -mark / 4, -mark / 4);
        arrow.palette.setColor(QPalette::ButtonText, dim);
        const bool open = static_cast<const QTreeWidget*>(item.widget)->isExpanded(index);
        style->drawPrimitive(open ? QStyle::PE_IndicatorArrowDown : QStyle::PE_IndicatorArrowRight, &arrow,
                             painter, item.widget);
    } else {
        item.icon.paint(painter, markRect);
    }
    line.setLeft(line.left() + mark + kGap);

    painter->setFont(item.font);
    const int right = int(QStyle::visualAlignment(item.direction, Qt::AlignRight) | Qt::AlignVCenter);
    const int left = int(QStyle::visualAlignment(item.direction, Qt::AlignLeft) | Qt::AlignVCenter);
    const QString detail = item.fontMetrics.elidedText(index.data(SideTree::DetailRole).toString(),
                                                       Qt::ElideMiddle, line.width() / 2);
    const QRect whole = row.adjusted(kGap, 0, -kGap, 0);
    painter->setPen(dim);
    painter->drawText(QStyle::visualRect(item.direction, whole, line), right | Qt::TextSingleLine, detail);
    const int taken = detail.isEmpty() ? 0 : item.fontMetrics.horizontalAdvance(detail) + kGap;
    line.setRight(line.right() - taken);
    painter->setPen(heading || index.data(SideTree::DimmedRole).toBool() ? dim : ink);
    painter->drawText(QStyle::visualRect(item.direction, whole, line), left | Qt::TextSingleLine,
                      item.fontMetrics.elidedText(item.text, Qt::ElideMiddle, line.width()));
    painter->restore();
}

QSize SideTreeDelegate::sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const
{
    const QSize least = QStyledItemDelegate::sizeHint(option, index); // the style's target for a finger
    return {0, std::max(least.height(), option.fontMetrics.height() + 12)};
}

} // namespace mirel
