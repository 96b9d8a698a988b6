#include "tableview/ui/filter_chip.h"

#include "resources/string_table.h"

#include <QAction>
#include <QHBoxLayout>
#include <QLabel>
#include <QStyle>
#include <QToolButton>

namespace mirel {

FilterChip::FilterChip(QAction* remove, QWidget* parent)
    : QFrame(parent)
    , label_(new QLabel(this))
{
    setAutoFillBackground(true);
    setBackgroundRole(QPalette::AlternateBase);
    label_->setTextFormat(Qt::PlainText);
    label_->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    auto* cross = new QToolButton(this);
    cross->setDefaultAction(remove);
    cross->setAutoRaise(true);
    cross->setAccessibleName(remove->iconText());
    auto* row = new QHBoxLayout(this);
    const int side = style()->pixelMetric(QStyle::PM_LayoutLeftMargin) / 2;
    row->setContentsMargins(side, 0, side, 0);
    row->addWidget(label_, 1);
    row->addWidget(cross);
    hide();
}

void FilterChip::ShowConditions(const QStringList& conditions)
{
    setVisible(!conditions.isEmpty());
    text_ = StringText(Str::FilterChip, {conditions.join(QStringLiteral(" AND "))});
    label_->setToolTip(text_);
    label_->setAccessibleName(text_);
    ShowText();
}

void FilterChip::ShowText()
{
    label_->setText(label_->fontMetrics().elidedText(text_, Qt::ElideRight, label_->width()));
}

void FilterChip::resizeEvent(QResizeEvent* event)
{
    QFrame::resizeEvent(event);
    layout()->activate();
    ShowText();
}

} // namespace mirel
