#include "app/ui/look.h"

#include "app/ui/compact_tab_bar.h"
#include "resources/ui/theme_icon.h"

#include <QApplication>
#include <QInputDevice>
#include <QStyleFactory>
#include <QStyleOptionMenuItem>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

constexpr int kStylusTarget = 24;
constexpr int kFingerTarget = 32;

// A colour of a palette, light and dark.
struct RoleColours {
    QPalette::ColorRole role;
    QRgb light;
    QRgb dark;
    QRgb lightDisabled;
    QRgb darkDisabled;
};

constexpr std::array kColours = {
    RoleColours{QPalette::Window, 0xfff3f4f5, 0xff24272b, 0xfff3f4f5, 0xff24272b},
    RoleColours{QPalette::WindowText, 0xff1d2226, 0xffe6e9ec, 0xff8e959b, 0xff7d858c},
    RoleColours{QPalette::Base, 0xffffffff, 0xff1a1c1f, 0xfff3f4f5, 0xff24272b},
    RoleColours{QPalette::AlternateBase, 0xfff6f8f9, 0xff202327, 0xfff3f4f5, 0xff24272b},
    RoleColours{QPalette::Text, 0xff1d2226, 0xffe6e9ec, 0xff8e959b, 0xff7d858c},
    RoleColours{QPalette::PlaceholderText, 0xff7b848b, 0xff8b949b, 0xffa9b0b5, 0xff666e75},
    RoleColours{QPalette::Button, 0xffe9ebed, 0xff31353a, 0xffeef0f1, 0xff2a2d31},
    RoleColours{QPalette::ButtonText, 0xff1d2226, 0xffe6e9ec, 0xffa2a9af, 0xff6d757c},
    RoleColours{QPalette::BrightText, 0xffffffff, 0xffffffff, 0xffffffff, 0xffffffff},
    RoleColours{QPalette::Highlight, 0xff2a73a3, 0xff3a86b8, 0xffb9c3ca, 0xff3d444a},
    RoleColours{QPalette::HighlightedText, 0xffffffff, 0xffffffff, 0xff5c656c, 0xff9aa2a9},
    RoleColours{QPalette::Link, 0xff1f6796, 0xff6db6e6, 0xff8e959b, 0xff7d858c},
    RoleColours{QPalette::LinkVisited, 0xff6b4f96, 0xffb9a0e0, 0xff8e959b, 0xff7d858c},
    RoleColours{QPalette::ToolTipBase, 0xfffdfdf4, 0xff3a3f45, 0xfffdfdf4, 0xff3a3f45},
    RoleColours{QPalette::ToolTipText, 0xff1d2226, 0xffe6e9ec, 0xff1d2226, 0xffe6e9ec},
    RoleColours{QPalette::Light, 0xffffffff, 0xff43484e, 0xffffffff, 0xff43484e},
    RoleColours{QPalette::Midlight, 0xfff6f7f8, 0xff3a3f44, 0xfff6f7f8, 0xff3a3f44},
    RoleColours{QPalette::Mid, 0xffbcc2c7, 0xff17191b, 0xffbcc2c7, 0xff17191b},
    RoleColours{QPalette::Dark, 0xffa0a7ad, 0xff121416, 0xffa0a7ad, 0xff121416},
    RoleColours{QPalette::Shadow, 0xff6f767c, 0xff0a0b0c, 0xff6f767c, 0xff0a0b0c},
};

QPalette PaletteOf(QRgb RoleColours::*normal, QRgb RoleColours::*disabled)
{
    QPalette palette;
    for (const RoleColours& colours : kColours) {
        palette.setColor(QPalette::Active, colours.role, QColor(colours.*normal));
        palette.setColor(QPalette::Inactive, colours.role, QColor(colours.*normal));
        palette.setColor(QPalette::Disabled, colours.role, QColor(colours.*disabled));
    }
    return palette;
}

bool HasTouchScreen()
{
    return std::ranges::any_of(QInputDevice::devices(), [](const QInputDevice* device) {
        return device->type() == QInputDevice::DeviceType::TouchScreen;
    });
}

} // namespace

QPalette LightPalette()
{
    return PaletteOf(&RoleColours::light, &RoleColours::lightDisabled);
}

QPalette DarkPalette()
{
    return PaletteOf(&RoleColours::dark, &RoleColours::darkDisabled);
}

bool UsePalette(QStringView name)
{
    if (name != u"light" && name != u"dark")
        return false;
    QApplication::setStyle(new TouchTargetStyle(QStringLiteral("Fusion")));
    QApplication::setPalette(name == u"dark" ? DarkPalette() : LightPalette());
    UseOwnIconsOnly();
    return true;
}

TouchTargetStyle::TouchTargetStyle(const QString& baseStyle)
    : QProxyStyle(baseStyle.isEmpty() ? nullptr : QStyleFactory::create(baseStyle))
    , target_(HasTouchScreen() ? kFingerTarget : kStylusTarget)
    , own_(!baseStyle.isEmpty())
{
}

QSize TouchTargetStyle::sizeFromContents(ContentsType type, const QStyleOption* option, const QSize& contentsSize,
                                         const QWidget* widget) const
{
    const QSize size = QProxyStyle::sizeFromContents(type, option, contentsSize, widget);
    switch (type) {
    case CT_PushButton:
    case CT_ToolButton:
        return size.expandedTo(QSize(target_, target_));
    case CT_CheckBox:
    case CT_RadioButton:
    case CT_ComboBox:
    case CT_LineEdit:
    case CT_SpinBox:
    case CT_MenuBarItem:
    case CT_TabBarTab:
    case CT_ItemViewItem:
        return size.expandedTo(QSize(0, target_));
    case CT_MenuItem: {
        const auto* item = qstyleoption_cast<const QStyleOptionMenuItem*>(option);
        const bool line = item && item->menuItemType == QStyleOptionMenuItem::Separator;
        return line ? size : size.expandedTo(QSize(0, target_));
    }
    default:
        return size;
    }
}

int TouchTargetStyle::pixelMetric(PixelMetric metric, const QStyleOption* option, const QWidget* widget) const
{
    const int roomy = QProxyStyle::pixelMetric(metric, option, widget);
    const auto* tabs = metric == PM_TabBarTabHSpace ? qobject_cast<const CompactTabBar*>(widget) : nullptr;
    return tabs ? tabs->SpaceInTabPx(roomy) : roomy;
}

int TouchTargetStyle::styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                                QStyleHintReturn* returnData) const
{
    // The style's own pictures on OK and Cancel go with no palette of ours.
    if (own_ && hint == SH_DialogButtonBox_ButtonsHaveIcons)
        return 0;
    return QProxyStyle::styleHint(hint, option, widget, returnData);
}

QIcon TouchTargetStyle::standardIcon(StandardPixmap which, const QStyleOption* option, const QWidget* widget) const
{
    if (own_) {
        switch (which) {
        case SP_MessageBoxQuestion:
            return ThemeIcon(u"dialog-question");
        case SP_MessageBoxInformation:
            return ThemeIcon(u"dialog-information");
        case SP_MessageBoxWarning:
            return ThemeIcon(u"dialog-warning");
        case SP_MessageBoxCritical:
            return ThemeIcon(u"dialog-error");
        default:
            break;
        }
    }
    return QProxyStyle::standardIcon(which, option, widget);
}

} // namespace mirel
