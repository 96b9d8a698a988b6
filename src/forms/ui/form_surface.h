#pragma once

#include "forms/running_form.h"
#include "forms/ui/control_widget.h"

#include <QBasicTimer>
#include <QWidget>

#include <optional>

namespace mirel {

// The form's surface: its controls at their places. Hands what the user does in them to the running form and
// says so; shows of the form what has changed since it was last asked to. Tab goes through the controls in list
// order.
//
// The form must outlive the surface.
class FormSurface : public QWidget {
    Q_OBJECT

public:
    FormSurface(RunningForm& form, QWidget* parent);
    ~FormSurface() override;

    void ShowState();

    // In the form's pixels, large enough for every control that a window can reach.
    QSize FormSize() const { return formSize_; }
    void SetScale(const SurfaceScale& scale);
    const SurfaceScale& Scale() const { return scale_; }

    QWidget* WidgetOf(int control) const { return widgets_[size_t(control)]->Main(); }
    int ControlOf(const QObject* widget) const; // -1: none of them, nor within one
    int FocusedControl() const;                 // -1: none
    // The first box that a record's value is kept in; if there are only others in the top `heightPx`, one of
    // those.
    void FocusFirstInput(int heightPx = QWIDGETSIZE_MAX);
    void FocusControl(int control);
    // Gives a control its text of before back. False when it has that already.
    bool Revert(int control);
    const QString& TextBefore(int control) const { return before_[size_t(control)]; }
    // The edge of an editor whose text cannot be stored.
    void MarkRefused(int control); // -1: none
    // At the caret of a text control, or over what is selected in it. False: nothing can be typed there.
    bool PasteInto(int control, const QString& text);
    // See ControlWidget::OpenMore.
    bool OpenMoreOf(int control);

Q_SIGNALS:
    // The user did something; the form has already answered.
    void acted();
    void focusMoved(QWidget* widget);
    void popupRequested(int control, const QPoint& globalPosition); // control -1: beside all of them

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    bool event(QEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    void MakeControls();
    void ConnectControl(int control);
    void Watch(QWidget& widget, int control);
    void OrderTabs();
    void AlignLabels();
    bool IsInput(int control) const;
    bool IsComputed(int control) const;
    bool KeyPressed(int control, const QKeyEvent& event);
    void FollowHold(QWidget& widget, const QMouseEvent& event);
    void Remember(int control);
    template <typename Action>
    void Act(Action action);

    RunningForm& form_;
    std::vector<std::unique_ptr<ControlWidget>> widgets_; // one a control, in list order
    QHash<const QObject*, int> controlOf_;
    std::vector<quint64> shown_;  // each control's revision
    std::vector<QString> before_; // each control's text before the user edited it
    int refused_ = -1;
    QSize formSize_;
    SurfaceScale scale_;
    QBasicTimer hold_;
    QPoint holdAt_;
    int holdControl_ = -1;
};

} // namespace mirel
