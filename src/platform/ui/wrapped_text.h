#pragma once

#include <QFont>
#include <QString>

class QWidget;

namespace mirel {

// The text with line ends where it is wider than that; a word too long for a line is broken.
QString WrappedText(const QString& text, const QFont& font, int widthPx);

// Breaks the captions of the check boxes and radio buttons in `page` for a line of that width. Their words stay,
// and another width breaks them elsewhere.
void WrapCaptions(QWidget& page, int widthPx);

} // namespace mirel
