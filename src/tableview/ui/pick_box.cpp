#include "tableview/ui/pick_box.h"

#include <QKeyEvent>
#include <QWheelEvent>

namespace mirel {

void PickBox::keyPressEvent(QKeyEvent* event)
{
    const bool choosesThere = event->key() == Qt::Key_Up || event->key() == Qt::Key_Down ||
                              event->key() == Qt::Key_PageUp || event->key() == Qt::Key_PageDown ||
                              event->key() == Qt::Key_Home || event->key() == Qt::Key_End ||
                              event->key() == Qt::Key_Space || !event->text().trimmed().isEmpty();
    const bool isDialogs = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter ||
                           event->key() == Qt::Key_Escape || event->key() == Qt::Key_Tab;
    if (!choosesThere || isDialogs || (event->modifiers() & (Qt::ControlModifier | Qt::MetaModifier))) {
        event->ignore();
        return;
    }
    showPopup();
    event->accept();
}

void PickBox::wheelEvent(QWheelEvent* event)
{
    event->ignore();
}

} // namespace mirel
