#include "tableview/ui/find_line.h"

#include "platform/ui/elided_label.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QAction>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLineEdit>
#include <QLocale>
#include <QToolButton>

namespace mirel {
namespace {

constexpr int kSliceMs = 12;

QToolButton* AddButton(QWidget* parent, QAction* action)
{
    auto* button = new QToolButton(parent);
    button->setDefaultAction(action);
    button->setToolButtonStyle(Qt::ToolButtonIconOnly);
    button->setAutoRaise(true);
    button->setFocusPolicy(Qt::TabFocus);
    button->setAccessibleName(action->iconText());
    parent->layout()->addWidget(button);
    return button;
}

} // namespace

FindLine::FindLine(RecordBrowser& browser, const Actions& actions, QWidget* parent)
    : QWidget(parent)
    , find_(browser)
    , text_(new QLineEdit(this))
    , note_(new ElidedLabel(this))
{
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(spacing::kGap, 0, spacing::kTight, 0);
    row->setSpacing(spacing::kTight);
    setMinimumWidth(1); // what is in it gives way, never the window
    text_->setPlaceholderText(StringText(Str::FindPrompt));
    text_->setAccessibleName(StringText(Str::FindPrompt));
    if (!IsHandheldSize(parent->window()->size())) { // there the letters need the room
        text_->setClearButtonEnabled(true);
        text_->addAction(ThemeIcon(u"edit-find"), QLineEdit::LeadingPosition);
    }
    note_->setForegroundRole(QPalette::PlaceholderText);
    text_->setMinimumWidth(1);
    row->addWidget(text_, 2);
    row->addWidget(note_, 0);
    AddButton(this, actions.previous);
    AddButton(this, actions.next);
    auto* close = new QAction(ThemeIcon(u"window-close"), StringText(Str::FindClose), this);
    connect(close, &QAction::triggered, this, &QWidget::hide);
    AddButton(this, close);
    connect(text_, &QLineEdit::textEdited, this,
            [this] { Begin(QuickFind::Direction::Forward, QuickFind::From::SelectedCell); });
    connect(&slices_, &QTimer::timeout, this, &FindLine::Step);
    hide();
}

void FindLine::Open()
{
    show();
    text_->setFocus(Qt::ShortcutFocusReason);
    text_->selectAll();
}

void FindLine::FindAgain(QuickFind::Direction direction)
{
    if (text_->text().isEmpty())
        return Open();
    show();
    Begin(direction, QuickFind::From::BehindIt);
}

void FindLine::Begin(QuickFind::Direction direction, QuickFind::From from)
{
    find_.Begin(text_->text(), direction, from);
    slices_.start(0);
    Step();
}

void FindLine::Step()
{
    const QuickFind::State state = find_.Step(kSliceMs);
    if (state != QuickFind::State::Searching)
        slices_.stop();
    ShowNote();
    if (state == QuickFind::State::Found || state == QuickFind::State::Failed)
        Q_EMIT moved();
}

void FindLine::ShowNote()
{
    QString note;
    switch (find_.Current()) {
    case QuickFind::State::Searching:
        note = StringText(Str::FindSearching, {QLocale().toString(find_.Records())});
        break;
    case QuickFind::State::Found:
        note = find_.HasWrapped() ? StringText(Str::FindWrapped) : QString();
        break;
    case QuickFind::State::NotFound:
        note = text_->text().isEmpty() ? QString() : StringText(Str::FindNothing);
        break;
    case QuickFind::State::Idle:
    case QuickFind::State::Failed:
        break;
    }
    note_->SetText(note);
    note_->setToolTip(note);
    note_->setMaximumWidth(width() / 3);
    note_->setVisible(!note.isEmpty());
}

void FindLine::keyPressEvent(QKeyEvent* event)
{
    switch (event->key()) {
    case Qt::Key_Escape:
        if (find_.Current() == QuickFind::State::Searching) {
            find_.Stop();
            slices_.stop();
            ShowNote();
        } else {
            hide();
        }
        return;
    case Qt::Key_Return:
    case Qt::Key_Enter:
        FindAgain(event->modifiers().testFlag(Qt::ShiftModifier) ? QuickFind::Direction::Backward
                                                                 : QuickFind::Direction::Forward);
        return;
    default:
        QWidget::keyPressEvent(event);
    }
}

void FindLine::hideEvent(QHideEvent* event)
{
    QWidget::hideEvent(event);
    find_.Stop();
    slices_.stop();
    Q_EMIT closed();
}

void FindLine::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    ShowNote();
}

} // namespace mirel
