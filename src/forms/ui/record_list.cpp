#include "forms/ui/record_list.h"

#include "tableview/scroll_scale.h"

#include <QGuiApplication>
#include <QHeaderView>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QScrollBar>
#include <QStandardItemModel>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kLeastRowPx = 20;
constexpr int kLeastColumnChars = 8;
constexpr int kMarginPx = 6;
constexpr int kWheelRows = 3;

// Behind the point, and the point itself: what stands to the right of where numbers meet.
int FractionWidth(const QFontMetrics& metrics, const QString& number)
{
    const qsizetype point = number.indexOf(u'.');
    return point < 0 ? 0 : metrics.horizontalAdvance(number.sliced(point));
}

QString SingleLine(QString text)
{
    std::ranges::replace_if(
        text, [](QChar sign) { return sign == u'\n' || sign == u'\r' || sign == u'\t'; }, QChar(u' '));
    return text;
}

} // namespace

RecordList::RecordList(ControlWidget::ListSource source, QWidget* parent)
    : QAbstractScrollArea(parent)
    , source_(std::move(source))
    , names_(new QStandardItemModel(this))
    , header_(new QHeaderView(Qt::Horizontal, this))
{
    setFocusPolicy(Qt::StrongFocus);
    viewport()->setBackgroundRole(QPalette::Base);
    header_->setModel(names_);
    header_->setSectionsClickable(true);
    header_->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    header_->setHighlightSections(false);
    header_->setMinimumSectionSize(2 * kMarginPx);
    connect(header_, &QHeaderView::sectionClicked, this, &RecordList::headerTapped);
    header_->setAutoFillBackground(true);
    connect(header_, &QHeaderView::sectionResized, this, [this] {
        // The header sizes its last section by itself as well; and a form opened by a double click is laid out
        // while the button is down.
        const bool dragged =
            header_->viewport()->underMouse() && QGuiApplication::mouseButtons().testFlag(Qt::LeftButton);
        if (fitting_ || !dragged)
            return;
        sizedByHand_ = true;
        UpdateScrollBars();
        viewport()->update();
    });
}

void RecordList::SetColumns(const QStringList& names)
{
    columns_ = names;
    names_->clear();
    names_->setHorizontalHeaderLabels(names);
    PlaceHeader();
    FitColumns();
}

void RecordList::SetSortMark(int column, Qt::SortOrder order)
{
    header_->setSortIndicatorShown(column >= 0);
    if (column >= 0)
        header_->setSortIndicator(column, order);
}

void RecordList::SetRows(qint64 rows, qint64 selected)
{
    const bool moved = selected_ != selected;
    const bool first = rows_ == 0;
    rows_ = rows;
    selected_ = selected;
    top_ = std::clamp<qint64>(top_, 0, HighestTop());
    if (moved && selected_ >= 0)
        BringIntoSight(selected_);
    UpdateScrollBars();
    ReadRows();
    if (first)
        FitColumns();
    viewport()->update();
}

int RecordList::RowHeightPx() const
{
    return std::max(fontMetrics().height() + kMarginPx, kLeastRowPx);
}

int RecordList::WholeRows() const
{
    return std::max(viewport()->height() / RowHeightPx(), 1);
}

qint64 RecordList::HighestTop() const
{
    return std::max<qint64>(rows_ - WholeRows(), 0);
}

QRect RecordList::RowRect(qint64 row) const
{
    return {0, int(row - top_) * RowHeightPx(), viewport()->width(), RowHeightPx()};
}

void RecordList::PlaceHeader()
{
    const int height = names_->columnCount() > 0 ? std::max(header_->sizeHint().height(), kLeastRowPx) : 0;
    setViewportMargins(0, height, 0, 0);
    header_->setGeometry(viewport()->x(), viewport()->y() - height, viewport()->width(), height);
}

void RecordList::UpdateScrollBars()
{
    syncing_ = true;
    const ScrollScale scale(HighestTop());
    verticalScrollBar()->setRange(0, scale.HighestValue());
    verticalScrollBar()->setPageStep(WholeRows());
    verticalScrollBar()->setValue(scale.ValueOf(top_));
    horizontalScrollBar()->setRange(0, std::max(header_->length() - viewport()->width(), 0));
    horizontalScrollBar()->setPageStep(viewport()->width());
    horizontalScrollBar()->setSingleStep(fontMetrics().averageCharWidth() * kWheelRows);
    syncing_ = false;
}

void RecordList::ReadRows()
{
    const int visible = viewport()->height() / RowHeightPx() + 1;
    const int count = int(std::min<qint64>(visible, rows_ - top_));
    texts_ = count > 0 ? source_.rows(top_, count) : std::vector<QStringList>();
    MeasureNumbers();
}

// Numbers stand under one another by their points, headers above them.
void RecordList::MeasureNumbers()
{
    fractionPx_.assign(size_t(names_->columnCount()), -1);
    for (int column = 0; column < names_->columnCount(); ++column) {
        const bool number = source_.isNumber && source_.isNumber(column);
        QStandardItem* name = names_->horizontalHeaderItem(column);
        const Qt::Alignment side = (number ? Qt::AlignRight : Qt::AlignLeft) | Qt::AlignVCenter;
        if (name && name->textAlignment() != side)
            name->setTextAlignment(side);
        if (!number)
            continue;
        int& widest = fractionPx_[size_t(column)] = 0;
        for (const QStringList& row : texts_)
            widest = std::max(widest, FractionWidth(fontMetrics(), row.value(column)));
    }
}

void RecordList::DrawCell(QPainter& painter, QRect cell, int column, const QString& text) const
{
    const bool number = size_t(column) < fractionPx_.size() && fractionPx_[size_t(column)] >= 0;
    const int behind = number ? fractionPx_[size_t(column)] - FractionWidth(fontMetrics(), text) : 0;
    if (number && fontMetrics().horizontalAdvance(text) + behind <= cell.width())
        cell.setRight(cell.right() - behind);
    painter.drawText(cell, int(Qt::AlignVCenter | (number ? Qt::AlignRight : Qt::AlignLeft)) | Qt::TextSingleLine,
                     fontMetrics().elidedText(text, Qt::ElideRight, cell.width()));
}

QString RecordList::Shown(const QString& text) const
{
    const int most = source_.maxColumnChars();
    if (most < 0 || text.size() <= most)
        return SingleLine(text);
    return SingleLine(text.left(most)) + u'~';
}

// To the rows in sight, until the user sizes them. The last column takes what is left; where they do not fit, the
// widest one gives way, if that is enough and it stays readable.
void RecordList::FitColumns()
{
    if (sizedByHand_)
        return;
    fitting_ = true;
    header_->setStretchLastSection(false);
    for (int column = 0; column < names_->columnCount(); ++column) {
        int width = header_->sectionSizeHint(column);
        for (const QStringList& row : texts_)
            width = std::max(width, fontMetrics().horizontalAdvance(Shown(row.value(column))) + 3 * kMarginPx);
        header_->resizeSection(column, width);
    }
    NarrowWidestColumn();
    header_->setStretchLastSection(header_->length() <= viewport()->width());
    fitting_ = false;
    UpdateScrollBars();
}

void RecordList::NarrowWidestColumn()
{
    const int excess = header_->length() - viewport()->width();
    int widest = 0;
    for (int column = 1; column < names_->columnCount(); ++column) {
        if (header_->sectionSize(column) > header_->sectionSize(widest))
            widest = column;
    }
    const int room = header_->sectionSize(widest) - kLeastColumnChars * fontMetrics().averageCharWidth();
    if (excess > 0 && excess <= room)
        header_->resizeSection(widest, header_->sectionSize(widest) - excess);
}

void RecordList::BringIntoSight(qint64 row)
{
    if (row < top_)
        top_ = row;
    else if (row >= top_ + WholeRows())
        top_ = std::min(row - WholeRows() + 1, HighestTop());
}

// --- painting -----------------------------------------------------------------------------------------------

void RecordList::paintEvent(QPaintEvent*)
{
    QPainter painter(viewport());
    const int offset = horizontalScrollBar()->value();
    const QPalette::ColorGroup group = hasFocus() ? QPalette::Active : QPalette::Inactive;
    for (size_t i = 0; i < texts_.size(); ++i) {
        const QRect line = RowRect(top_ + qint64(i));
        const bool selected = top_ + qint64(i) == selected_;
        if (selected)
            painter.fillRect(line, palette().color(group, QPalette::Highlight));
        painter.setPen(palette().color(group, selected ? QPalette::HighlightedText : QPalette::Text));
        for (int column = 0; column < names_->columnCount(); ++column) {
            QRect cell(header_->sectionPosition(column) - offset, line.top(), header_->sectionSize(column),
                       line.height());
            cell.adjust(kMarginPx, 0, -kMarginPx, 0);
            DrawCell(painter, cell, column, Shown(texts_[i].value(column)));
        }
    }
}

void RecordList::focusInEvent(QFocusEvent* event)
{
    QAbstractScrollArea::focusInEvent(event);
    viewport()->update();
}

void RecordList::focusOutEvent(QFocusEvent* event)
{
    QAbstractScrollArea::focusOutEvent(event);
    viewport()->update();
}

// --- the user -----------------------------------------------------------------------------------------------

void RecordList::resizeEvent(QResizeEvent*)
{
    PlaceHeader();
    top_ = std::clamp<qint64>(top_, 0, HighestTop());
    UpdateScrollBars();
    ReadRows();
    FitColumns();
}

void RecordList::changeEvent(QEvent* event)
{
    QAbstractScrollArea::changeEvent(event);
    if (event->type() != QEvent::FontChange)
        return;
    header_->setFont(font());
    resizeEvent(nullptr);
}

void RecordList::keyPressEvent(QKeyEvent* event)
{
    const int page = std::max(WholeRows() - 1, 1);
    qint64 row = selected_;
    switch (event->modifiers() & ~Qt::KeypadModifier ? 0 : event->key()) {
    case Qt::Key_Up:
        row -= 1;
        break;
    case Qt::Key_Down:
        row += 1;
        break;
    case Qt::Key_PageUp:
        row -= page;
        break;
    case Qt::Key_PageDown:
        row += page;
        break;
    case Qt::Key_Home:
        row = 0;
        break;
    case Qt::Key_End:
        row = rows_ - 1;
        break;
    default:
        event->ignore();
        return;
    }
    if (rows_ > 0)
        Q_EMIT rowChosen(std::clamp<qint64>(row, 0, rows_ - 1));
}

void RecordList::mousePressEvent(QMouseEvent* event)
{
    const qint64 row = top_ + int(event->position().y()) / RowHeightPx();
    if (row < rows_)
        Q_EMIT rowChosen(row);
}

void RecordList::scrollContentsBy(int dx, int)
{
    if (syncing_)
        return;
    if (dx != 0)
        header_->setOffset(horizontalScrollBar()->value());
    const qint64 top = ScrollScale(HighestTop()).PositionOf(verticalScrollBar()->value());
    if (top != top_) {
        top_ = top;
        ReadRows();
    }
    viewport()->update();
}

// --- the control --------------------------------------------------------------------------------------------

ListWidget::ListWidget(const ControlRun& control, const ListSource& source, QWidget& surface)
    : ControlWidget(control, *new RecordList(source, &surface))
    , list_(static_cast<RecordList*>(Main()))
{
    SetColors(QPalette::Base, QPalette::Text);
    list_->SetColumns(control.columns);
    connect(list_, &RecordList::rowChosen, this, &ControlWidget::rowChosen);
    connect(list_, &RecordList::headerTapped, this, &ControlWidget::headerTapped);
}

void ListWidget::Show(const ControlRun& control)
{
    list_->SetSortMark(control.sortedColumn, control.sortedDescending ? Qt::DescendingOrder : Qt::AscendingOrder);
    list_->SetRows(control.rows, control.selectedRow);
}

} // namespace mirel
