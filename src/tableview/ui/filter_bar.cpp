#include "tableview/ui/filter_bar.h"

#include "platform/ui/look_roles.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"
#include "tableview/condition_label.h"

#include <QHBoxLayout>
#include <QMenu>
#include <QPainter>
#include <QToolButton>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kTouchPx = 24;
constexpr float kTint = 0.12F;

QToolButton* FlatButton(QWidget* parent)
{
    auto* button = new QToolButton(parent);
    button->setAutoRaise(true);
    button->setFocusPolicy(Qt::TabFocus);
    button->setMinimumSize(kTouchPx, kTouchPx);
    return button;
}

} // namespace

FilterChip::FilterChip(const OpenResult::Filter& filter, QWidget* parent)
    : QFrame(parent)
    , text_(ConditionLabel(filter.condition))
    , on_(filter.on)
    , words_(FlatButton(this))
    , cross_(FlatButton(this))
{
    QFont font = words_->font();
    font.setStrikeOut(!on_);
    words_->setFont(font);
    words_->setToolTip(filter.condition.toHtmlEscaped());
    words_->setAccessibleName(StringText(on_ ? Str::FilterChip : Str::FilterChipOff, {text_}));
    cross_->setIcon(ThemeIcon(u"window-close"));
    cross_->setToolTip(StringText(Str::FilterTakeOffTip));
    cross_->setAccessibleName(StringText(Str::FilterTakeOffName, {text_}));
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(spacing::kTight, 0, 0, 0);
    row->setSpacing(0);
    row->addWidget(words_, 1);
    row->addWidget(cross_);
}

int FilterChip::WholeWidth() const
{
    return words_->fontMetrics().horizontalAdvance(text_) + 2 + kTouchPx + 2 * spacing::kRoom;
}

void FilterChip::FitTo(int widthPx)
{
    const int room = widthPx - kTouchPx - 2 * spacing::kRoom;
    words_->setText(
        words_->fontMetrics().elidedText(text_, Qt::ElideMiddle, room).replace(u'&', QStringLiteral("&&")));
    setFixedWidth(std::min(widthPx, WholeWidth()));
}

void FilterChip::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const QColor accent = ColorOfRole(on_ ? LookRole::Accent : LookRole::Edge, palette());
    const QColor ground = ColorOfRole(LookRole::Window, palette());
    painter.setPen(accent);
    painter.setBrush(on_ ? Blend(accent, ground, kTint) : ground);
    painter.drawRoundedRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5), kTouchPx / 2.0, kTouchPx / 2.0);
}

FilterBar::FilterBar(Offers offers, QWidget* parent)
    : QWidget(parent)
    , offers_(offers)
    , add_(FlatButton(this))
{
    add_->setIcon(ThemeIcon(u"list-add"));
    add_->setToolTip(StringText(Str::FilterAddTip));
    add_->setAccessibleName(StringText(Str::FilterAddTip));
    add_->setVisible(offers == Offers::All);
    connect(add_, &QToolButton::clicked, this, &FilterBar::addRequested);
    hide();
}

void FilterBar::Show(const std::vector<OpenResult::Filter>& filters)
{
    if (filters == filters_)
        return; // with every step through the records
    filters_ = filters;
    for (FilterChip* chip : chips_) {
        chip->hide();
        chip->deleteLater(); // its button may be the one that was pressed
    }
    chips_.clear();
    for (int filter = 0; filter < int(filters_.size()); ++filter)
        MakeChip(filter);
    setVisible(!filters_.empty());
    PlaceChips();
}

void FilterBar::MakeChip(int filter)
{
    auto* chip = new FilterChip(filters_[size_t(filter)], this);
    connect(chip->Words(), &QToolButton::clicked, this, [this, filter] { OpenMenu(filter); });
    connect(chip->Cross(), &QToolButton::clicked, this, [this, filter] { Q_EMIT removed(filter); });
    chip->show();
    chips_.push_back(chip);
    setTabOrder(chip->Words(), chip->Cross());
}

void FilterBar::OpenMenu(int filter)
{
    QMenu menu(this);
    QAction* change = offers_ == Offers::All
                          ? menu.addAction(ThemeIcon(u"document-edit"), StringText(Str::FilterChange))
                          : nullptr;
    const bool on = filters_[size_t(filter)].on;
    QAction* toggle = menu.addAction(StringText(on ? Str::FilterSwitchOff : Str::FilterSwitchOn));
    QAction* remove = menu.addAction(ThemeIcon(u"edit-clear"), StringText(Str::FilterTakeOff));
    const QWidget* chip = chips_[size_t(filter)];
    const QAction* chosen = menu.exec(chip->mapToGlobal(chip->rect().bottomLeft()));
    if (!chosen)
        return;
    if (chosen == change)
        Q_EMIT changeRequested(filter);
    else if (chosen == toggle)
        Q_EMIT switched(filter);
    else if (chosen == remove)
        Q_EMIT removed(filter);
}

// From left to right, or from right to left, a new line where one is full.
void FilterBar::PlaceChips()
{
    if (chips_.empty())
        return;
    const int edge = spacing::kTight;
    const int most = std::max(width() - 2 * edge, kTouchPx);
    QPoint at(edge, edge / 2);
    const auto place = [&](QWidget* part, int widthPx) {
        if (at.x() > edge && at.x() + widthPx > width() - edge)
            at = {edge, at.y() + kTouchPx + edge};
        const QRect where(at, QSize(widthPx, kTouchPx));
        part->setGeometry(QStyle::visualRect(layoutDirection(), rect(), where));
        at.rx() += widthPx + edge;
    };
    for (FilterChip* chip : chips_) {
        chip->FitTo(std::min(chip->WholeWidth(), most));
        place(chip, chip->width());
    }
    if (offers_ == Offers::All)
        place(add_, kTouchPx);
    setFixedHeight(at.y() + kTouchPx + edge / 2);
}

void FilterBar::resizeEvent(QResizeEvent*)
{
    PlaceChips();
}

} // namespace mirel
