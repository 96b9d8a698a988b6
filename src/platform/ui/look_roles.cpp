#include "platform/ui/look_roles.h"

#include <algorithm>
#include <array>
#include <optional>

namespace mirel {
namespace {

struct RoleRow {
    LookRole role;
    QRgb light;
    QRgb dark;
};

// The contrasts between them are held by a test: texts 4.5, edges 3, lines 1.4.
constexpr std::array kRoles = {
    RoleRow{LookRole::Window, 0xfff5f6f8, 0xff1f2329},     RoleRow{LookRole::Base, 0xffffffff, 0xff171a1f},
    RoleRow{LookRole::Alternate, 0xfffafbfc, 0xff1b1f24},  RoleRow{LookRole::Line, 0xffccd3da, 0xff3a424c},
    RoleRow{LookRole::Edge, 0xff808994, 0xff7c8794},       RoleRow{LookRole::Text, 0xff1b1f24, 0xffe7eaee},
    RoleRow{LookRole::Dim, 0xff5b6570, 0xffa3adb8},        RoleRow{LookRole::Accent, 0xff1f6fb2, 0xff62a8e5},
    RoleRow{LookRole::AccentText, 0xffffffff, 0xff0e1318}, RoleRow{LookRole::Warning, 0xff8a5a00, 0xffe5b454},
    RoleRow{LookRole::Error, 0xffb3261e, 0xffff8a80},
};
static_assert([] {
    for (size_t i = 0; i < kRoles.size(); ++i) {
        if (kRoles[i].role != LookRole(i))
            return false;
    }
    return kRoles.size() == size_t(LookRole::Error) + 1;
}());

// What Qt's roles stand for; the first row of a role of ours is where its colour is found again.
struct PaletteRow {
    QPalette::ColorRole qt;
    LookRole role;
};
constexpr std::array kPalette = {
    PaletteRow{QPalette::Window, LookRole::Window},
    PaletteRow{QPalette::WindowText, LookRole::Text},
    PaletteRow{QPalette::Base, LookRole::Base},
    PaletteRow{QPalette::AlternateBase, LookRole::Alternate},
    PaletteRow{QPalette::Text, LookRole::Text},
    PaletteRow{QPalette::PlaceholderText, LookRole::Dim},
    PaletteRow{QPalette::Button, LookRole::Base},
    PaletteRow{QPalette::ButtonText, LookRole::Text},
    PaletteRow{QPalette::BrightText, LookRole::Error},
    PaletteRow{QPalette::Highlight, LookRole::Accent},
    PaletteRow{QPalette::HighlightedText, LookRole::AccentText},
    PaletteRow{QPalette::Link, LookRole::Accent},
    PaletteRow{QPalette::LinkVisited, LookRole::Accent},
    PaletteRow{QPalette::ToolTipBase, LookRole::Base},
    PaletteRow{QPalette::ToolTipText, LookRole::Text},
    PaletteRow{QPalette::Light, LookRole::Base},
    PaletteRow{QPalette::Midlight, LookRole::Alternate},
    PaletteRow{QPalette::Mid, LookRole::Line},
    PaletteRow{QPalette::Dark, LookRole::Edge},
    PaletteRow{QPalette::Shadow, LookRole::Edge},
};

// What cannot be operated now, between its colour and the ground.
constexpr float kDisabled = 0.5F;

bool IsInk(LookRole role)
{
    return role == LookRole::Text || role == LookRole::Dim || role == LookRole::Accent;
}

// The roles of ours that every palette has.
std::optional<QPalette::ColorRole> QtRoleOf(LookRole role)
{
    if (role == LookRole::Line || role == LookRole::Edge || role == LookRole::Warning || role == LookRole::Error)
        return std::nullopt;
    if (role == LookRole::Text)
        return QPalette::Text;
    return std::ranges::find(kPalette, role, &PaletteRow::role)->qt;
}

} // namespace

QColor ColorOfRole(LookRole role, LookScheme scheme)
{
    const RoleRow& row = kRoles[size_t(role)];
    return QColor::fromRgb(scheme == LookScheme::Light ? row.light : row.dark);
}

QColor ColorOfRole(LookRole role, const QPalette& palette)
{
    const std::optional<QPalette::ColorRole> known = QtRoleOf(role);
    return known ? palette.color(QPalette::Active, *known) : ColorOfRole(role, SchemeOf(palette));
}

LookScheme SchemeOf(const QPalette& palette)
{
    const auto lightness = [&](QPalette::ColorRole role) {
        return palette.color(QPalette::Active, role).lightness();
    };
    return lightness(QPalette::Base) >= lightness(QPalette::Text) ? LookScheme::Light : LookScheme::Dark;
}

QPalette PaletteOfScheme(LookScheme scheme)
{
    QPalette palette;
    const QColor ground = ColorOfRole(LookRole::Window, scheme);
    for (const PaletteRow& row : kPalette) {
        const QColor color = ColorOfRole(row.role, scheme);
        palette.setColor(QPalette::Active, row.qt, color);
        palette.setColor(QPalette::Inactive, row.qt, color);
        const QColor idle = row.role == LookRole::Base ? ground : color;
        palette.setColor(QPalette::Disabled, row.qt, IsInk(row.role) ? Blend(color, ground, kDisabled) : idle);
    }
    return palette;
}

QColor Blend(const QColor& over, const QColor& under, float strength)
{
    const auto mix = [strength](float a, float b) { return a * strength + b * (1 - strength); };
    return QColor::fromRgbF(mix(over.redF(), under.redF()), mix(over.greenF(), under.greenF()),
                            mix(over.blueF(), under.blueF()));
}

} // namespace mirel
