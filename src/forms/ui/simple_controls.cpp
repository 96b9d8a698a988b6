#include "forms/ui/simple_controls.h"

#include "forms/ui/control_look.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalBlocker>

#include <algorithm>
#include <limits>

namespace mirel {
namespace {

constexpr int kLeastTargetPx = 24; // what a stylus hits

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
    ShowText();
}

// A label of one line stands in the middle, as the text of the box beside it does, and gives way in its own
// middle; a higher one breaks its lines.
void LabelWidget::ShowText()
{
    const bool single = label_->height() < 2 * label_->fontMetrics().height();
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
    const int line = box_->fontMetrics().height();
    if (box_->height() > 3 * line)
        box_->resize(box_->width(), std::min(box_->height(), std::max(box_->sizeHint().height(), 2 * line)));
}

int DropDownWidget::TextRoomPx(int heightPx) const
{
    return std::max(heightPx - 4, 1);
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

int ButtonWidget::TextRoomPx(int heightPx) const
{
    return std::max(heightPx - 4, 1);
}

// --- check box ----------------------------------------------------------------------------------------------

CheckBoxWidget::CheckBoxWidget(const ControlRun& control, QWidget& surface)
    : ControlWidget(control, *new QCheckBox(&surface))
    , box_(static_cast<QCheckBox*>(Main()))
{
    box_->setAutoFillBackground(Definition().backgroundColor != kDefaultColor);
    SetColors(QPalette::Window, QPalette::WindowText);
    connect(box_, &QCheckBox::clicked, this, &ControlWidget::ticked);
}

void CheckBoxWidget::Show(const ControlRun& control)
{
    box_->setChecked(control.ticked);
}

// The box stands where the form has it; what can be hit around it is as large as a stylus needs.
void CheckBoxWidget::Place(const SurfaceScale& scale)
{
    ControlWidget::Place(scale);
    const QRect place = box_->geometry();
    if (place.isEmpty())
        return;
    const int higher = std::max(kLeastTargetPx - place.height(), 0);
    box_->setGeometry(
        place.adjusted(0, -higher / 2, std::max(kLeastTargetPx - place.width(), 0), higher - higher / 2));
}

} // namespace mirel
