#pragma once

#include <QPoint>
#include <QString>
#include <QStringList>

#include <functional>
#include <vector>

class QAbstractItemView;
class QModelIndex;
class QWidget;

namespace mirel {

// Somebody in front of the program's window: taps where something shows, types where the focus is, and waits for
// what comes of it. Looks for things by the words on them, never calls them, and complains about whatever is
// hidden, covered or out of reach.
//
// With MIREL_PICTURES=<folder> in the environment each See() is painted there.
class Person {
public:
    // `name` begins the names of the pictures.
    Person(QWidget& window, QString name);

    // What takes taps and keys now: the open menu, the dialog in front, or the window.
    QWidget* Front() const;
    // The part in front that shows these words, by its class where several do; null, and a complaint, without one.
    QWidget* Find(const QString& words) const;
    template <typename Part>
    Part* FindPart(const QString& name = {}) const
    {
        for (Part* part : Front()->findChildren<Part*>(name)) {
            if (part->isVisible())
                return part;
        }
        return nullptr;
    }

    // --- the pen, a finger or the mouse ---------------------------------------------------------------------

    void Tap(QWidget* part, QPoint at = {}); // a null point: its middle
    void TapTwice(QWidget* part, QPoint at = {});
    // Held still until its menu is there.
    void Hold(QWidget* part, QPoint at = {});
    void RightClick(QWidget* part, QPoint at = {});
    void Tap(const QString& words); // a button, a tick, a tab
    void TapEntry(const QString& words);
    void TapEntryTwice(const QString& words);
    void TapItem(QAbstractItemView& list, const QModelIndex& index);
    // Entries of the menus, from the menu bar on.
    void Choose(const QStringList& path);
    // Of the menu that is open.
    void ChooseHere(const QString& entry);

    // --- texts ----------------------------------------------------------------------------------------------

    void Type(const QString& text); // by the keyboard
    void Key(int key, Qt::KeyboardModifiers modifiers = {});
    void Write(const QString& text); // by the input panel

    // --- what waits -----------------------------------------------------------------------------------------

    using Deal = std::function<void()>;
    // `cause` brings up a dialog, or a menu, that waits; `deal` deals with it, and it is gone afterwards.
    void MeetDialog(const std::function<void()>& cause, const Deal& deal);
    void MeetMenu(const std::function<void()>& cause, const Deal& deal);
    // One after the other.
    void MeetDialogs(const std::function<void()>& cause, const std::vector<Deal>& deals);

    // The station is looked at: all of it within the screen.
    void See(const QString& station);

private:
    void Settle();
    QPoint Reach(QWidget* part, QPoint at); // in its window
    void Meet(bool menu, const std::function<void()>& cause, const std::vector<Deal>& deals);
    QModelIndex EntryOf(const QString& words, QAbstractItemView*& list);

    QWidget& window_;
    QString name_;
    int seen_ = 0;
};

} // namespace mirel
