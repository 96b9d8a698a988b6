#include "platform/ui/view_look.h"

#include <QApplication>
#include <QPalette>
#include <QWidget>

#include <cmath>
#include <initializer_list>

namespace mirel {
namespace {

// How far a quieter text stands from the text's own colour.
constexpr float kQuiet = 0.42F;

QColor Between(const QColor& from, const QColor& to, float way)
{
    const auto mix = [way](float a, float b) { return a + (b - a) * way; };
    return QColor::fromRgbF(mix(from.redF(), to.redF()), mix(from.greenF(), to.greenF()),
                            mix(from.blueF(), to.blueF()));
}

float Brightness(const QColor& color)
{
    return 0.299F * color.redF() + 0.587F * color.greenF() + 0.114F * color.blueF();
}

// The text's colour, where it is chosen; else the desktop's, as long as it can be read on the chosen background.
std::optional<QColor> Ink(const ViewLook::Colors& colors, const QColor& desktops)
{
    constexpr float kReadable = 0.35F;
    if (colors.text || !colors.background)
        return colors.text;
    const float ground = Brightness(*colors.background);
    if (std::abs(ground - Brightness(desktops)) >= kReadable)
        return {};
    return ground > 0.5F ? QColor(Qt::black) : QColor(Qt::white);
}

// A palette that names only what was chosen: for all else the widget goes on following the desktop's.
class Choice {
public:
    void Set(std::initializer_list<QPalette::ColorRole> roles, const std::optional<QColor>& color)
    {
        for (const QPalette::ColorRole role : roles) {
            if (!color)
                continue;
            palette_.setColor(QPalette::Active, role, *color);
            palette_.setColor(QPalette::Inactive, role, *color);
        }
    }
    const QPalette& Palette() const { return palette_; }

private:
    QPalette palette_{NoRoles()};

    static QPalette NoRoles()
    {
        QPalette palette;
        palette.setResolveMask(0);
        return palette;
    }
};

} // namespace

void DrawAsLine(QWidget& widget, const ViewLook::Colors& colors)
{
    Choice choice;
    choice.Set({QPalette::Window}, colors.background);
    choice.Set({QPalette::WindowText}, Ink(colors, QApplication::palette().color(QPalette::WindowText)));
    widget.setAutoFillBackground(colors.background.has_value());
    widget.setPalette(choice.Palette());
}

void DrawAsList(QWidget& widget, const ViewLook::Colors& colors)
{
    const QPalette desktop = QApplication::palette();
    const std::optional<QColor> chosen = Ink(colors, desktop.color(QPalette::Text));
    const QColor ground = colors.background.value_or(desktop.color(QPalette::Base));
    const QColor ink = chosen.value_or(desktop.color(QPalette::Text));
    Choice choice;
    choice.Set({QPalette::Base}, colors.background);
    choice.Set({QPalette::Text}, chosen);
    if (colors.background || colors.text) {
        choice.Set({QPalette::PlaceholderText}, Between(ink, ground, kQuiet));
        choice.Set({QPalette::AlternateBase}, Between(ground, ink, 0.05F));
    }
    widget.setPalette(choice.Palette());
}

void DrawAsButtons(QWidget& widget, const ViewLook::Colors& colors)
{
    Choice choice;
    choice.Set({QPalette::Button, QPalette::Window}, colors.background);
    choice.Set({QPalette::ButtonText, QPalette::WindowText},
               Ink(colors, QApplication::palette().color(QPalette::ButtonText)));
    widget.setPalette(choice.Palette());
}

} // namespace mirel
