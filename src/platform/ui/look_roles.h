#pragma once

#include <QColor>
#include <QPalette>

namespace mirel {

// What a colour is for. The program's own palettes give each role a colour, once for light and once for dark;
// widgets ask for the role.
enum class LookRole {
    Window,     // the ground of windows, bars and dialogs
    Base,       // the ground of cells, lists and editors
    Alternate,  // every other line of a list, strips beside a grid
    Line,       // between cells and parts
    Edge,       // around what can be operated
    Text,       //
    Dim,        // second lines, placeholders, NULL
    Accent,     // selection, focus, links
    AccentText, // on Accent
    Warning,    // what will not be stored as it stands
    Error,      // what was refused
};

enum class LookScheme { Light, Dark };

QColor ColorOfRole(LookRole role, LookScheme scheme);

// The role's colour beside the others of that palette, be it ours or the desktop's: what a palette knows comes
// from it, the rest from our scheme that goes with its ground.
QColor ColorOfRole(LookRole role, const QPalette& palette);
LookScheme SchemeOf(const QPalette& palette);

QPalette PaletteOfScheme(LookScheme scheme);

// The property of an editor whose text was refused: our style draws its edge in the error's colour.
inline constexpr char kRefusedProperty[] = "refused";

// The colour that lies `strength` (0 to 1) of the way from `under` to `over`.
QColor Blend(const QColor& over, const QColor& under, float strength);

// All distances between and around widgets, in logical pixels.
namespace spacing {
constexpr int kTight = 4;
constexpr int kGap = 8;
constexpr int kRoom = 12;
constexpr int kWide = 16;
constexpr int kSection = 24;
constexpr int kCorner = 4;
} // namespace spacing

} // namespace mirel
