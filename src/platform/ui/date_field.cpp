#include "platform/ui/date_field.h"

#include "platform/ui/day_chooser.h"
#include "platform/ui/look_roles.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"

#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLineEdit>
#include <QToolButton>

#include <limits>

namespace mirel {

DateField::DateField(QWidget* parent)
    : QWidget(parent)
    , line_(new QLineEdit(this))
    , button_(new QToolButton(this))
{
    line_->setMaxLength(std::numeric_limits<int>::max()); // the longest memo passes through whole
    line_->installEventFilter(this);
    button_->setArrowType(Qt::DownArrow);
    button_->setToolTip(StringText(Str::CalendarTip));
    button_->setAccessibleName(button_->toolTip());
    button_->setFocusPolicy(Qt::NoFocus); // the line has the focus, and keys for this
    connect(line_, &QLineEdit::textEdited, this, &DateField::textEdited);
    connect(button_, &QToolButton::clicked, this, &DateField::OpenCalendar);
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins({});
    row->setSpacing(spacing::kTight);
    row->addWidget(line_, 1);
    row->addWidget(button_);
    setFocusProxy(line_);
    SetTakesDates(true);
}

QString DateField::Text() const
{
    return line_->text();
}

void DateField::SetText(const QString& text)
{
    line_->setText(text);
}

void DateField::SetTakesDates(bool dates)
{
    button_->setVisible(dates);
    line_->setPlaceholderText(dates ? UserLocale::Current().DateFormat() : QString());
}

void DateField::OpenCalendar()
{
    if (line_->isReadOnly() || !isEnabled())
        return;
    const std::optional<QString> chosen =
        ChooseDay(line_->text(), line_->mapToGlobal(line_->rect().bottomLeft()), *this);
    if (!chosen)
        return;
    line_->setFocus(Qt::OtherFocusReason);
    line_->setText(*chosen);
    Q_EMIT textEdited(*chosen);
}

bool DateField::eventFilter(QObject* watched, QEvent* event)
{
    if (watched != line_ || event->type() != QEvent::KeyPress || button_->isHidden())
        return QWidget::eventFilter(watched, event);
    const auto* key = static_cast<QKeyEvent*>(event);
    const bool opens = (key->key() == Qt::Key_Down && key->modifiers() == Qt::AltModifier) ||
                       (key->key() == Qt::Key_F4 && key->modifiers() == Qt::NoModifier);
    if (!opens)
        return QWidget::eventFilter(watched, event);
    OpenCalendar();
    return true;
}

} // namespace mirel
