#pragma once

#include <QSize>
#include <QString>

class QWidget;

namespace mirel {

// What holds of every window and dialog on a screen of that size: all of it within the screen, no text cut without
// a sign and a way to read it, each control named for a screen reader and in the way of the Tab key.
//
// With MIREL_PICTURES=<folder> in the environment it is painted there under that name and the screen's size.
void ExpectFits(QWidget& whole, const QString& name, QSize screen);
void Paint(QWidget& shown, const QString& name);

} // namespace mirel
