#include "forms/ui/form_surface.h"

#include "forms/control_types.h"
#include "forms/ui/control_look.h"
#include "platform/ui/look_roles.h"

#include <QAbstractScrollArea>
#include <QApplication>
#include <QComboBox>
#include <QContextMenuEvent>
#include <QKeyEvent>
#include <QLineEdit>
#include <QMouseEvent>
#include <QPlainTextEdit>
#include <QPushButton>

#include <algorithm>

namespace mirel {
namespace {

// Controls further out are not part of the form: nobody placed them there by hand.
constexpr int kFarthestPx = 8000;
constexpr int kMarginPx = 2;

QSize SizeOf(const FormDef& form)
{
    QSize size(form.width, form.height);
    for (const ControlDef& control : form.controls) {
        const ControlParts parts = PartsOf(control);
        const QRect place = parts.main.united(parts.second);
        size = size.expandedTo(QSize(place.x() + place.width(), place.y() + place.height()) +
                               QSize(kMarginPx, kMarginPx));
    }
    return size.expandedTo(QSize(1, 1)).boundedTo(QSize(kFarthestPx, kFarthestPx));
}

// The text that Escape gives back; of a check box, whether it was ticked.
QString TextOf(const ControlRun& control)
{
    return Has(control.type, IsTicked) ? QString(control.ticked ? u'1' : u'0') : control.text;
}

} // namespace

FormSurface::FormSurface(RunningForm& form, QWidget* parent)
    : QWidget(parent)
    , form_(form)
    , formSize_(SizeOf(form.Form()))
{
    setAutoFillBackground(true);
    const FormDef& definition = form.Form();
    setPalette(
        PaletteOf(palette(), definition.backgroundColor, kDefaultColor, QPalette::Window, QPalette::WindowText));
    setFocusPolicy(Qt::NoFocus);
    MakeControls();
    OrderTabs();
    SetScale({});
}

FormSurface::~FormSurface() = default;

void FormSurface::MakeControls()
{
    const std::span<const ControlRun> controls = form_.Controls();
    shown_.assign(controls.size(), 0);
    before_.resize(controls.size());
    for (int i = 0; i < int(controls.size()); ++i) {
        const ControlWidget::ListSource list{
            .rows = [this, i](qint64 first, int count) { return form_.ListRows(i, first, count); },
            .maxColumnChars = [this] { return form_.Settings().maxColumnChars; },
            .isNumber = [this, i](int column) { return form_.ShowsNumbers(i, column); }};
        const ControlRun& control = controls[size_t(i)];
        widgets_.push_back(ControlWidget::Make(control, list, *this));
        if (IsComputed(i))
            widgets_.back()->SetComputed();
        widgets_.back()->Show(control);
        shown_[size_t(i)] = control.revision;
        Remember(i);
        ConnectControl(i);
    }
}

void FormSurface::ConnectControl(int control)
{
    ControlWidget* widget = widgets_[size_t(control)].get();
    connect(widget, &ControlWidget::textEdited, this,
            [this, control](const QString& text) { Act([&] { form_.SetText(control, text); }); });
    connect(widget, &ControlWidget::ticked, this,
            [this, control](bool on) { Act([&] { form_.SetTicked(control, on); }); });
    connect(widget, &ControlWidget::pressed, this,
            [this, control] { Act([&] { (void)form_.PressButton(control); }); });
    connect(widget, &ControlWidget::rowChosen, this,
            [this, control](qint64 row) { Act([&] { (void)form_.SelectListRow(control, row); }); });
    connect(widget, &ControlWidget::headerTapped, this,
            [this, control](int column) { Act([&] { (void)form_.TapListHeader(control, column); }); });
    connect(widget, &ControlWidget::itemsWanted, this,
            [this, control] { Act([&] { form_.RefreshItems(control); }); });
    Watch(*widget->Main(), control);
    if (QWidget* strip = widget->Strip())
        Watch(*strip, control);
}

template <typename Action>
void FormSurface::Act(Action action)
{
    action();
    Q_EMIT acted();
}

void FormSurface::Watch(QWidget& widget, int control)
{
    controlOf_.insert(&widget, control);
    widget.installEventFilter(this);
    // Editors within an editor get the mouse and the focus themselves.
    if (auto* area = qobject_cast<QAbstractScrollArea*>(&widget))
        Watch(*area->viewport(), control);
    if (const auto* box = qobject_cast<QComboBox*>(&widget))
        Watch(*box->lineEdit(), control);
}

void FormSurface::OrderTabs()
{
    QWidget* previous = nullptr;
    for (const std::unique_ptr<ControlWidget>& widget : widgets_) {
        QWidget* main = widget->Main();
        if (main->focusPolicy() == Qt::NoFocus)
            continue;
        if (previous)
            setTabOrder(previous, main);
        previous = main;
    }
}

// --- showing ------------------------------------------------------------------------------------------------

void FormSurface::ShowState()
{
    const std::span<const ControlRun> controls = form_.Controls();
    for (size_t i = 0; i < controls.size(); ++i) {
        if (shown_[i] == controls[i].revision)
            continue;
        shown_[i] = controls[i].revision;
        widgets_[i]->Show(controls[i]);
        if (controls[i].keepsInput && !controls[i].edited)
            Remember(int(i));
    }
}

void FormSurface::SetScale(const SurfaceScale& scale)
{
    scale_ = scale;
    for (const std::unique_ptr<ControlWidget>& widget : widgets_)
        widget->Place(scale);
    AlignLabels();
    resize(scale.Of(formSize_));
}

// A label belongs to the first box to its right in its line.
void FormSurface::AlignLabels()
{
    const std::span<const ControlRun> controls = form_.Controls();
    for (size_t i = 0; i < controls.size(); ++i) {
        if (controls[i].type != ControlType::Label)
            continue;
        const QRect label = widgets_[i]->Main()->geometry();
        const QWidget* nearest = nullptr;
        for (size_t other = 0; other < controls.size(); ++other) {
            const QWidget* box = widgets_[other]->Main();
            const bool isLine = qobject_cast<const QLineEdit*>(box) || qobject_cast<const QComboBox*>(box);
            const bool beside = box->x() >= label.right() && box->y() <= label.center().y() &&
                                box->geometry().bottom() >= label.center().y();
            if (isLine && beside && (!nearest || box->x() < nearest->x()))
                nearest = box;
        }
        if (nearest)
            widgets_[i]->AlignTextTo(*nearest);
    }
}

int FormSurface::ControlOf(const QObject* widget) const
{
    for (; widget && widget != this; widget = widget->parent()) {
        if (const auto known = controlOf_.constFind(widget); known != controlOf_.cend())
            return *known;
    }
    return -1;
}

int FormSurface::FocusedControl() const
{
    return ControlOf(QApplication::focusWidget());
}

bool FormSurface::IsInput(int control) const
{
    return Has(form_.Controls()[size_t(control)].type, HoldsValue);
}

// A box that shows an expression is for reading, but where a button reads it: then what is typed counts.
bool FormSurface::IsComputed(int control) const
{
    const ControlRun& run = form_.Controls()[size_t(control)];
    if (run.type != ControlType::EditBox || run.keepsInput || run.definition->hasSource == 0)
        return false;
    return std::ranges::none_of(form_.Controls(), [&run](const ControlRun& other) {
        const QString source = other.definition->source.Text();
        return other.type == ControlType::Button &&
               (source.contains(u'&' + run.name) || source.contains(QStringLiteral("&[") + run.name + u']'));
    });
}

// The record counter is first in most lists; nobody begins with it, nor where the top of the form is out of sight
// if there is a choice.
void FormSurface::FocusFirstInput(int heightPx)
{
    enum Rank { KeptInSight, UsedInSight, Kept, Any, None };
    const auto rankOf = [this, heightPx](int control) {
        const QWidget* widget = WidgetOf(control);
        if (widget->focusPolicy() == Qt::NoFocus || widget->isHidden())
            return None;
        const ControlRun& run = form_.Controls()[size_t(control)];
        const bool isInSight = widget->geometry().bottom() < heightPx;
        const bool isKept = IsInput(control) && run.keepsInput;
        const bool isUsed = (IsInput(control) && !IsComputed(control)) || run.type == ControlType::List;
        if (isInSight && isUsed)
            return isKept ? KeptInSight : UsedInSight;
        return isKept ? Kept : Any;
    };
    int best = -1;
    for (int control = 0; control < int(widgets_.size()); ++control) {
        if (rankOf(control) < (best < 0 ? None : rankOf(best)))
            best = control;
    }
    if (best >= 0)
        WidgetOf(best)->setFocus(Qt::TabFocusReason);
}

void FormSurface::FocusControl(int control)
{
    if (control >= 0 && control < int(widgets_.size()))
        WidgetOf(control)->setFocus(Qt::OtherFocusReason);
}

// --- the user -----------------------------------------------------------------------------------------------

void FormSurface::Remember(int control)
{
    before_[size_t(control)] = TextOf(form_.Controls()[size_t(control)]);
}

bool FormSurface::Revert(int control)
{
    if (control < 0 || !IsInput(control))
        return false;
    const ControlRun& run = form_.Controls()[size_t(control)];
    const QString before = before_[size_t(control)];
    if (TextOf(run) == before)
        return false;
    Act([&] {
        if (Has(run.type, IsTicked))
            form_.SetTicked(control, before == u"1");
        else
            form_.SetText(control, before);
    });
    if (auto* line = qobject_cast<QLineEdit*>(WidgetOf(control)))
        line->selectAll();
    return true;
}

void FormSurface::MarkRefused(int control)
{
    if (control == refused_)
        return;
    for (const auto& [marked, refused] : {std::pair(refused_, false), std::pair(control, true)}) {
        if (marked < 0)
            continue;
        WidgetOf(marked)->setProperty(kRefusedProperty, refused);
        WidgetOf(marked)->update();
    }
    refused_ = control;
}

bool FormSurface::PasteInto(int control, const QString& text)
{
    if (control < 0)
        return false;
    QWidget* widget = WidgetOf(control);
    if (const auto* box = qobject_cast<QComboBox*>(widget))
        widget = box->lineEdit();
    if (auto* line = qobject_cast<QLineEdit*>(widget); line && !line->isReadOnly())
        line->insert(text);
    else if (auto* memo = qobject_cast<QPlainTextEdit*>(widget); memo && !memo->isReadOnly())
        memo->insertPlainText(text);
    else
        return false;
    return true;
}

bool FormSurface::OpenMoreOf(int control)
{
    return control >= 0 && widgets_[size_t(control)]->OpenMore();
}

bool FormSurface::KeyPressed(int control, const QKeyEvent& event)
{
    QWidget* widget = WidgetOf(control);
    const bool plain = (event.modifiers() & ~Qt::KeypadModifier) == Qt::NoModifier;
    switch (event.key()) {
    case Qt::Key_Escape:
        return plain && Revert(FocusedControl());
    case Qt::Key_F4:
    case Qt::Key_F2:
        return plain && OpenMoreOf(control);
    case Qt::Key_Down:
        return event.modifiers() == Qt::AltModifier && OpenMoreOf(control);
    case Qt::Key_Return:
    case Qt::Key_Enter:
        if (!plain)
            return false;
        if (auto* button = qobject_cast<QPushButton*>(widget)) {
            button->click();
            return true;
        }
        if (!qobject_cast<QLineEdit*>(widget) && !qobject_cast<QAbstractButton*>(widget))
            return false;
        focusNextChild(); // as Tab: what was typed stands
        return true;
    default:
        return false;
    }
}

bool FormSurface::eventFilter(QObject* watched, QEvent* event)
{
    const auto known = controlOf_.constFind(watched);
    if (known == controlOf_.cend())
        return QWidget::eventFilter(watched, event);
    const int control = *known;
    auto& widget = *static_cast<QWidget*>(watched);
    switch (event->type()) {
    case QEvent::KeyPress:
        if (KeyPressed(control, *static_cast<QKeyEvent*>(event)))
            return true;
        break;
    case QEvent::FocusIn:
        if (!form_.Controls()[size_t(control)].edited)
            Remember(control);
        Q_EMIT focusMoved(WidgetOf(control));
        break;
    case QEvent::ContextMenu: {
        const auto* menu = static_cast<QContextMenuEvent*>(event);
        const bool keyboard = menu->reason() == QContextMenuEvent::Keyboard;
        Q_EMIT popupRequested(control,
                              keyboard ? widget.mapToGlobal(widget.rect().bottomLeft()) : menu->globalPos());
        return true;
    }
    case QEvent::Wheel:
        // Scrolling over a box that nobody works in changes no record.
        if (qobject_cast<QComboBox*>(WidgetOf(control)) && FocusedControl() != control) {
            event->ignore();
            return true;
        }
        break;
    case QEvent::MouseButtonPress:
    case QEvent::MouseMove:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
        FollowHold(widget, *static_cast<QMouseEvent*>(event));
        break;
    default:
        break;
    }
    return QWidget::eventFilter(watched, event);
}

bool FormSurface::event(QEvent* event)
{
    if (event->type() == QEvent::ContextMenu) {
        Q_EMIT popupRequested(-1, static_cast<QContextMenuEvent*>(event)->globalPos());
        return true;
    }
    return QWidget::event(event);
}

// A hold opens the popup menu, a tap or a drag does what it does in the control.
void FormSurface::FollowHold(QWidget& widget, const QMouseEvent& event)
{
    const QPoint at = widget.mapToGlobal(event.position().toPoint());
    const int wait = form_.Settings().holdTimeMs;
    if (event.type() == QEvent::MouseButtonPress && event.button() == Qt::LeftButton && wait > 0) {
        holdAt_ = at;
        holdControl_ = ControlOf(&widget);
        hold_.start(wait, this);
    } else if (event.type() != QEvent::MouseMove ||
               (at - holdAt_).manhattanLength() >= QApplication::startDragDistance()) {
        hold_.stop();
    }
}

void FormSurface::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != hold_.timerId()) {
        QWidget::timerEvent(event);
        return;
    }
    hold_.stop();
    if (!QApplication::activePopupWidget()) // the list of a drop-down box, which the tap has opened
        Q_EMIT popupRequested(holdControl_, holdAt_);
}

} // namespace mirel
