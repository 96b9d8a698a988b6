#pragma once

#include <QString>

#include <functional>
#include <optional>

class QWidget;

namespace mirel {

// A text that its box is too small for.
struct LongText {
    QString title; // what the text is
    QString text;
    int lines = -1; // to be in sight at least; -1: as many as look well
    bool readOnly = false;
    std::function<void(const QString&)> typed{}; // hears each change; empty: nobody does
};

// Edits the text in a large box over `parent`'s window. Gives the text; empty when the user cancelled.
std::optional<QString> EditLongText(const LongText& longText, QWidget& parent);

} // namespace mirel
