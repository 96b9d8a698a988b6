#include "app/ui/look.h"

#include "app/ui/compact_tab_bar.h"
#include "app/ui/flat_style.h"
#include "platform/ui/look_roles.h"
#include "resources/ui/theme_icon.h"

#include <QApplication>
#include <QInputDevice>
#include <QStyleFactory>
#include <QStyleOptionMenuItem>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kStylusTarget = 24;
constexpr int kFingerTarget = 32;

bool HasTouchScreen()
{
    return std::ranges::any_of(QInputDevice::devices(), [](const QInputDevice* device) {
        return device->type() == QInputDevice::DeviceType::TouchScreen;
    });
}

} // namespace

bool UsePalette(QStringView name)
{
    if (name != u"light" && name != u"dark" && name != u"own")
        return false;
    const LookScheme desktops = SchemeOf(QApplication::palette());
    const LookScheme scheme = name == u"own" ? desktops : name == u"dark" ? LookScheme::Dark : LookScheme::Light;
    QApplication::setStyle(new FlatStyle);
    QApplication::setPalette(PaletteOfScheme(scheme));
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
    // A menu higher than the screen scrolls; in columns beside one another it would be cut.
    if (hint == SH_Menu_Scrollable)
        return 1;
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
        case SP_ToolBarHorizontalExtensionButton:
        case SP_ToolBarVerticalExtensionButton:
            return ThemeIcon(u"mirel-more");
        case SP_LineEditClearButton:
            return ThemeIcon(u"edit-clear");
        default:
            break;
        }
    }
    return QProxyStyle::standardIcon(which, option, widget);
}

} // namespace mirel
