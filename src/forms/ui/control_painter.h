#pragma once

#include "forms/form_records.h"

#include <QFont>
#include <QHash>
#include <QPalette>
#include <QRect>
#include <QString>

class QPainter;

namespace mirel {

// Draws the controls of a form that is being designed: what they look like and what they will show, without a
// widget for each.
class ControlPainter {
public:
    // The place is in the painter's pixels; texts are drawn at that scale.
    void Paint(QPainter& painter, const ControlDef& control, const QRect& place, qreal scale,
               const QPalette& palette);
    void Forget() { fonts_.clear(); } // the application's font is another one

private:
    struct FontKey {
        TextStyle style;
        int roomPx;
        qreal scale;
        QFont font;
    };
    const QFont& FontFor(const TextStyle& style, qreal scale, int roomPx);
    const QString& TextOf(const ControlDef& control);

    std::vector<FontKey> fonts_;
    QHash<QString, QString> texts_; // by type, name and source
};

} // namespace mirel
