#include "forms/ui/control_widget.h"

#include "forms/ui/control_look.h"
#include "forms/ui/edit_box.h"
#include "forms/ui/record_list.h"
#include "forms/ui/simple_controls.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using ListSource = ControlWidget::ListSource;

template <typename Widget>
std::unique_ptr<ControlWidget> MakeWidget(const ControlRun& control, const ListSource&, QWidget& surface)
{
    return std::make_unique<Widget>(control, surface);
}

std::unique_ptr<ControlWidget> MakeEdit(const ControlRun& control, const ListSource&, QWidget& surface)
{
    return MakeEditBox(control, surface);
}

std::unique_ptr<ControlWidget> MakeList(const ControlRun& control, const ListSource& list, QWidget& surface)
{
    return std::make_unique<ListWidget>(control, list, surface);
}

struct WidgetOfType {
    ControlType type;
    std::unique_ptr<ControlWidget> (*make)(const ControlRun&, const ListSource&, QWidget&);
};
constexpr std::array kWidgets = {
    WidgetOfType{ControlType::Label, &MakeWidget<LabelWidget>},
    WidgetOfType{ControlType::EditBox, &MakeEdit},
    WidgetOfType{ControlType::CheckBox, &MakeWidget<CheckBoxWidget>},
    WidgetOfType{ControlType::DropDownBox, &MakeWidget<DropDownWidget>},
    WidgetOfType{ControlType::List, &MakeList},
    WidgetOfType{ControlType::Button, &MakeWidget<ButtonWidget>},
};

} // namespace

ControlWidget::ControlWidget(const ControlRun& control, QWidget& main)
    : definition_(*control.definition)
    , main_(&main)
{
    main.setObjectName(QString::number(control.windowId));
    main.setAccessibleName(control.name);
}

ControlWidget::~ControlWidget() = default;

void ControlWidget::Place(const SurfaceScale& scale)
{
    const ControlParts parts = PartsOf(definition_);
    const QRect place = scale.Of(parts.main);
    const QFont font = FontOf(definition_.textStyle, scale.OfText(), TextRoomPx(place.height()));
    if (main_->font() != font)
        main_->setFont(font);
    main_->setGeometry(place);
    main_->setVisible(!place.isEmpty());
    if (strip_) {
        strip_->setGeometry(scale.Of(parts.second));
        strip_->setVisible(!parts.second.isEmpty());
    }
}

void ControlWidget::SetColors(QPalette::ColorRole background, QPalette::ColorRole text)
{
    main_->setPalette(
        PaletteOf(main_->palette(), definition_.backgroundColor, definition_.textStyle.color, background, text));
}

std::unique_ptr<ControlWidget> ControlWidget::Make(const ControlRun& control, const ListSource& list,
                                                   QWidget& surface)
{
    const auto row = std::ranges::find(kWidgets, control.type, &WidgetOfType::type);
    const auto make = row == kWidgets.end() ? &MakeWidget<LabelWidget> : row->make; // unknown: what it is called
    return make(control, list, surface);
}

} // namespace mirel
