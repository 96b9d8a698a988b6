#include "platform/ui/entry_list.h"

#include "resources/ui/theme_icon.h"

#include <QApplication>
#include <QKeyEvent>
#include <QPainter>

namespace mirel {
namespace {

enum Role { DetailRole = Qt::UserRole, DimmedRole };

// Between the second line's colour and the first's: the more, the fainter.
constexpr qreal kFaintness = 0.38;

QColor Faint(const QColor& ink, const QColor& ground)
{
    const auto mix = [](int a, int b) { return int(a + (b - a) * kFaintness); };
    return {mix(ink.red(), ground.red()), mix(ink.green(), ground.green()), mix(ink.blue(), ground.blue())};
}

int PaddingOf(const QStyleOptionViewItem& option)
{
    return option.fontMetrics.height() / 3;
}

} // namespace

class EntryList::Model : public QAbstractListModel {
public:
    using QAbstractListModel::QAbstractListModel;

    // Only a list that changed is reset: a reset would throw away the scroll position.
    bool SetLines(std::vector<EntryLine> lines)
    {
        if (lines == lines_)
            return false;
        beginResetModel();
        lines_ = std::move(lines);
        endResetModel();
        return true;
    }

    int rowCount(const QModelIndex& parent) const override { return parent.isValid() ? 0 : int(lines_.size()); }

    QVariant data(const QModelIndex& index, int role) const override
    {
        const EntryLine& line = lines_[size_t(index.row())];
        switch (role) {
        case Qt::DisplayRole:
            return line.name;
        case Qt::ToolTipRole:
            return line.toolTip;
        case Qt::DecorationRole:
            return ThemeIcon(line.icon);
        case Qt::AccessibleDescriptionRole:
        case DetailRole:
            return line.detail;
        case DimmedRole:
            return line.dimmed;
        default:
            return {};
        }
    }

private:
    std::vector<EntryLine> lines_;
};

EntryList::EntryList(QWidget* parent)
    : QListView(parent)
    , model_(new Model(this))
{
    setModel(model_);
    setItemDelegate(new EntryDelegate(this));
    setUniformItemSizes(false);
    setEditTriggers(NoEditTriggers);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollMode(ScrollPerPixel);
    setContextMenuPolicy(Qt::CustomContextMenu);
    const auto tapped = [this](Tap tap) {
        return [this, tap](const QModelIndex& index) { Q_EMIT Tapped(index.row(), tap); };
    };
    connect(this, &QListView::clicked, this, tapped(Tap::Single));
    connect(this, &QListView::doubleClicked, this, tapped(Tap::Double));
    connect(selectionModel(), &QItemSelectionModel::currentRowChanged, this, [this](const QModelIndex& current) {
        if (!filling_)
            Q_EMIT RowChanged(current.row());
    });
}

void EntryList::SetLines(std::vector<EntryLine> lines)
{
    filling_ = true;
    model_->SetLines(std::move(lines));
    filling_ = false;
}

void EntryList::SetRow(int row)
{
    filling_ = true;
    setCurrentIndex(row < 0 ? QModelIndex() : model_->index(row));
    filling_ = false;
}

int EntryList::HeightOfAll() const
{
    int height = 2 * frameWidth();
    for (int row = 0; row < model_->rowCount({}); ++row)
        height += sizeHintForRow(row);
    return height;
}

void EntryList::keyPressEvent(QKeyEvent* event)
{
    const bool enter = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (enter && event->modifiers() == (event->modifiers() & Qt::KeypadModifier) && Row() >= 0) {
        Q_EMIT EnterPressed(Row());
        return;
    }
    QListView::keyPressEvent(event);
}

void EntryDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const
{
    QStyleOptionViewItem item = option;
    initStyleOption(&item, index);
    const QIcon icon = item.icon;
    const QString name = item.text;
    item.text.clear();
    item.icon = {};
    const QStyle* style = item.widget ? item.widget->style() : QApplication::style();
    style->drawControl(QStyle::CE_ItemViewItem, &item, painter, item.widget); // ground, selection, focus

    const bool selected = item.state.testFlag(QStyle::State_Selected);
    const auto group = item.state.testFlag(QStyle::State_Active) ? QPalette::Active : QPalette::Inactive;
    const QColor ground = item.palette.color(group, selected ? QPalette::Highlight : QPalette::Base);
    QColor ink = item.palette.color(group, selected ? QPalette::HighlightedText : QPalette::Text);
    if (index.data(DimmedRole).toBool())
        ink = Faint(ink, ground);

    const int padding = PaddingOf(item);
    const int iconSize = style->pixelMetric(QStyle::PM_SmallIconSize, &item, item.widget) * 5 / 4;
    const QRect inner = item.rect.adjusted(padding, 0, -padding, 0);
    QRect iconRect(0, 0, iconSize, iconSize);
    iconRect.moveCenter(QPoint(inner.left() + iconSize / 2, inner.center().y()));
    icon.paint(painter, QStyle::visualRect(item.direction, item.rect, iconRect), Qt::AlignCenter,
               selected ? QIcon::Selected : QIcon::Normal);

    const QString detail = index.data(DetailRole).toString();
    const int lineHeight = item.fontMetrics.height();
    const int textHeight = detail.isEmpty() ? lineHeight : 2 * lineHeight;
    QRect line(inner.left() + iconSize + padding, inner.center().y() + 1 - textHeight / 2,
               inner.width() - iconSize - padding, lineHeight);
    painter->save();
    painter->setFont(item.font);
    for (const auto& [text, colour] : {std::pair(name, ink), std::pair(detail, Faint(ink, ground))}) {
        painter->setPen(colour);
        painter->drawText(QStyle::visualRect(item.direction, item.rect, line),
                          int(QStyle::visualAlignment(item.direction, Qt::AlignLeft) | Qt::AlignVCenter) |
                              Qt::TextSingleLine,
                          item.fontMetrics.elidedText(text, Qt::ElideMiddle, line.width()));
        line.translate(0, lineHeight);
    }
    painter->restore();
}

QSize EntryDelegate::sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const
{
    const QSize least = QStyledItemDelegate::sizeHint(option, index); // the style's target for a finger
    const int lines = index.data(DetailRole).toString().isEmpty() ? 1 : 2;
    // The width is the list's: longer names are cut, never scrolled to.
    return {0, std::max(least.height(), lines * option.fontMetrics.height() + PaddingOf(option) * 2)};
}

} // namespace mirel
