#include "forms/control_types.h"

#include "resources/string_table.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

constexpr std::array kTypes = {
    ControlTypeDef{ControlType::Label, Str::TypeLabel, u"Label", HasCaption | TakesGround, SourceKind::None,
                   0x50000002, 70, 16},
    ControlTypeDef{ControlType::EditBox, Str::TypeEditBox, u"EditBox", HoldsValue | ShowsText,
                   SourceKind::Expression, 0x50810080, 120, 20},
    ControlTypeDef{ControlType::CheckBox, Str::TypeCheckBox, u"CheckBox", HoldsValue | IsTicked | TakesGround,
                   SourceKind::Expression, 0x50010003, 16, 16},
    ControlTypeDef{ControlType::DropDownBox, Str::TypeDropDownBox, u"DropDownBox",
                   HoldsValue | ShowsText | HasItems, SourceKind::Items, 0x50210002, 120, 22},
    ControlTypeDef{ControlType::List, Str::TypeList, u"List", HasRows, SourceKind::Columns, 0x50b10000, 210, 90},
    ControlTypeDef{ControlType::Button, Str::TypeButton, u"Button", HasCaption | IsPressed, SourceKind::Function,
                   0x50010000, 70, 24},
};
constexpr ControlTypeDef kOther{ControlType::None, Str::TypeOther, u"Control", 0, SourceKind::None, 0, 70, 20};

} // namespace

std::span<const ControlTypeDef> ControlTypes()
{
    return kTypes;
}

const ControlTypeDef& TypeOf(ControlType type)
{
    const auto row = std::ranges::find(kTypes, type, &ControlTypeDef::type);
    return row == kTypes.end() ? kOther : *row;
}

} // namespace mirel
