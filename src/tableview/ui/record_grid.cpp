#include "tableview/ui/record_grid.h"

#include "platform/ui/look_roles.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "tableview/scroll_scale.h"
#include "tableview/ui/empty_note.h"
#include "tableview/ui/grid_header.h"

#include <QEvent>
#include <QInputDevice>
#include <QPaintEvent>
#include <QPainter>
#include <QScrollBar>
#include <QScroller>
#include <QStyle>

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

// Air around the text of a cell.
struct CellAir {
    int sidePx;
    int abovePx; // and below
};
constexpr CellAir kDesktopAir{6, 4};
constexpr CellAir kHandheldAir{3, 2};

constexpr float kRowTint = 0.14F;
constexpr float kBlockTint = 0.26F;

// The fraction of a number, its point included; the whole of other texts has none.
QStringView FractionOf(QStringView number)
{
    const qsizetype point = number.indexOf(u'.');
    return point < 0 ? QStringView() : number.mid(point);
}

} // namespace

RecordGrid::RecordGrid(const RecordBrowser& browser, QWidget* parent)
    : QAbstractScrollArea(parent)
    , browser_(browser)
    , header_(new GridHeader(layout_, browser.Page(), this))
    , empty_(new EmptyNote(viewport()))
{
    connect(empty_, &EmptyNote::commandRequested, this, &RecordGrid::commandRequested);
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
    handheld_ = IsHandheldSize(window()->size());
    const CellAir& air = handheld_ ? kHandheldAir : kDesktopAir;
    marginPx_ = air.sidePx;
    header_->SetMargin(marginPx_);
    rowHeightPx_ = std::max(text_->LineHeight() + 2 * air.abovePx, HasTouchScreen() ? kTouchRowPx : kRowPx);
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
    return {rowHeightPx_ * 4, rowHeightPx_ * 2};
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
    if (otherColumns) {
        shownColumns_ = browser_.ColumnsRevision();
        layout_.Reset(browser_.Page().ColumnCount());
    }
    if (shownPage_ != browser_.PageRevision() || otherColumns) {
        shownPage_ = browser_.PageRevision();
        if (browser_.Settings().autoSizing || otherColumns)
            FitToContent(otherColumns ? Fit::Whole : Fit::Grow);
        if (otherColumns)
            TakeUpWidths();
    }
    const RecordBrowser::ColumnSort sort = browser_.CurrentSort();
    header_->SetArrow(sort.field, sort.direction == SortDirection::Ascending ? GridHeader::Arrow::Ascending
                                                                             : GridHeader::Arrow::Descending);
    UpdateScrollBars();
    if (shownField_ != browser_.SelectedField())
        ScrollToSelectedColumn();
    ShowEmptyNote();
    header_->update();
    viewport()->update();
}

void RecordGrid::ShowEmptyNote()
{
    const bool filtered = browser_.IsFiltered();
    if (!browser_.IsOpen() || !browser_.IsEmpty())
        empty_->hide();
    else if (filtered)
        empty_->Show(StringText(Str::EmptyFiltered), TableCommand::RemoveFilter);
    else if (browser_.CanUpdate())
        empty_->Show(StringText(Str::EmptyTable), TableCommand::NewRecord);
    else
        empty_->Show(StringText(Str::EmptyResult), {});
    empty_->setGeometry(viewport()->rect());
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
    if (browser_.CurrentPresentation() == Presentation::List) {
        widthsByHand_.insert(browser_.Page().columns[size_t(column)].title, layout_.WidthPx(column));
        return;
    }
    if (column == 0)
        detailNamesPx_ = layout_.WidthPx(0);
    FitDetail();
}

void RecordGrid::FitAllColumns()
{
    if (browser_.CurrentPresentation() == Presentation::List)
        widthsByHand_.clear();
    else
        detailNamesPx_ = 0;
    FitToContent(Fit::Whole);
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
    layout_.FitToPage(column);
    TakeUpContent(column);
    TakeContentWidths();
    UpdateScrollBars();
    header_->update();
    viewport()->update();
}

// No column is wider than the view, so that a whole one can always be seen at once.
void RecordGrid::FitToContent(Fit fit)
{
    for (int column = 0; column < layout_.Count(); ++column) {
        if (fit == Fit::Whole)
            layout_.FitToPage(column);
        TakeUpContent(column);
    }
    TakeContentWidths();
}

void RecordGrid::TakeContentWidths()
{
    layout_.TakeContentWidths(marginPx_, std::max(viewport()->width(), ColumnLayout::kNarrowestPx));
    if (browser_.CurrentPresentation() == Presentation::Detail && layout_.Count() == 2)
        FitDetail();
}

void RecordGrid::TakeUpContent(int column)
{
    const RecordPage& page = browser_.Page();
    const PageColumn& shown = page.columns[size_t(column)];
    layout_.Grow(column, {.wholePx = header_->WidthFor(shown.title) - 2 * marginPx_ - layout_.FractionPx(column)});
    for (int row = 0; row < page.RowCount(); ++row) {
        const QString& text = page.At(row, column).text;
        const QStringView fraction = shown.rightAligned ? FractionOf(text) : QStringView();
        const int fractionPx = fraction.isEmpty() ? 0 : text_->WidthOf(fraction.toString());
        layout_.Grow(column, {text_->WidthOf(text) - fractionPx, fractionPx});
    }
}

// A single record is read from top to bottom, never sideways: its values take the room that the names leave.
void RecordGrid::FitDetail()
{
    const int room = viewport()->width();
    const int most = room - std::max(room / 5, ColumnLayout::kNarrowestPx);
    const int names = detailNamesPx_ > 0 ? detailNamesPx_ : std::min(layout_.WidthPx(0), room * 2 / 5);
    layout_.SetWidth(0, std::min(names, most));
    layout_.SetWidth(1, room - layout_.WidthPx(0));
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
    shownField_ = browser_.SelectedField();
    const int column = browser_.SelectedColumn();
    if (column < 0)
        return;
    QScrollBar* bar = horizontalScrollBar();
    const int left = layout_.LeftPx(column);
    const int right = left + layout_.WidthPx(column);
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
        painter.fillRect(filled, Blend(ColorOfRole(LookRole::Accent, palette()),
                                       ColorOfRole(LookRole::Base, palette()), kRowTint));
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
    painter.fillRect(filled, Blend(ColorOfRole(LookRole::Accent, palette()),
                                   ColorOfRole(LookRole::Base, palette()), kBlockTint));
}

QString RecordGrid::ShownText(int row, int column) const
{
    const bool edited =
        browser_.HasPendingEdit() && row == browser_.SelectedRow() && column == browser_.SelectedColumn();
    return LinePainter::SingleLine(edited ? browser_.SelectedText() : browser_.Page().At(row, column).text);
}

bool RecordGrid::IsDetailName(int column) const
{
    return column == 0 && browser_.CurrentPresentation() == Presentation::Detail;
}

void RecordGrid::PaintCell(QPainter& painter, int row, int column, const QRect& rect)
{
    const QString text = ShownText(row, column);
    const bool right = browser_.Page().columns[size_t(column)].rightAligned;
    const QRect inner = rect.adjusted(marginPx_, 0, -marginPx_ - 1, 0);
    if (text.isEmpty() && browser_.Page().At(row, column).isNull) {
        const int dash = text_->LineHeight() / 2;
        painter.setPen(ColorOfRole(LookRole::Dim, palette()));
        painter.drawLine(right ? inner.right() - dash : inner.left(), inner.center().y(),
                         right ? inner.right() : inner.left() + dash, inner.center().y());
        return;
    }
    painter.setPen(ColorOfRole(IsDetailName(column) ? LookRole::Dim : LookRole::Text, palette()));
    if (right)
        PaintNumber(painter, column, inner, text);
    else if (IsDetailName(column)) // names differ at their ends
        text_->Draw(painter, inner, fontMetrics().elidedText(text, Qt::ElideMiddle, inner.width()), Qt::AlignLeft);
    else
        text_->Draw(painter, inner, text, Qt::AlignLeft);
}

// The points of a column stand under one another; a column too narrow for that gives up the room behind them.
void RecordGrid::PaintNumber(QPainter& painter, int column, const QRect& inner, const QString& number)
{
    int behind = layout_.FractionPx(column);
    if (const QStringView fraction = FractionOf(number); behind > 0 && !fraction.isEmpty())
        behind -= text_->WidthOf(fraction.toString());
    if (behind > 0)
        behind = std::clamp(inner.width() - text_->WidthOf(number), 0, behind);
    text_->Draw(painter, inner.adjusted(0, 0, -behind, 0), number, Qt::AlignRight);
}

void RecordGrid::PaintGridLines(QPainter& painter, const QRect& dirty) const
{
    const QColor color = ColorOfRole(LookRole::Line, palette());
    const int bottom = browser_.Page().RowCount() * rowHeightPx_ - 1;
    const int right = layout_.TotalPx() - horizontalScrollBar()->value() - 1;
    for (int y = rowHeightPx_ - 1; y <= std::min(bottom, dirty.bottom()); y += rowHeightPx_)
        painter.fillRect(0, y, right + 1, 1, color); // many times quicker than a line
    if (bottom < 0)
        return;
    int x = -horizontalScrollBar()->value() - 1;
    for (int column = 0; column < layout_.Count(); ++column) {
        x += layout_.WidthPx(column);
        if (x >= dirty.left() && x <= dirty.right())
            painter.fillRect(x, 0, 1, bottom + 1, color);
    }
}

void RecordGrid::PaintSelection(QPainter& painter) const
{
    const int row = browser_.SelectedRow();
    const int column = browser_.SelectedColumn();
    if (row < 0 || column < 0)
        return;
    QPen pen(ColorOfRole(LookRole::Accent, palette()), 2);
    pen.setJoinStyle(Qt::MiterJoin);
    painter.setPen(pen);
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(CellRect(row, column).adjusted(1, 1, -2, -2));
}

// --- size and style -----------------------------------------------------------------------------------------

void RecordGrid::resizeEvent(QResizeEvent*)
{
    if (IsHandheldSize(window()->size()) != handheld_)
        TakeUpFont();
    PlaceHeader();
    const int rows = std::max(viewport()->height() / rowHeightPx_, 1);
    if (rows != browser_.RowsPerPage())
        Q_EMIT rowsPerPageChanged(rows);
    if (browser_.Settings().autoSizing)
        FitToContent(Fit::Grow);
    empty_->setGeometry(viewport()->rect());
    UpdateScrollBars();
}

void RecordGrid::changeEvent(QEvent* event)
{
    QAbstractScrollArea::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange) {
        TakeUpFont();
        FitToContent(Fit::Whole);
        TakeUpWidths();
        resizeEvent(nullptr);
    }
}

} // namespace mirel
