#include "app/ui/tour.h"

#include "platform/ui/look_roles.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QAbstractButton>
#include <QBoxLayout>
#include <QEvent>
#include <QFrame>
#include <QKeyEvent>
#include <QLabel>
#include <QPainter>
#include <QPainterPath>
#include <QPushButton>
#include <QToolButton>

#include <algorithm>
#include <utility>

namespace mirel {
namespace {

constexpr int kBubbleWidthChars = 38;
constexpr float kDimmed = 0.45F; // how dark it gets over what is not spoken of
constexpr int kRingPx = 2;

} // namespace

Tour::Tour(std::vector<TourStep> steps, QWidget& window)
    : QWidget(&window)
    , window_(window)
    , steps_(std::move(steps))
    , bubble_(new QFrame(this))
    , title_(new QLabel(bubble_))
    , text_(new QLabel(bubble_))
    , count_(new QLabel(bubble_))
    , back_(new QPushButton(StringText(Str::TourBack), bubble_))
    , next_(new QPushButton(bubble_))
{
    setAttribute(Qt::WA_DeleteOnClose);
    setFocusPolicy(Qt::StrongFocus);
    setAccessibleName(StringText(Str::CommandTour).remove(u'&'));
    MakeBubble();
    window_.installEventFilter(this);
    connect(back_, &QPushButton::clicked, this, [this] { GoTo(step_ - 1); });
    connect(next_, &QPushButton::clicked, this, [this] { GoTo(step_ + 1); });
    GoTo(0);
    show();
    raise();
    Place();
    next_->setFocus();
}

void Tour::MakeBubble()
{
    auto* frame = static_cast<QFrame*>(bubble_);
    frame->setFrameShape(QFrame::StyledPanel);
    frame->setAutoFillBackground(true);
    frame->setBackgroundRole(QPalette::Base);
    QFont bold = title_->font();
    bold.setBold(true);
    title_->setFont(bold);
    for (QLabel* label : {title_, text_}) {
        label->setWordWrap(true);
        label->setTextFormat(Qt::PlainText);
    }
    auto* cross = new QToolButton(bubble_);
    cross->setIcon(ThemeIcon(u"window-close"));
    cross->setAutoRaise(true);
    cross->setFocusPolicy(Qt::TabFocus);
    cross->setToolTip(
        StringText(Str::TipWithKeys,
                   {StringText(Str::TourClose), QKeySequence(Qt::Key_Escape).toString(QKeySequence::NativeText)}));
    cross->setAccessibleName(StringText(Str::TourClose));
    connect(cross, &QToolButton::clicked, this, &QWidget::close);
    auto* head = new QHBoxLayout;
    head->addWidget(title_, 1);
    head->addWidget(cross, 0, Qt::AlignTop);
    auto* foot = new QHBoxLayout;
    foot->addWidget(count_, 1);
    foot->addWidget(back_);
    foot->addWidget(next_);
    auto* lines = new QVBoxLayout(bubble_);
    lines->setContentsMargins(spacing::kRoom, spacing::kGap, spacing::kGap, spacing::kGap);
    lines->setSpacing(spacing::kGap);
    lines->addLayout(head);
    lines->addWidget(text_);
    lines->addLayout(foot);
    setTabOrder(next_, back_);
    setTabOrder(back_, cross);
}

void Tour::GoTo(int step)
{
    if (step < 0)
        return;
    if (step >= int(steps_.size())) {
        close();
        return;
    }
    step_ = step;
    const TourStep& now = steps_[size_t(step)];
    const bool isLast = step + 1 == int(steps_.size());
    title_->setText(StringText(now.title));
    text_->setText(StringText(now.text));
    count_->setText(StringText(Str::TourStep, {QString::number(step + 1), QString::number(steps_.size())}));
    back_->setVisible(step > 0);
    next_->setText(StringText(isLast ? Str::TourDone : Str::TourNext));
    next_->setAccessibleDescription(title_->text() + u'\n' + text_->text()); // read aloud with the button
    Place();
    next_->setFocus();
}

QRect Tour::PartRect() const
{
    const QWidget* part = steps_[size_t(step_)].part ? steps_[size_t(step_)].part() : nullptr;
    if (!part || !part->isVisibleTo(&window_))
        return {};
    return QRect(part->mapTo(&window_, QPoint()), part->size()).intersected(rect());
}

// Below the part where there is room, else above or beside it, else over the window's middle.
void Tour::Place()
{
    setGeometry(window_.rect());
    const int width =
        std::min(fontMetrics().averageCharWidth() * kBubbleWidthChars, rect().width() - 2 * spacing::kGap);
    const int height =
        std::max(bubble_->layout()->totalHeightForWidth(width), bubble_->layout()->totalMinimumSize().height());
    const QRect part = PartRect();
    const int x = std::clamp(part.isEmpty() ? (rect().width() - width) / 2 : part.center().x() - width / 2,
                             spacing::kGap, std::max(rect().width() - width - spacing::kGap, spacing::kGap));
    QRect place(x, (rect().height() - height) / 2, width, height);
    if (!part.isEmpty() && part.bottom() + spacing::kGap + height < rect().height()) {
        place.moveTop(part.bottom() + spacing::kGap);
    } else if (!part.isEmpty() && part.top() - spacing::kGap - height > 0) {
        place.moveBottom(part.top() - spacing::kGap);
    } else if (!part.isEmpty() && part.right() + spacing::kGap + width < rect().width()) {
        place.moveLeft(part.right() + spacing::kGap);
        place.moveTop(std::clamp(part.center().y() - height / 2, spacing::kGap,
                                 std::max(rect().height() - height - spacing::kGap, spacing::kGap)));
    }
    bubble_->setGeometry(place);
    update();
}

void Tour::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    QPainterPath dimmed;
    dimmed.addRect(rect());
    const QRect part = PartRect();
    if (!part.isEmpty())
        dimmed.addRoundedRect(part, spacing::kCorner, spacing::kCorner);
    QColor shade = ColorOfRole(LookRole::Base, LookScheme::Dark); // in the light, too
    shade.setAlphaF(kDimmed);
    painter.fillPath(dimmed, shade);
    if (part.isEmpty())
        return;
    painter.setPen(QPen(ColorOfRole(LookRole::Accent, palette()), kRingPx));
    painter.drawRoundedRect(part.adjusted(1, 1, -1, -1), spacing::kCorner, spacing::kCorner);
}

void Tour::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Escape)
        close();
    else
        QWidget::keyPressEvent(event);
}

bool Tour::focusNextPrevChild(bool next)
{
    QList<QAbstractButton*> buttons = bubble_->findChildren<QAbstractButton*>();
    buttons.removeIf([](const QAbstractButton* button) { return !button->isVisible(); });
    if (buttons.isEmpty())
        return false;
    const qsizetype now = std::ranges::find(buttons, focusWidget()) - buttons.begin();
    const qsizetype step = next ? 1 : buttons.size() - 1;
    buttons[(now + step) % buttons.size()]->setFocus(next ? Qt::TabFocusReason : Qt::BacktabFocusReason);
    return true;
}

bool Tour::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == &window_ && event->type() == QEvent::Resize)
        QMetaObject::invokeMethod(this, &Tour::Place, Qt::QueuedConnection); // the parts follow first
    return QWidget::eventFilter(watched, event);
}

} // namespace mirel
