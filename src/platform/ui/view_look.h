#pragma once

#include <QColor>
#include <QFont>

#include <optional>

class QWidget;

namespace mirel {

// The font and the colours that the user chose for a view. What is not chosen is the desktop's.
struct ViewLook {
    struct Colors {
        std::optional<QColor> background;
        std::optional<QColor> text;

        friend bool operator==(const Colors&, const Colors&) = default;
    };

    std::optional<QFont> font;
    Colors line; // what stands alone: the database's name, the field with its editor
    Colors lists;
    Colors buttons;

    friend bool operator==(const ViewLook&, const ViewLook&) = default;
};

// What the user can choose of a view's look.
enum class LookItem {
    Font,
    LineBackground,
    ListBackground,
    ButtonBackground,
    LineText,
    ListText,
    ButtonText,
    Reset, // all of it
};

// Draws a widget and what it holds in these colours, and the desktop's for those that are not chosen. A text that
// could not be read on a chosen background becomes black or white.
void DrawAsLine(QWidget& widget, const ViewLook::Colors& colors);
void DrawAsList(QWidget& widget, const ViewLook::Colors& colors);
void DrawAsButtons(QWidget& widget, const ViewLook::Colors& colors);

} // namespace mirel
