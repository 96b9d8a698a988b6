#include "app/ui/display_look.h"

#include "app/ui/colors_dialog.h"
#include "app/ui/fonts_dialog.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

struct ColorRow {
    LookItem item;
    ColorPart part;
    ColorKind kind;
};
constexpr std::array kColors = {
    ColorRow{LookItem::LineBackground, ColorPart::Line, ColorKind::Background},
    ColorRow{LookItem::ListBackground, ColorPart::Lists, ColorKind::Background},
    ColorRow{LookItem::ButtonBackground, ColorPart::Buttons, ColorKind::Background},
    ColorRow{LookItem::LineText, ColorPart::Line, ColorKind::Text},
    ColorRow{LookItem::ListText, ColorPart::Lists, ColorKind::Text},
    ColorRow{LookItem::ButtonText, ColorPart::Buttons, ColorKind::Text},
};

std::optional<QColor> ColorOf(const DisplayChoice& choice, ColorPart part, ColorKind kind)
{
    const std::optional<quint32> color = choice.Color(part, kind);
    return color ? std::optional(ColorOfRef(*color)) : std::nullopt;
}

ViewLook::Colors ColorsOf(const DisplayChoice& choice, ColorPart part)
{
    return {ColorOf(choice, part, ColorKind::Background), ColorOf(choice, part, ColorKind::Text)};
}

// The dialog opens on what is drawn now, be it chosen or the desktop's.
bool ChooseFont(DisplayChoice& choice, QWidget& view)
{
    FontDesc font = choice.Font();
    if (!choice.HasFont()) {
        font.faceName = view.font().family();
        font.size = view.font().pointSize();
    }
    const std::optional<QColor> ink = ColorOf(choice, ColorPart::Lists, ColorKind::Text);
    font.color = RefOfColor(ink.value_or(view.palette().color(QPalette::Text)));
    CFontsDialog dialog(font, &view);
    if (dialog.exec() != QDialog::Accepted)
        return false;
    if (dialog.Chosen().color != font.color)
        (void)choice.SetColor(ColorPart::Lists, ColorKind::Text, dialog.Chosen().color);
    return choice.SetFont(dialog.Chosen());
}

} // namespace

ViewLook LookOf(const DisplayChoice& choice)
{
    return {.font = choice.HasFont() ? std::optional(FontOf(choice.Font())) : std::nullopt,
            .line = ColorsOf(choice, ColorPart::Line),
            .lists = ColorsOf(choice, ColorPart::Lists),
            .buttons = ColorsOf(choice, ColorPart::Buttons)};
}

bool ChooseLook(DisplayChoice& choice, LookItem item, QWidget& view)
{
    if (item == LookItem::Font)
        return ChooseFont(choice, view);
    if (item == LookItem::Reset)
        return choice.Reset();
    const ColorRow& row = *std::ranges::find(kColors, item, &ColorRow::item);
    CColorsDialog dialog(ColorOf(choice, row.part, row.kind), CColorsDialog::Unset::Offered, &view);
    if (dialog.exec() != QDialog::Accepted)
        return false;
    const std::optional<QColor> color = dialog.Chosen();
    return choice.SetColor(row.part, row.kind, color ? std::optional(RefOfColor(*color)) : std::nullopt);
}

} // namespace mirel
