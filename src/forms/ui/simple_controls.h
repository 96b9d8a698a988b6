#pragma once

#include "forms/ui/control_widget.h"

class QComboBox;
class QLabel;
class QPushButton;

namespace mirel {

class TickBox;

class LabelWidget : public ControlWidget {
    Q_OBJECT
public:
    LabelWidget(const ControlRun& control, QWidget& surface);
    void Show(const ControlRun& control) override;
    void Place(const SurfaceScale& scale) override;
    void AlignTextTo(const QWidget& box) override;

private:
    bool IsSingleLine() const;
    void ShowText();

    QLabel* label_;
    QString text_;
};

class DropDownWidget : public ControlWidget {
    Q_OBJECT
public:
    DropDownWidget(const ControlRun& control, QWidget& surface);
    void Show(const ControlRun& control) override;
    void Place(const SurfaceScale& scale) override;
    bool OpenMore() override;

protected:
    int TextRoomPx(int heightPx) const override;

private:
    QComboBox* box_;
};

class ButtonWidget : public ControlWidget {
    Q_OBJECT
public:
    ButtonWidget(const ControlRun& control, QWidget& surface);
    void Show(const ControlRun& control) override;
    void Place(const SurfaceScale& scale) override;

protected:
    int TextRoomPx(int heightPx) const override;

private:
    QPushButton* button_;
};

class CheckBoxWidget : public ControlWidget {
    Q_OBJECT
public:
    CheckBoxWidget(const ControlRun& control, QWidget& surface);
    void Show(const ControlRun& control) override;
    void Place(const SurfaceScale& scale) override;

private:
    TickBox* box_;
};

} // namespace mirel
