#include "platform/ui/error_line.h"

#include "platform/ui/look_roles.h"
#include "resources/string_table.h"

#include <QAccessible>
#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QPainter>
#include <QToolButton>

namespace mirel {
namespace {

constexpr float kTint = 0.10F;

} // namespace

ErrorLine::ErrorLine(QWidget* parent)
    : QFrame(parent)
    , text_(new QLabel(this))
    , restore_(new QToolButton(this))
{
    text_->setTextFormat(Qt::PlainText);
    text_->setWordWrap(true);
    text_->setTextInteractionFlags(Qt::TextSelectableByMouse);
    restore_->setAutoRaise(true);
    restore_->setFocusPolicy(Qt::TabFocus);
    restore_->setToolTip(StringText(Str::ErrorRestoreTip));
    QFont link = restore_->font();
    link.setUnderline(true);
    restore_->setFont(link);
    connect(restore_, &QToolButton::clicked, this, &ErrorLine::restoreRequested);
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(spacing::kGap, spacing::kTight, spacing::kTight, spacing::kTight);
    row->setSpacing(spacing::kTight);
    row->addWidget(text_, 1);
    row->addWidget(restore_);
    hide();
}

QString ErrorLine::Text() const
{
    return isHidden() ? QString() : text_->text();
}

void ErrorLine::ShowError(const QString& what, const QString& restore)
{
    Say(what, true, restore);
}

void ErrorLine::ShowNote(const QString& note)
{
    Say(note, false, {});
}

void ErrorLine::Clear()
{
    hide();
}

void ErrorLine::Say(const QString& text, bool isError, const QString& restore)
{
    const bool isNews = isHidden() || text != text_->text();
    isError_ = isError;
    text_->setText(text);
    text_->setAccessibleName(text);
    restoreText_ = restore;
    restore_->setVisible(!restore.isEmpty());
    restore_->setAccessibleName(QString(restore).remove(u'&'));
    TakeUpColors();
    FitButton();
    show();
    if (isNews) {
        QAccessibleEvent alert(text_, QAccessible::Alert);
        QAccessible::updateAccessibility(&alert);
    }
}

void ErrorLine::TakeUpColors()
{
    QPalette inked;
    inked.setResolveMask(0);
    const QColor ink = ColorOfRole(isError_ ? LookRole::Error : LookRole::Dim, palette());
    inked.setColor(QPalette::WindowText, ink);
    inked.setColor(QPalette::ButtonText, ink);
    text_->setPalette(inked);
    restore_->setPalette(inked);
}

// The old value gives way to what is wrong.
void ErrorLine::FitButton()
{
    restore_->setText(
        restore_->fontMetrics().elidedText(restoreText_, Qt::ElideMiddle, width() * 2 / 5, Qt::TextShowMnemonic));
}

void ErrorLine::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    const QColor ground = palette().color(QPalette::Window);
    const QColor error = ColorOfRole(LookRole::Error, palette());
    painter.fillRect(rect(), isError_ ? Blend(error, ground, kTint) : ground);
    painter.setPen(isError_ ? error : ColorOfRole(LookRole::Line, palette()));
    painter.drawLine(rect().topLeft(), rect().topRight());
}

void ErrorLine::resizeEvent(QResizeEvent*)
{
    FitButton();
}

void ErrorLine::changeEvent(QEvent* event)
{
    QFrame::changeEvent(event);
    if (event->type() == QEvent::PaletteChange)
        TakeUpColors();
}

} // namespace mirel
