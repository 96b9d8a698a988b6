#include "tableview/ui/navigation_row.h"

#include <QAction>
#include <QHBoxLayout>
#include <QStyle>
#include <QToolButton>

namespace mirel {
namespace {

constexpr int kTouchPx = 24;

} // namespace

NavigationRow::NavigationRow(const Actions& actions, QWidget* parent)
    : QWidget(parent)
{
    auto* row = new QHBoxLayout(this);
    const int side = style()->pixelMetric(QStyle::PM_LayoutLeftMargin) / 2;
    row->setContentsMargins(side, 0, side, side);
    row->setSpacing(0);
    AddButton(actions.first);
    AddButton(actions.previous);
    counter_ = new QToolButton(this);
    counter_->setAutoRaise(true);
    counter_->setToolTip(actions.goTo->toolTip());
    counter_->setFocusPolicy(Qt::TabFocus);
    counter_->setSizePolicy(QSizePolicy::Minimum, QSizePolicy::Preferred);
    connect(counter_, &QToolButton::clicked, actions.goTo, &QAction::trigger);
    row->addWidget(counter_);
    AddButton(actions.next);
    AddButton(actions.last);
    row->addStretch(1);
    newRecord_ = AddButton(actions.newRecord);
    deleteRecord_ = AddButton(actions.deleteRecord);
    detail_ = AddButton(actions.detail);
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
    counter_->setText(text);
    counter_->setMinimumWidth(counter_->sizeHint().width());
    counter_->setAccessibleName(text);
}

// Words beside the icons where there is room for them.
void NavigationRow::resizeEvent(QResizeEvent*)
{
    const bool roomy = width() > 30 * fontMetrics().height();
    for (QToolButton* button : {newRecord_, deleteRecord_, detail_})
        button->setToolButtonStyle(roomy ? Qt::ToolButtonTextBesideIcon : Qt::ToolButtonIconOnly);
}

} // namespace mirel
