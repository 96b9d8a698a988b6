#include "app/display_choice.h"

namespace mirel {
namespace {

constexpr quint32 kHighestColor = 0x00FFFFFF;
constexpr quint32 kNoColor = 0xFF000000;

} // namespace

Setting DisplayChoice::SettingOf(ColorKind kind) const
{
    if (view_ == DisplayView::Main)
        return kind == ColorKind::Background ? Setting::MainViewBkColor : Setting::MainViewTextColor;
    return kind == ColorKind::Background ? Setting::TableViewBkColor : Setting::TableViewTextColor;
}

Setting DisplayChoice::FontSetting() const
{
    return view_ == DisplayView::Main ? Setting::MainViewFont : Setting::TableViewFont;
}

FontDesc DisplayChoice::Font() const
{
    FontDesc font = settings_.Font(FontSetting());
    font.color = Color(ColorPart::Lists, ColorKind::Text).value_or(0);
    return font;
}

bool DisplayChoice::HasFont() const
{
    return settings_.Font(FontSetting()) != FontDesc();
}

bool DisplayChoice::SetFont(const FontDesc& font)
{
    return settings_.SetFont(FontSetting(), font);
}

std::optional<quint32> DisplayChoice::Color(ColorPart part, ColorKind kind) const
{
    const std::optional<ColorRecord> record = settings_.Colors(SettingOf(kind));
    if (!record || record->colors[size_t(part)] > kHighestColor)
        return {};
    return record->colors[size_t(part)];
}

bool DisplayChoice::SetColor(ColorPart part, ColorKind kind, std::optional<quint32> color)
{
    ColorRecord record;
    record.colors.fill(kNoColor);
    record = settings_.Colors(SettingOf(kind)).value_or(record);
    record.colors[size_t(part)] = color.value_or(kNoColor);
    return settings_.SetColors(SettingOf(kind), record);
}

bool DisplayChoice::Reset()
{
    return settings_.SetFont(FontSetting(), FontDesc()) &&
           settings_.SetText(SettingOf(ColorKind::Background), {}) &&
           settings_.SetText(SettingOf(ColorKind::Text), {});
}

} // namespace mirel
