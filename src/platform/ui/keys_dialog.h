#pragma once

#include <QList>
#include <QString>

class QWidget;

namespace mirel {

// A line of the list of keys: "Ctrl+F", "Find".
struct KeyHint {
    QString keys;
    QString what; // mnemonics are left out
};

// Shows the keys of a window in a dialog over it.
void ShowKeyHints(QWidget& window, const QList<KeyHint>& rows);

} // namespace mirel
