#include "forms/ui/control_widget.h"

#include "forms/ui/control_look.h"
#include "forms/ui/edit_box.h"
#include "forms/ui/record_list.h"
#include "forms/ui/simple_controls.h"

namespace mirel {

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
    switch (control.type) {
    case ControlType::EditBox:
        return MakeEditBox(control, surface);
    case ControlType::List:
        return std::make_unique<ListWidget>(control, list, surface);
    case ControlType::DropDownBox:
        return std::make_unique<DropDownWidget>(control, surface);
    case ControlType::Button:
        return std::make_unique<ButtonWidget>(control, surface);
    case ControlType::CheckBox:
        return std::make_unique<CheckBoxWidget>(control, surface);
    case ControlType::Label:
    case ControlType::None:
        break;
    }
    return std::make_unique<LabelWidget>(control, surface); // of a number without a meaning: what it is called
}

} // namespace mirel
