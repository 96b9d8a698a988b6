#pragma once

#include "app/ui/main_frame.h"

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QApplication>
#include <QMenu>
#include <QMenuBar>
#include <QTest>

#include <gtest/gtest.h>

#include <memory>

namespace mirel {

// What works the window: each with nothing but its own kind of events.
class Hand {
public:
    virtual ~Hand() = default;

    virtual void Press(QWidget& button) = 0;
    virtual void Pick(QAbstractItemView& list, int row) = 0; // selects it
    virtual void Open(QAbstractItemView& list, int row) = 0; // and opens it
    virtual void Choose(CMainFrame& frame, const QString& menu, const QString& entry) = 0;

protected:
    static QString Plain(const QString& text) { return QString(text).remove(u'&').remove(u'…'); }
    static QAction* Find(const QList<QAction*>& actions, const QString& text)
    {
        for (QAction* action : actions) {
            if (action->isVisible() && Plain(action->text()) == text)
                return action;
        }
        ADD_FAILURE() << "no entry " << text.toStdString();
        return nullptr;
    }
};

// A mouse, or a finger: the same places, other events.
class Pointer : public Hand {
public:
    void Press(QWidget& button) override { Tap(button, button.rect().center()); }
    void Pick(QAbstractItemView& list, int row) override { Tap(*list.viewport(), PlaceOf(list, row)); }
    void Open(QAbstractItemView& list, int row) override
    {
        Pick(list, row);
        DoubleTap(*list.viewport(), PlaceOf(list, row));
    }
    void Choose(CMainFrame& frame, const QString& menu, const QString& entry) override
    {
        QAction* top = Find(frame.menuBar()->actions(), menu);
        QAction* chosen = top ? Find(top->menu()->actions(), entry) : nullptr;
        if (!chosen)
            return;
        Tap(*frame.menuBar(), frame.menuBar()->actionGeometry(top).center());
        ASSERT_TRUE(QTest::qWaitFor([top] { return top->menu()->isVisible(); }));
        Tap(*top->menu(), top->menu()->actionGeometry(chosen).center());
    }

protected:
    virtual void Tap(QWidget& widget, QPoint place) = 0;
    virtual void DoubleTap(QWidget& widget, QPoint place) = 0;

private:
    static QPoint PlaceOf(QAbstractItemView& list, int row)
    {
        const QModelIndex index = list.model()->index(row, 0, list.rootIndex());
        list.scrollTo(index);
        return list.visualRect(index).center();
    }
};

class Mouse : public Pointer {
protected:
    void Tap(QWidget& widget, QPoint place) override { QTest::mouseClick(&widget, Qt::LeftButton, {}, place); }
    void DoubleTap(QWidget& widget, QPoint place) override
    {
        QTest::mouseDClick(&widget, Qt::LeftButton, {}, place);
    }
};

// Touch events alone, as a screen sends them; what a widget does not take as a touch the toolkit makes a tap of.
class Finger : public Pointer {
protected:
    void Tap(QWidget& widget, QPoint place) override
    {
        QWidget* window = widget.window();
        const QPoint there = widget.mapTo(window, place);
        const int touch = touch_ + 1; // what the touch opens may be touched before this is over
        QTest::touchEvent(window->windowHandle(), device_.get()).press(++touch_, there);
        if (window->isVisible() && window->windowHandle()) // it may be gone with the press
            QTest::touchEvent(window->windowHandle(), device_.get()).release(touch, there);
    }
    void DoubleTap(QWidget& widget, QPoint place) override
    {
        Tap(widget, place);
        Tap(widget, place);
    }

private:
    // Gone with the hand: where there is a touch screen all that can be tapped is larger.
    const std::unique_ptr<QPointingDevice> device_{QTest::createTouchDevice()};
    int touch_ = 0;
};

// Keys alone: Tab leads to what is pressed, the letters of the menus to their entries.
class Keyboard : public Hand {
public:
    void Press(QWidget& button) override
    {
        GoTo(button);
        QTest::keyClick(&button, Qt::Key_Space);
    }
    void Pick(QAbstractItemView& list, int row) override
    {
        GoTo(list);
        QTest::keyClick(&list, Qt::Key_Home);
        for (int i = 0; i < row; ++i)
            QTest::keyClick(&list, Qt::Key_Down);
    }
    void Open(QAbstractItemView& list, int row) override
    {
        Pick(list, row);
        QTest::keyClick(&list, Qt::Key_Return);
    }
    void Choose(CMainFrame& frame, const QString& menu, const QString& entry) override
    {
        QAction* top = Find(frame.menuBar()->actions(), menu);
        QAction* chosen = top ? Find(top->menu()->actions(), entry) : nullptr;
        if (!chosen)
            return;
        frame.activateWindow(); // as a window manager does when a dialog closes
        ASSERT_TRUE(QTest::qWaitForWindowActive(&frame));
        QTest::keyClick(QApplication::focusWidget() ? QApplication::focusWidget() : &frame, LetterOf(*top),
                        Qt::AltModifier);
        ASSERT_TRUE(QTest::qWaitFor([top] { return top->menu()->isVisible(); })) << menu.toStdString();
        QTest::keyClick(top->menu(), LetterOf(*chosen));
    }

private:
    static char LetterOf(const QAction& action)
    {
        return action.text().section(u'&', 1, 1).left(1).toLower().toLatin1().at(0);
    }
    static void GoTo(QWidget& widget)
    {
        constexpr int kMostTabs = 60;
        widget.window()->activateWindow(); // as a window manager does when a dialog closes
        ASSERT_TRUE(QTest::qWaitForWindowActive(widget.window()));
        for (int i = 0; i < kMostTabs && !widget.hasFocus(); ++i)
            QTest::keyClick(QApplication::focusWidget() ? QApplication::focusWidget() : widget.window(),
                            Qt::Key_Tab);
        EXPECT_TRUE(widget.hasFocus()) << "no Tab leads to " << widget.objectName().toStdString() << " of "
                                       << widget.window()->windowTitle().toStdString();
    }
};

} // namespace mirel
