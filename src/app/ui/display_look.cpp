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

// A form's text style and the description of a font hold the same; a color of none is the desktop's.
bool ChooseTextStyle(TextStyle& style, QWidget& parent)
{
    FontDesc font;
    font.faceName = style.faceName.IsEmpty() ? parent.font().family() : style.faceName.Text();
    font.size = style.pointSize > 0 ? style.pointSize : parent.font().pointSize();
    font.bold = style.bold != 0 ? 1 : 0;
    font.italic = style.italic != 0 ? 1 : 0;
    font.strikeout = style.strikeout != 0 ? 1 : 0;
    font.underline = style.underline != 0 ? 1 : 0;
    font.color = style.color == kDefaultColor ? RefOfColor(parent.palette().color(QPalette::Text)) : style.color;
    CFontsDialog dialog(font, &parent);
    if (dialog.exec() != QDialog::Accepted || dialog.Chosen() == font)
        return false;
    const FontDesc& chosen = dialog.Chosen();
    if (chosen.faceName != font.faceName)
        style.faceName.Set(chosen.faceName);
    if (chosen.size != font.size)
        style.pointSize = chosen.size;
    if (chosen.color != font.color)
        style.color = chosen.color;
    const auto put = [](quint32& flag, int was, int is) {
        if (was != is)
            flag = quint32(is);
    };
    put(style.bold, font.bold, chosen.bold);
    put(style.italic, font.italic, chosen.italic);
    put(style.strikeout, font.strikeout, chosen.strikeout);
    put(style.underline, font.underline, chosen.underline);
    return true;
}

bool ChooseStoredColor(quint32& color, QWidget& parent)
{
    const std::optional<QColor> before = color == kDefaultColor ? std::nullopt : std::optional(ColorOfRef(color));
    CColorsDialog dialog(before, CColorsDialog::Unset::Offered, &parent);
    if (dialog.exec() != QDialog::Accepted)
        return false;
    const std::optional<QColor> chosen = dialog.Chosen();
    color = chosen ? RefOfColor(*chosen) : kDefaultColor;
    return true;
}

} // namespace

ViewLook LookOf(const DisplayChoice& choice)
{
    return {.font = choice.HasFont() ? std::optional(FontOf(choice.Font())) : std::nullopt,
            .line = ColorsOf(choice, ColorPart::Line),
            .lists = ColorsOf(choice, ColorPart::Lists),
            .buttons = ColorsOf(choice, ColorPart::Buttons)};
}

MakerDialogs MakerDialogsOf()
{
    return {.chooseFont = ChooseTextStyle, .chooseColor = ChooseStoredColor};
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
