#pragma once

#include "forms/form_records.h"

#include <QFont>
#include <QPalette>

#include <optional>

class QWidget;

namespace mirel {

// How a form's records say that a control looks, as a font and a palette.

// The style's font at that scale. `roomPx` is the height that a line of it may take: a font that is higher is
// made smaller, down to what can just be read; 0: any.
QFont FontOf(const TextStyle& style, qreal scale, int roomPx);

// Makes the font of a text that is wider than its room smaller, down to that part of it.
void NarrowToFit(QWidget& widget, const QString& text, int roomPx, qreal least);

// What a line of the style's text takes of the form's height, in the form's pixels.
int LineHeightOf(const TextStyle& style);

// A stored colour; none: the user's palette decides.
std::optional<QColor> ColorOf(quint32 stored);

// The palette for a control whose text stands on `background` (a role of the palette). What the record leaves
// open is the user's; where it names only one of text and background, the other one is chosen to be read on it,
// so that a form made in light colours can be read in the dark.
QPalette PaletteOf(const QPalette& base, quint32 background, quint32 text, QPalette::ColorRole backgroundRole,
                   QPalette::ColorRole textRole);

Qt::Alignment AlignmentOf(quint32 windowStyle);

} // namespace mirel
