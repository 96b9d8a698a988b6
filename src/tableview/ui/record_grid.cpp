#include "tableview/ui/record_grid.h"

#include "tableview/scroll_scale.h"
#include "tableview/ui/grid_header.h"

#include <QEvent>
#include <QInputDevice>
#include <QPaintEvent>
#include <QPainter>
#include <QScrollBar>
#include <QScroller>
#include <QStyle>
#include <QStyleOption>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kTouchRowPx = 32;
constexpr int kRowPx = 24; // the smallest row that a stylus hits

bool HasTouchScreen()
{
    return std::ranges::any_of(QInputDevice::devices(), [](const QInputDevice* device) {
        return device->type() == QInputDevice::DeviceType::TouchScreen;
    });
}

QColor Blend(const QColor& over, const QColor& under, qreal strength)
{
    const auto mix = [strength](float a, float b) { return a * float(strength) + b * float(1 - strength); };
    return QColor::fromRgbF(mix(over.redF(), under.redF()), mix(over.greenF(), under.greenF()),
                            mix(over.blueF(), under.blueF()));
}

} // namespace

RecordGrid::RecordGrid(const RecordBrowser& browser, QWidget* parent)
    : QAbstractScrollArea(parent)
    , browser_(browser)
    , header_(new GridHeader(layout_, browser.Page(), this))
{
    header_->setObjectName(QStringLiteral("header"));
    setFocusPolicy(Qt::StrongFocus);
    viewport()->setBackgroundRole(QPalette::Base);
    verticalScrollBar()->setTracking(false); // a drag shows where it is; only its end reads the page
    connect(verticalScrollBar(), &QScrollBar::sliderMoved, this, [this](int value) {
        Q_EMIT thumbDragged(ScrollScale(browser_.HighestScrollPosition()).PositionOf(value));
    });
    connect(header_, &GridHeader::columnTapped, this, &RecordGrid::headerTapped);
    connect(header_, &GridHeader::edgeDoubleTapped, this, &RecordGrid::FitColumn);
    connect(header_, &GridHeader::widthChanged, this, [this](int column) {
        KeepWidth(column);
        UpdateScrollBars();
        header_->update();
        viewport()->update();
    });
    QScroller::grabGesture(viewport(), QScroller::TouchGesture);
    TakeUpFont();
}

RecordGrid::~RecordGrid() = default;

void RecordGrid::TakeUpFont()
{
    text_.emplace(font());
    marginPx_ = style()->pixelMetric(QStyle::PM_FocusFrameHMargin, nullptr, this) + 2;
    header_->SetMargin(marginPx_);
    rowHeightPx_ = std::max(text_->LineHeight() + 4, HasTouchScreen() ? kTouchRowPx : kRowPx);
    PlaceHeader();
}

void RecordGrid::PlaceHeader()
{
    const int height = std::max(header_->sizeHint().height(), kRowPx);
    setViewportMargins(0, height, 0, 0);
    header_->setGeometry(viewport()->x(), viewport()->y() - height, viewport()->width(), height);
}

QSize RecordGrid::minimumSizeHint() const
{
    return {rowHeightPx_ * 4, rowHeightPx_ * 4};
}

QSize RecordGrid::sizeHint() const
{
    return {rowHeightPx_ * 30, rowHeightPx_ * 20};
}

QRect RecordGrid::CellRect(int row, int column) const
{
    const int left = layout_.LeftPx(column) - horizontalScrollBar()->value();
    return {left, row * rowHeightPx_, layout_.WidthPx(column), rowHeightPx_};
}

// --- what the browser shows ---------------------------------------------------------------------------------

void RecordGrid::ShowState()
{
    const bool otherColumns = shownColumns_ != browser_.ColumnsRevision();
    const int widthBefore = layout_.TotalPx();
    if (otherColumns) {
        shownColumns_ = browser_.ColumnsRevision();
        layout_.Reset(browser_.Page().ColumnCount());
        shownColumn_ = -1;
    }
    if (shownPage_ != browser_.PageRevision() || otherColumns) {
        shownPage_ = browser_.PageRevision();
        if (browser_.Settings().autoSizing || otherColumns)
            FitToContent(otherColumns);
        if (otherColumns)
            TakeUpWidths();
    }
    const RecordBrowser::ColumnSort sort = browser_.CurrentSort();
    header_->SetArrow(sort.field, sort.direction == SortDirection::Ascending ? GridHeader::Arrow::Ascending
                                                                             : GridHeader::Arrow::Descending);
    UpdateScrollBars();
    if (shownColumn_ != browser_.SelectedColumn() || layout_.TotalPx() != widthBefore)
        ScrollToSelectedColumn();
    header_->update();
    viewport()->update();
}

void RecordGrid::SetWidthsByHand(const ColumnWidths& widths)
{
    widthsByHand_ = widths;
    TakeUpWidths();
    UpdateScrollBars();
    header_->update();
    viewport()->update();
}

void RecordGrid::TakeUpWidths()
{
    if (browser_.CurrentPresentation() == Presentation::Detail)
        return;
    for (int column = 0; column < layout_.Count(); ++column) {
        const auto width = widthsByHand_.constFind(browser_.Page().columns[size_t(column)].title);
        if (width != widthsByHand_.constEnd())
            layout_.SetByHand(column, *width);
    }
}

void RecordGrid::KeepWidth(int column)
{
    if (browser_.CurrentPresentation() == Presentation::List)
        widthsByHand_.insert(browser_.Page().columns[size_t(column)].title, layout_.WidthPx(column));
}

void RecordGrid::FitAllColumns()
{
    if (browser_.CurrentPresentation() == Presentation::List)
        widthsByHand_.clear();
    FitToContent(true);
    UpdateScrollBars();
    header_->update();
    viewport()->update();
}

void RecordGrid::FitColumn(int column)
{
    if (column < 0 || column >= layout_.Count())
        return;
    if (browser_.CurrentPresentation() == Presentation::List)
        widthsByHand_.remove(browser_.Page().columns[size_t(column)].title);
    layout_.Fit(column, ContentWidth(column));
    UpdateScrollBars();
    header_->update();
    viewport()->update();
}

void RecordGrid::FitToContent(bool alsoByHand)
{
    for (int column = 0; column < layout_.Count(); ++column) {
        if (alsoByHand || !layout_.IsByHand(column))
            layout_.Fit(column, ContentWidth(column));
    }
    if (browser_.CurrentPresentation() == Presentation::Detail && layout_.Count() == 2)
        FitDetail();
}

// No wider than the view, so that a whole column can always be seen at once.
int RecordGrid::ContentWidth(int column) const
{
    const RecordPage& page = browser_.Page();
    int width = header_->WidthFor(page.columns[size_t(column)].title);
    for (int row = 0; row < page.RowCount(); ++row)
        width = std::max(width, text_->WidthOf(page.At(row, column).text) + 2 * marginPx_ + 1);
    return std::min(width, std::max(viewport()->width(), ColumnLayout::kNarrowestPx));
}

// A single record is read from top to bottom, never sideways: its values take the room that the names leave.
void RecordGrid::FitDetail()
{
    const int room = viewport()->width();
    layout_.Fit(0, std::min(layout_.WidthPx(0), room * 2 / 5));
    layout_.Fit(1, room - layout_.WidthPx(0));
}

void RecordGrid::UpdateScrollBars()
{
    syncing_ = true;
    const ScrollScale scale(browser_.HighestScrollPosition());
    QScrollBar* bar = verticalScrollBar();
    bar->setRange(0, scale.HighestValue());
    bar->setPageStep(browser_.RowsPerPage());
    if (!bar->isSliderDown())
        bar->setValue(scale.ValueOf(browser_.ScrollPosition()));
    horizontalScrollBar()->setRange(0, std::max(layout_.TotalPx() - viewport()->width(), 0));
    horizontalScrollBar()->setPageStep(viewport()->width());
    horizontalScrollBar()->setSingleStep(rowHeightPx_);
    header_->SetOffset(horizontalScrollBar()->value());
    syncing_ = false;
}

void RecordGrid::ScrollToSelectedColumn()
{
    shownColumn_ = browser_.SelectedColumn();
    if (shownColumn_ < 0)
        return;
    QScrollBar* bar = horizontalScrollBar();
    const int left = layout_.LeftPx(shownColumn_);
    const int right = left + layout_.WidthPx(shownColumn_);
    if (right > bar->value() + viewport()->width())
        bar->setValue(right - viewport()->width());
    if (left < bar->value())
        bar->setValue(left);
}

// --- painting -----------------------------------------------------------------------------------------------

void RecordGrid::paintEvent(QPaintEvent* event)
{
    QPainter painter(viewport());
    painter.setFont(font());
    const RecordPage& page = browser_.Page();
    for (int row = 0; row < page.RowCount(); ++row)
        PaintRow(painter, row, event->rect());
    PaintGridLines(painter, event->rect());
    PaintSelection(painter);
}

void RecordGrid::PaintRow(QPainter& painter, int row, const QRect& dirty)
{
    const QRect band(0, row * rowHeightPx_, viewport()->width(), rowHeightPx_);
    if (!band.intersects(dirty))
        return;
    if (browser_.HasBlock()) {
        PaintBlock(painter, row, band);
    } else if (row == browser_.SelectedRow()) {
        const QRect filled = band.intersected(QRect(0, 0, CellRect(row, layout_.Count() - 1).right(), height()));
        painter.fillRect(filled,
                         Blend(palette().color(QPalette::Highlight), palette().color(QPalette::Base), 0.2));
    }
    for (int column = 0; column < layout_.Count(); ++column) {
        const QRect rect = CellRect(row, column);
        if (rect.intersects(dirty))
            PaintCell(painter, row, column, rect);
    }
}

void RecordGrid::PaintBlock(QPainter& painter, int row, const QRect& band) const
{
    const CellBlock block = browser_.Block();
    if (!block.Contains({browser_.ScrollPosition() + row, block.firstColumn}))
        return;
    QRect filled = CellRect(row, block.firstColumn).united(CellRect(row, block.lastColumn));
    filled = filled.intersected(band);
    painter.fillRect(filled, Blend(palette().color(QPalette::Highlight), palette().color(QPalette::Base), 0.3));
}

void RecordGrid::PaintCell(QPainter& painter, int row, int column, const QRect& rect)
{
    const bool edited =
        browser_.HasPendingEdit() && row == browser_.SelectedRow() && column == browser_.SelectedColumn();
    const PageCell& cell = browser_.Page().At(row, column);
    const bool right = browser_.Page().columns[size_t(column)].rightAligned;
    const QRect inner = rect.adjusted(marginPx_, 0, -marginPx_ - 1, 0);
    if (cell.isNull && !edited) {
        const int dash = text_->LineHeight() / 2;
        painter.setPen(palette().color(QPalette::PlaceholderText));
        painter.drawLine(right ? inner.right() - dash : inner.left(), inner.center().y(),
                         right ? inner.right() : inner.left() + dash, inner.center().y());
        return;
    }
    const bool isName = browser_.Page().columns[size_t(column)].field < 0 && column == 0 &&
                        browser_.CurrentPresentation() == Presentation::Detail;
    painter.setPen(palette().color(isName ? QPalette::PlaceholderText : QPalette::Text));
    text_->Draw(painter, inner, LinePainter::SingleLine(edited ? browser_.SelectedText() : cell.text),
                right ? Qt::AlignRight : Qt::AlignLeft);
}

void RecordGrid::PaintGridLines(QPainter& painter, const QRect& dirty) const
{
    QStyleOption option;
    option.initFrom(this);
    const int hint = style()->styleHint(QStyle::SH_Table_GridLineColor, &option, this);
    painter.setPen(QColor::fromRgb(QRgb(hint)));
    const int bottom = browser_.Page().RowCount() * rowHeightPx_ - 1;
    const int right = layout_.TotalPx() - horizontalScrollBar()->value() - 1;
    for (int y = rowHeightPx_ - 1; y <= std::min(bottom, dirty.bottom()); y += rowHeightPx_)
        painter.drawLine(0, y, right, y);
    if (bottom < 0)
        return;
    int x = -horizontalScrollBar()->value() - 1;
    for (int column = 0; column < layout_.Count(); ++column) {
        x += layout_.WidthPx(column);
        if (x >= dirty.left() && x <= dirty.right())
            painter.drawLine(x, 0, x, bottom);
    }
}

void RecordGrid::PaintSelection(QPainter& painter) const
{
    const int row = browser_.SelectedRow();
    const int column = browser_.SelectedColumn();
    if (row < 0 || column < 0)
        return;
    QPen pen(palette().color(QPalette::Highlight), 2);
    pen.setJoinStyle(Qt::MiterJoin);
    painter.setPen(pen);
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(CellRect(row, column).adjusted(1, 1, -2, -2));
}

// --- size and style -----------------------------------------------------------------------------------------

void RecordGrid::resizeEvent(QResizeEvent*)
{
    PlaceHeader();
    const int rows = std::max(viewport()->height() / rowHeightPx_, 1);
    if (rows != browser_.RowsPerPage())
        Q_EMIT rowsPerPageChanged(rows);
    if (browser_.Settings().autoSizing)
        FitToContent(false);
    UpdateScrollBars();
}

void RecordGrid::changeEvent(QEvent* event)
{
    QAbstractScrollArea::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange) {
        TakeUpFont();
        resizeEvent(nullptr);
    }
}

} // namespace mirel
