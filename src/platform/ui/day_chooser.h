#pragma once

#include <QPoint>
#include <QString>

#include <optional>

class QWidget;

namespace mirel {

// A calendar that pops up at a place of the screen, for a date and time as text in the user's form. It opens on
// the text's day, else on today. Gives the text with the chosen day, its time left as it was; empty when none
// was chosen.
std::optional<QString> ChooseDay(const QString& text, QPoint globalPosition, QWidget& parent);

} // namespace mirel
