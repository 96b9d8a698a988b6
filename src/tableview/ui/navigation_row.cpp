#include "tableview/ui/navigation_row.h"

#include "platform/ui/look_roles.h"
#include "resources/string_table.h"

#include <QAction>
#include <QHBoxLayout>
#include <QMenu>
#include <QStyleOptionToolButton>
#include <QStylePainter>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kTouchPx = 24;
constexpr int kLeastCounterPx = 48;
constexpr int kCounterChars = 18; // of a roomy row: millions of millions
constexpr qreal kLeastPoints = 5.5;

} // namespace

void CounterButton::paintEvent(QPaintEvent*)
{
    QStylePainter painter(this);
    QStyleOptionToolButton option;
    initStyleOption(&option);
    const QString shown = option.text;
    option.text.clear();
    painter.drawComplexControl(QStyle::CC_ToolButton, option);
    const int room = width() - spacing::kTight;
    QFont narrow = font();
    int wide = fontMetrics().horizontalAdvance(shown);
    if (wide > room) {
        narrow.setStretch(QFont::SemiCondensed);
        wide = QFontMetrics(narrow).horizontalAdvance(shown);
    }
    if (wide > room)
        narrow.setPointSizeF(std::max(narrow.pointSizeF() * room / wide, kLeastPoints));
    painter.setFont(narrow);
    painter.drawItemText(rect(), Qt::AlignCenter, palette(), isEnabled(), shown, QPalette::ButtonText);
}

NavigationRow::NavigationRow(const Actions& actions, QWidget* parent)
    : QWidget(parent)
    , counter_(new CounterButton(this))
    , more_(new QToolButton(this))
    , moreMenu_(new QMenu(this))
{
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, spacing::kTight);
    row->setSpacing(0);
    row->setSizeConstraint(QLayout::SetNoConstraint); // FitButtons sees to it that they fit

    QToolButton* first = AddButton(actions.first);
    AddButton(actions.previous);
    counter_->setAutoRaise(true);
    counter_->setToolTip(actions.goTo->toolTip());
    counter_->setFocusPolicy(Qt::TabFocus);
    counter_->setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Preferred);
    connect(counter_, &QToolButton::clicked, actions.goTo, &QAction::trigger);
    row->addWidget(counter_);
    AddButton(actions.next);
    QToolButton* last = AddButton(actions.last);
    row->addStretch(1);
    worded_ = {AddButton(actions.newRecord), AddButton(actions.deleteRecord), AddButton(actions.detail)};
    yielding_ = {worded_[1], worded_[2], worded_[0], first, last};

    more_->setText(u"…"_s);
    more_->setToolTip(StringText(Str::ActionMore));
    more_->setAccessibleName(more_->toolTip());
    more_->setAutoRaise(true);
    more_->setFocusPolicy(Qt::TabFocus);
    more_->setMinimumSize(kTouchPx, kTouchPx);
    more_->setPopupMode(QToolButton::InstantPopup);
    more_->setMenu(moreMenu_);
    row->addWidget(more_);
}

QToolButton* NavigationRow::AddButton(QAction* action)
{
    auto* button = new QToolButton(this);
    button->setDefaultAction(action);
    button->setAutoRaise(true);
    button->setFocusPolicy(Qt::TabFocus);
    button->setMinimumSize(kTouchPx, kTouchPx);
    button->setAccessibleName(action->iconText());
    connect(action, &QAction::changed, button,
            [button, action] { button->setAccessibleName(action->iconText()); });
    layout()->addWidget(button);
    return button;
}

void NavigationRow::ShowCounter(const QString& text)
{
    counter_->setText(text);
    counter_->setAccessibleName(text);
}

QSize NavigationRow::minimumSizeHint() const
{
    return {0, QWidget::minimumSizeHint().height()};
}

int NavigationRow::ButtonsWidth() const
{
    const QMargins margins = layout()->contentsMargins();
    int width = margins.left() + margins.right();
    for (int i = 0; i < layout()->count(); ++i) {
        const QWidget* widget = layout()->itemAt(i)->widget();
        if (widget && widget != counter_ && !widget->isHidden())
            width += std::max(widget->sizeHint().width(), widget->minimumWidth());
    }
    return width;
}

// The counter has what is left, up to what any counter takes.
void NavigationRow::FitButtons()
{
    const auto setWords = [this](Qt::ToolButtonStyle words) {
        for (QToolButton* button : worded_)
            button->setToolButtonStyle(words);
    };
    for (QToolButton* button : yielding_)
        button->show();
    more_->hide();
    moreMenu_->clear();
    setWords(Qt::ToolButtonTextBesideIcon);
    const int roomy = kCounterChars * fontMetrics().horizontalAdvance(u'0');
    if (ButtonsWidth() + roomy > width())
        setWords(Qt::ToolButtonIconOnly);
    for (QToolButton* button : yielding_) {
        if (ButtonsWidth() + kLeastCounterPx <= width())
            break;
        more_->show();
        button->hide();
        moreMenu_->addAction(button->defaultAction());
    }
    counter_->setFixedWidth(std::clamp(width() - ButtonsWidth(), kLeastCounterPx, roomy));
}

void NavigationRow::resizeEvent(QResizeEvent*)
{
    FitButtons();
}

} // namespace mirel
