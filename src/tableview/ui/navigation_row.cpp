#include "tableview/ui/navigation_row.h"

#include "resources/string_table.h"

#include <QAction>
#include <QHBoxLayout>
#include <QMenu>
#include <QStyle>
#include <QToolButton>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kTouchPx = 24;

} // namespace

NavigationRow::NavigationRow(const Actions& actions, QWidget* parent)
    : QWidget(parent)
    , counter_(new QToolButton(this))
    , more_(new QToolButton(this))
    , moreMenu_(new QMenu(this))
{
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, style()->pixelMetric(QStyle::PM_LayoutBottomMargin) / 2);
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
    layout()->addWidget(button);
    return button;
}

void NavigationRow::ShowCounter(const QString& text)
{
    if (counter_->text() == text)
        return;
    const bool sameLength = counter_->text().size() == text.size();
    counter_->setText(text);
    counter_->setAccessibleName(text);
    if (!sameLength) {
        FitButtons();
        layout()->activate(); // the very next picture shows it whole
    }
}

QSize NavigationRow::minimumSizeHint() const
{
    return {0, QWidget::minimumSizeHint().height()};
}

int NavigationRow::NeededWidth() const
{
    const QMargins margins = layout()->contentsMargins();
    int width = margins.left() + margins.right();
    for (int i = 0; i < layout()->count(); ++i) {
        const QWidget* widget = layout()->itemAt(i)->widget();
        if (widget && !widget->isHidden())
            width += std::max(widget->sizeHint().width(), widget->minimumWidth());
    }
    return width;
}

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
    if (NeededWidth() <= width())
        return;
    setWords(Qt::ToolButtonIconOnly);
    for (QToolButton* button : yielding_) {
        if (NeededWidth() <= width())
            return;
        more_->show();
        button->hide();
        moreMenu_->addAction(button->defaultAction());
    }
}

void NavigationRow::resizeEvent(QResizeEvent*)
{
    FitButtons();
}

} // namespace mirel
