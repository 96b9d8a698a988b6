#include "support/ui/person.h"

#include "support/ui/screen_checks.h"

#include <gtest/gtest.h>

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QAction>
#include <QApplication>
#include <QDir>
#include <QInputMethodEvent>
#include <QMenu>
#include <QMenuBar>
#include <QPainter>
#include <QPointer>
#include <QProgressDialog>
#include <QTabBar>
#include <QTest>
#include <QTimer>
#include <QToolButton>
#include <QWindow>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kMomentMs = 15; // what follows by a timer
constexpr int kLongestWaitMs = 5000;
constexpr int kLongHoldMs = 1500;

QString Plain(QString text)
{
    return text.remove(u'&').remove(u"..."_s).remove(u'…').trimmed();
}

QModelIndex Search(const QAbstractItemModel& model, const QModelIndex& parent, const QString& words)
{
    for (int row = 0; row < model.rowCount(parent); ++row) {
        const QModelIndex index = model.index(row, 0, parent);
        if (!parent.isValid() && model.hasChildren(index)) { // headings are no entries
            if (const QModelIndex below = Search(model, index, words); below.isValid())
                return below;
        } else if (index.data().toString() == words) {
            return index;
        }
    }
    return {};
}

} // namespace

Person::Person(QWidget& window, QString name)
    : window_(window)
    , name_(std::move(name))
{
}

QWidget* Person::Front() const
{
    if (QWidget* popup = QApplication::activePopupWidget())
        return popup;
    if (QWidget* modal = QApplication::activeModalWidget())
        return modal;
    QWidget* active = QApplication::activeWindow();
    return active && active->isVisible() ? active : &window_;
}

void Person::Settle()
{
    QTest::qWait(kMomentMs);
    QWidget* front = Front();
    if (QApplication::activePopupWidget() || (front->isActiveWindow() && QGuiApplication::focusWindow()))
        return;
    front->activateWindow(); // what a window manager does
    (void)QTest::qWaitForWindowActive(front, kLongestWaitMs);
}

// --- finding ------------------------------------------------------------------------------------------------

QWidget* Person::Find(const QString& words) const
{
    for (QAbstractButton* button : Front()->findChildren<QAbstractButton*>()) {
        if (button->isVisible() && (Plain(button->text()) == words || button->accessibleName() == words))
            return button;
    }
    ADD_FAILURE() << "nothing says \"" << words.toStdString() << "\"";
    return nullptr;
}

QPoint Person::Reach(QWidget* part, QPoint at)
{
    EXPECT_TRUE(part->isVisible()) << part->metaObject()->className() << " is hidden";
    EXPECT_TRUE(part->isEnabled()) << part->metaObject()->className() << " cannot be used";
    QWidget* window = part->window();
    EXPECT_EQ(window, Front()) << part->metaObject()->className() << " is behind something";
    const QPoint place = part->mapTo(window, at.isNull() ? part->rect().center() : at);
    EXPECT_TRUE(window->rect().contains(place)) << part->metaObject()->className() << " is out of the window";
    const QWidget* hit = window->childAt(place);
    EXPECT_TRUE(part == window || hit == part || part->isAncestorOf(hit))
        << part->metaObject()->className() << " is covered by "
        << (hit ? hit->metaObject()->className() : "nothing");
    return place;
}

QModelIndex Person::EntryOf(const QString& words, QAbstractItemView*& list)
{
    for (QAbstractItemView* each : Front()->findChildren<QAbstractItemView*>()) {
        const QModelIndex found =
            each->isVisible() && each->model() ? Search(*each->model(), each->rootIndex(), words) : QModelIndex();
        if (found.isValid()) {
            list = each;
            return found;
        }
    }
    ADD_FAILURE() << "no entry says \"" << words.toStdString() << "\"";
    return {};
}

// --- tapping ------------------------------------------------------------------------------------------------

void Person::Tap(QWidget* part, QPoint at)
{
    ASSERT_TRUE(part);
    const QPoint place = Reach(part, at);
    QWindow* window = part->window()->windowHandle();
    QTest::mouseMove(window, place);
    QTest::mouseClick(window, Qt::LeftButton, {}, place);
    Settle();
}

void Person::TapTwice(QWidget* part, QPoint at)
{
    ASSERT_TRUE(part);
    const QPoint place = Reach(part, at);
    QTest::mouseDClick(part->window()->windowHandle(), Qt::LeftButton, {}, place);
    Settle();
}

void Person::Hold(QWidget* part, QPoint at)
{
    ASSERT_TRUE(part);
    const QPoint place = Reach(part, at);
    QWindow* window = part->window()->windowHandle();
    QTest::mousePress(window, Qt::LeftButton, {}, place);
    QTest::qWait(kLongHoldMs);
    QTest::mouseRelease(window, Qt::LeftButton, {}, place);
    Settle();
}

void Person::RightClick(QWidget* part, QPoint at)
{
    ASSERT_TRUE(part);
    const QPoint place = Reach(part, at);
    QTest::mouseClick(part->window()->windowHandle(), Qt::RightButton, {}, place);
    Settle();
}

void Person::Tap(const QString& words)
{
    for (QTabBar* bar : Front()->findChildren<QTabBar*>()) {
        for (int tab = 0; bar->isVisible() && tab < bar->count(); ++tab) {
            if (Plain(bar->tabText(tab)) == words)
                return Tap(bar, bar->tabRect(tab).center());
        }
    }
    Tap(Find(words));
}

void Person::TapItem(QAbstractItemView& list, const QModelIndex& index)
{
    Tap(list.viewport(), list.visualRect(index).center());
}

void Person::TapEntry(const QString& words)
{
    QAbstractItemView* list = nullptr;
    const QModelIndex index = EntryOf(words, list);
    ASSERT_TRUE(list);
    TapItem(*list, index);
}

void Person::TapEntryTwice(const QString& words)
{
    QAbstractItemView* list = nullptr;
    const QModelIndex index = EntryOf(words, list);
    ASSERT_TRUE(list);
    TapTwice(list->viewport(), list->visualRect(index).center());
}

void Person::Choose(const QStringList& path)
{
    for (const QMenuBar* bar : Front()->findChildren<QMenuBar*>()) {
        for (QAction* action : bar->actions()) {
            if (!bar->isVisible() || Plain(action->text()) != path.first())
                continue;
            const QRect place = bar->actionGeometry(action);
            EXPECT_TRUE(bar->rect().contains(place)) << "the menu bar cuts " << path.first().toStdString();
            Tap(const_cast<QMenuBar*>(bar), place.center());
            for (qsizetype step = 1; step < path.size(); ++step)
                ChooseHere(path[step]);
            return;
        }
    }
    ADD_FAILURE() << "no menu is called " << path.first().toStdString();
}

void Person::ChooseHere(const QString& entry)
{
    auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
    ASSERT_TRUE(menu) << "no menu is open for " << entry.toStdString();
    for (QAction* action : menu->actions()) {
        if (Plain(action->text()) != entry)
            continue;
        ASSERT_TRUE(action->isEnabled()) << entry.toStdString() << " cannot be chosen";
        return Tap(menu, menu->actionGeometry(action).center());
    }
    ADD_FAILURE() << "the menu has no " << entry.toStdString();
}

// --- texts --------------------------------------------------------------------------------------------------

void Person::Type(const QString& text)
{
    for (const QChar letter : text) {
        QWindow* window = QGuiApplication::focusWindow();
        ASSERT_TRUE(window);
        QTest::keyClick(window, letter.toLatin1());
    }
    Settle();
}

void Person::Key(int key, Qt::KeyboardModifiers modifiers)
{
    QWidget* popup = QApplication::activePopupWidget();
    QWindow* window = popup ? popup->windowHandle() : QGuiApplication::focusWindow();
    ASSERT_TRUE(window);
    QTest::keyClick(window, Qt::Key(key), modifiers);
    Settle();
}

void Person::Write(const QString& text)
{
    QObject* focus = QGuiApplication::focusObject();
    ASSERT_TRUE(focus);
    const QVariant takes = QInputMethod::queryFocusObject(Qt::ImEnabled, {});
    EXPECT_TRUE(takes.toBool()) << "the input panel has nothing to write to";
    for (const QChar letter : text) {
        QInputMethodEvent event;
        event.setCommitString(letter);
        QCoreApplication::sendEvent(QGuiApplication::focusObject(), &event);
    }
    Settle();
}

// --- what waits ---------------------------------------------------------------------------------------------

void Person::Meet(bool menu, const std::function<void()>& cause, const std::vector<Deal>& deals)
{
    const auto waiting = [menu]() -> QWidget* {
        QWidget* popup = QApplication::activePopupWidget();
        if (menu)
            return popup;
        QWidget* modal = popup ? nullptr : QApplication::activeModalWidget();
        return qobject_cast<QProgressDialog*>(modal) ? nullptr : modal; // it goes by itself
    };
    const QPointer<QWidget> before = waiting();
    QPointer<QWidget> last;
    size_t met = 0;
    bool busy = false;
    QTimer look;
    QObject::connect(&look, &QTimer::timeout, &look, [&] {
        QWidget* now = waiting();
        if (busy || met == deals.size() || !now || now == before || now == last || !now->isVisible())
            return;
        busy = true;
        last = now;
        Settle();
        deals[met]();
        ++met;
        busy = false;
        if (last && last->isVisible() && waiting() == last) {
            ADD_FAILURE() << last->windowTitle().toStdString() << " is still open";
            last->close();
        }
    });
    look.start(1);
    cause();
    EXPECT_TRUE(QTest::qWaitFor([&] { return met == deals.size(); }, kLongestWaitMs)) << "nothing came up";
    look.stop();
    Settle();
}

void Person::MeetDialog(const std::function<void()>& cause, const Deal& deal)
{
    Meet(false, cause, {deal});
}

void Person::MeetDialogs(const std::function<void()>& cause, const std::vector<Deal>& deals)
{
    Meet(false, cause, deals);
}

void Person::MeetMenu(const std::function<void()>& cause, const Deal& deal)
{
    Meet(true, cause, {deal});
}

// --- seeing -------------------------------------------------------------------------------------------------

void Person::See(const QString& station)
{
    Settle();
    const QString name = u"%1-%2-%3"_s.arg(name_).arg(++seen_, 2, 10, QChar(u'0')).arg(station);
    if (!qobject_cast<QMenu*>(Front()))
        ExpectFits(*Front(), name, window_.size());
    else
        EXPECT_LE(Front()->width(), window_.width()) << name.toStdString();
    const QString folder = qEnvironmentVariable("MIREL_PICTURES");
    if (folder.isEmpty())
        return;
    QPixmap screen = window_.grab();
    QPainter painter(&screen);
    const auto paint = [&](QWidget& other) {
        painter.drawPixmap(other.mapToGlobal(QPoint()) - window_.mapToGlobal(QPoint()), other.grab());
    };
    for (QWidget* other : QApplication::topLevelWidgets()) {
        if (other != &window_ && other != Front() && other->isVisible() && other->windowType() != Qt::ToolTip)
            paint(*other);
    }
    if (Front() != &window_)
        paint(*Front());
    painter.end();
    EXPECT_TRUE(screen.save(QDir(folder).filePath(name + u".png"_s)));
}

} // namespace mirel
