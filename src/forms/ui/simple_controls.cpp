#include "forms/ui/simple_controls.h"

#include "forms/ui/control_look.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalBlocker>
#include <QStyleOptionButton>
#include <QStylePainter>

#include <algorithm>
#include <cstdlib>
#include <limits>

namespace mirel {
namespace {

constexpr int kLeastTargetPx = 24;   // what a stylus hits
constexpr int kFramePx = 4;          // above and below a text together
constexpr qreal kLeastCaption = 0.6; // of its font: what a caption is narrowed to before it is cut
constexpr qreal kLeastLabel = 0.85;
constexpr int kMostSquarePx = 22; // of a check box

// A drop-down box whose items are read when its list is opened.
class LazyComboBox : public QComboBox {
public:
    using QComboBox::QComboBox;

    std::function<void()> beforeShowing;

    void showPopup() override
    {
        if (beforeShowing)
            beforeShowing();
        QComboBox::showPopup();
    }
};

} // namespace

// A check box without a caption, its square as large as the form has it. What can be hit around the square is as
// large as a stylus needs.
class TickBox : public QCheckBox {
public:
    using QCheckBox::QCheckBox;

    void WidenTarget()
    {
        square_ = QRect(QPoint(), size());
        const int higher = std::max(kLeastTargetPx - height(), 0);
        setGeometry(
            geometry().adjusted(0, -higher / 2, std::max(kLeastTargetPx - width(), 0), higher - higher / 2));
        square_.translate(0, higher / 2);
        const int side = std::min({square_.width(), square_.height(), kMostSquarePx});
        square_ = QRect(square_.left(), square_.center().y() - side / 2, side, side);
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QStylePainter painter(this);
        QStyleOptionButton option;
        initStyleOption(&option);
        option.rect = square_;
        painter.drawPrimitive(QStyle::PE_IndicatorCheckBox, option);
    }

    bool hitButton(const QPoint& position) const override { return rect().contains(position); }

private:
    QRect square_;
};

// --- label --------------------------------------------------------------------------------------------------

LabelWidget::LabelWidget(const ControlRun& control, QWidget& surface)
    : ControlWidget(control, *new QLabel(&surface))
    , label_(static_cast<QLabel*>(Main()))
{
    label_->setTextFormat(Qt::PlainText);
    label_->setFrameShape(Definition().windowStyle & style::kBorder ? QFrame::Box : QFrame::NoFrame);
    label_->setAutoFillBackground(Definition().backgroundColor != kDefaultColor);
    SetColors(QPalette::Window, QPalette::WindowText);
}

void LabelWidget::Show(const ControlRun& control)
{
    text_ = control.text;
    ShowText();
}

void LabelWidget::Place(const SurfaceScale& scale)
{
    ControlWidget::Place(scale);
    if (IsSingleLine())
        NarrowToFit(*label_, text_, label_->contentsRect().width(), kLeastLabel);
    ShowText();
}

// Both texts stand in the middle of their windows; the margin moves the label's to the base line of the box's.
void LabelWidget::AlignTextTo(const QWidget& box)
{
    if (!IsSingleLine())
        return;
    const auto baseLine = [](const QWidget& widget) {
        const QFontMetrics metrics = widget.fontMetrics();
        return widget.y() + (widget.height() + metrics.ascent() - metrics.descent()) / 2;
    };
    label_->setContentsMargins({});
    const int down = baseLine(box) - baseLine(*label_);
    if (std::abs(down) < label_->height() / 2)
        label_->setContentsMargins(0, std::max(2 * down, 0), 0, std::max(-2 * down, 0));
}

bool LabelWidget::IsSingleLine() const
{
    return Definition().height < 2 * LineHeightOf(Definition().textStyle);
}

// A label of one line stands in the middle, as the text of the box beside it does, and gives way in its own
// middle; a higher one breaks its lines.
void LabelWidget::ShowText()
{
    const bool single = IsSingleLine();
    label_->setWordWrap(!single);
    label_->setAlignment(AlignmentOf(Definition().windowStyle) | (single ? Qt::AlignVCenter : Qt::AlignTop));
    const QString shown =
        single ? label_->fontMetrics().elidedText(text_, Qt::ElideMiddle, label_->contentsRect().width()) : text_;
    label_->setText(shown);
    label_->setToolTip(shown == text_ ? QString() : text_.toHtmlEscaped());
}

// --- drop-down box ------------------------------------------------------------------------------------------

DropDownWidget::DropDownWidget(const ControlRun& control, QWidget& surface)
    : ControlWidget(control, *new LazyComboBox(&surface))
    , box_(static_cast<QComboBox*>(Main()))
{
    box_->setEditable(true);
    box_->setFocusPolicy(Qt::StrongFocus);
    box_->setInsertPolicy(QComboBox::NoInsert);
    box_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    box_->lineEdit()->setMaxLength(std::numeric_limits<int>::max());
    box_->lineEdit()->setAlignment(AlignmentOf(Definition().windowStyle & ~style::kAlignMask));
    SetColors(QPalette::Base, QPalette::Text);
    static_cast<LazyComboBox*>(box_)->beforeShowing = [this] { Q_EMIT itemsWanted(); };
    connect(box_->lineEdit(), &QLineEdit::textEdited, this, &ControlWidget::textEdited);
    connect(box_, &QComboBox::textActivated, this, &ControlWidget::textEdited);
}

void DropDownWidget::Show(const ControlRun& control)
{
    const QSignalBlocker quiet(box_);
    const bool sameItems = box_->count() == control.items.size() && [&] {
        for (int i = 0; i < box_->count(); ++i) {
            if (box_->itemText(i) != control.items[i])
                return false;
        }
        return true;
    }();
    if (!sameItems) {
        box_->clear();
        box_->addItems(control.items);
    }
    if (const int item = int(control.items.indexOf(control.text)); item != box_->currentIndex())
        box_->setCurrentIndex(item);
    if (box_->currentText() != control.text)
        box_->setEditText(control.text);
    if (!box_->hasFocus())
        box_->lineEdit()->setCursorPosition(0);
}

void DropDownWidget::Place(const SurfaceScale& scale)
{
    ControlWidget::Place(scale);
    // A stored height may be that of the box with its list let down.
    const ControlDef& definition = Definition();
    const int closed = LineHeightOf(definition.textStyle) + kFramePx;
    if (definition.height > 2 * closed)
        box_->resize(box_->width(), qRound(closed * scale.y));
}

int DropDownWidget::TextRoomPx(int heightPx) const
{
    return std::max(heightPx - kFramePx, 1);
}

bool DropDownWidget::OpenMore()
{
    box_->showPopup();
    return true;
}

// --- button -------------------------------------------------------------------------------------------------

ButtonWidget::ButtonWidget(const ControlRun& control, QWidget& surface)
    : ControlWidget(control, *new QPushButton(&surface))
    , button_(static_cast<QPushButton*>(Main()))
{
    SetColors(QPalette::Button, QPalette::ButtonText);
    connect(button_, &QPushButton::clicked, this, &ControlWidget::pressed);
}

void ButtonWidget::Show(const ControlRun& control)
{
    button_->setText(control.text);
}

void ButtonWidget::Place(const SurfaceScale& scale)
{
    ControlWidget::Place(scale);
    NarrowToFit(*button_, button_->text(), button_->width() - kFramePx, kLeastCaption);
}

int ButtonWidget::TextRoomPx(int heightPx) const
{
    return std::max(heightPx - kFramePx, 1);
}

// --- check box ----------------------------------------------------------------------------------------------

CheckBoxWidget::CheckBoxWidget(const ControlRun& control, QWidget& surface)
    : ControlWidget(control, *new TickBox(&surface))
    , box_(static_cast<TickBox*>(Main()))
{
    box_->setAutoFillBackground(Definition().backgroundColor != kDefaultColor);
    SetColors(QPalette::Window, QPalette::WindowText);
    connect(box_, &QCheckBox::clicked, this, &ControlWidget::ticked);
}

void CheckBoxWidget::Show(const ControlRun& control)
{
    box_->setChecked(control.ticked);
}

void CheckBoxWidget::Place(const SurfaceScale& scale)
{
    ControlWidget::Place(scale);
    box_->WidenTarget();
}

} // namespace mirel
